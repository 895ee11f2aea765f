#include "platform/linux/files/DrivePath.h"

#include "runtime/Text.h"

namespace quendra::platform::linux_ {

namespace {

constexpr std::string_view kDrive = "C:\\";

bool IsPlainName(std::string_view name) {
  return !name.empty() && name != "." && name != ".." && name.find_first_of("/:") == std::string_view::npos;
}

} // namespace

std::optional<DrivePath> ParseDrivePath(const std::string& systemPath) {
  std::string_view rest = CutAtNul(systemPath);
  if (!rest.starts_with(kDrive)) return {};
  rest.remove_prefix(kDrive.size());

  DrivePath path;
  while (true) {
    const std::size_t end = rest.find('\\');
    const std::string_view name = rest.substr(0, end);
    if (!IsPlainName(name)) return {};
    path.name = ToUtf8(FromCodePage(name));
    if (end == std::string_view::npos) return path;
    path.folders.push_back(std::move(path.name));
    rest.remove_prefix(end + 1);
  }
}

} // namespace quendra::platform::linux_
