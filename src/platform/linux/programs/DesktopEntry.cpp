#include "platform/linux/programs/DesktopEntry.h"

#include "platform/linux/programs/KeyFile.h"
#include "platform/linux/system/SystemNames.h"

#include <array>

namespace quendra::platform::linux_ {

namespace {

constexpr std::string_view kGroup = "Desktop Entry";

// Programs that only start another, which the entry names after them. Such an entry says nothing about the
// starter itself.
constexpr std::array<std::string_view, 20> kStarters = {
    "sh",   "bash", "dash",        "zsh",    "flatpak",
    "snap", "perl", "ruby",        "java",   "node",
    "gjs",  "wine", "sudo",        "pkexec", "gksu",
    "php",  "mono", "systemd-run", "xterm",  "x-terminal-emulator"};

bool IsStarter(std::string_view program) {
  program = program.substr(program.rfind('/') + 1);
  if (program.starts_with("python")) return true;
  for (const auto starter : kStarters)
    if (program == starter) return true;
  return false;
}

std::string Value(const KeyFile& file, std::string_view key) { return Unescaped(ValueIn(file, kGroup, key)); }

/// The program is shown in Hebrew, whatever the session's language.
Text Localised(const KeyFile& file, const std::string& key) {
  for (const char* locale : {"[he]", "[he_IL]", "[iw]", ""}) {
    Text text = ReadableText(Value(file, key + locale));
    if (!text.empty()) return text;
  }
  return {};
}

bool IsFieldCode(const std::string& word) { return word.size() == 2 && word[0] == '%'; }

/// Passes over "env" with its assignments and options.
std::size_t ProgramIndex(const std::vector<std::string>& words) {
  std::size_t index = 0;
  if (words.empty() || (words[0] != "env" && words[0] != "/usr/bin/env")) return index;
  for (++index; index < words.size(); ++index)
    if (words[index][0] != '-' && words[index].find('=') == std::string::npos) break;
  return index;
}

bool ReadCommand(const std::string& exec, DesktopEntry& entry) {
  const auto words = ExecWords(exec);
  const std::size_t index = ProgramIndex(words);
  if (index >= words.size()) return false;
  entry.program = words[index];
  for (std::size_t i = index + 1; i < words.size(); ++i)
    if (!IsFieldCode(words[i])) entry.hasArguments = true;
  return !(entry.hasArguments && IsStarter(entry.program));
}

} // namespace

std::vector<std::string> ExecWords(std::string_view exec) {
  std::vector<std::string> words;
  std::string word;
  bool quoted = false;
  const auto end = [&] {
    if (!word.empty()) words.push_back(std::move(word));
    word.clear();
  };
  for (std::size_t i = 0; i < exec.size(); ++i) {
    if (exec[i] == '"')
      quoted = !quoted;
    else if (exec[i] == '\\' && quoted && i + 1 < exec.size())
      word.push_back(exec[++i]);
    else if ((exec[i] == ' ' || exec[i] == '\t' || exec[i] == '\n') && !quoted)
      end();
    else if (exec[i] != '\0')
      word.push_back(exec[i]);
  }
  end();
  return words;
}

std::optional<DesktopEntry> ParseDesktopEntry(std::string_view text) {
  const KeyFile file = ParseKeyFile(text);
  if (ValueIn(file, kGroup, "Type") != "Application" || ValueIn(file, kGroup, "Hidden") == "true") return {};
  DesktopEntry entry;
  entry.name = Localised(file, "Name");
  if (entry.name.empty() || !ReadCommand(Value(file, "Exec"), entry)) return {};
  entry.comment = Localised(file, "Comment");
  entry.icon = Value(file, "Icon");
  entry.requiredProgram = Value(file, "TryExec");
  entry.isShown = ValueIn(file, kGroup, "NoDisplay") != "true";
  return entry;
}

} // namespace quendra::platform::linux_
