#include "platform/linux/programs/KeyFile.h"

namespace quendra::platform::linux_ {

namespace {

std::string_view WithoutBlanks(std::string_view text) {
  const std::size_t first = text.find_first_not_of(" \t\r");
  if (first == std::string_view::npos) return {};
  return text.substr(first, text.find_last_not_of(" \t\r") - first + 1);
}

} // namespace

KeyFile ParseKeyFile(std::string_view text) {
  KeyFile file;
  auto* group = &file[""];
  while (!text.empty()) {
    const std::size_t end = std::min(text.find('\n'), text.size());
    const std::string_view line = WithoutBlanks(text.substr(0, end));
    text.remove_prefix(std::min(end + 1, text.size()));
    if (line.empty() || line[0] == '#') continue;
    if (line[0] == '[' && line.ends_with(']')) {
      group = &file[std::string(line.substr(1, line.size() - 2))];
    } else if (const std::size_t equals = line.find('='); equals != std::string_view::npos) {
      group->emplace(WithoutBlanks(line.substr(0, equals)), WithoutBlanks(line.substr(equals + 1)));
    }
  }
  return file;
}

std::string ValueIn(const KeyFile& file, std::string_view group, std::string_view key) {
  const auto keys = file.find(group);
  if (keys == file.end()) return {};
  const auto value = keys->second.find(key);
  return value == keys->second.end() ? std::string() : value->second;
}

std::string Unescaped(std::string_view value) {
  constexpr std::string_view kNames = "sntr\\";
  constexpr std::string_view kCharacters = " \n\t\r\\";
  std::string text;
  for (std::size_t i = 0; i < value.size(); ++i) {
    const std::size_t known =
        value[i] == '\\' && i + 1 < value.size() ? kNames.find(value[i + 1]) : std::string_view::npos;
    text.push_back(known == std::string_view::npos ? value[i] : kCharacters[known]);
    if (known != std::string_view::npos) ++i;
  }
  return text;
}

} // namespace quendra::platform::linux_
