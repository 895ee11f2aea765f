#include "platform/registry/RegistryPath.h"

#include "runtime/Text.h"

#include <algorithm>

namespace quendra::platform {

namespace {

/// What the system takes.
constexpr std::size_t kLongestKeyName = 255;
constexpr std::size_t kLongestValueName = 16383;
constexpr std::size_t kDeepestPath = 512;

} // namespace

bool IsRegistryRoot(RegistryKey key) { return key >= kClassesRoot && key <= kDynData; }

std::uint32_t NamesOfRegistryPath(const std::string& path, std::vector<std::string>& names) {
  std::string_view rest = CutAtNul(std::string_view(path));
  if (rest.empty()) return kRegistrySuccess;
  while (true) {
    const std::size_t end = std::min(rest.find('\\'), rest.size());
    if (end == 0) return kBadKeyPath;
    if (end > kLongestKeyName || names.size() == kDeepestPath) return kRegistryInvalidParameter;
    names.emplace_back(rest.substr(0, end));
    if (end == rest.size()) return kRegistrySuccess;
    rest.remove_prefix(end + 1);
  }
}

std::uint32_t NameOfRegistryValue(const std::string& given, std::string& name) {
  name = CutAtNul(std::string_view(given));
  return name.size() > kLongestValueName ? kRegistryInvalidParameter : kRegistrySuccess;
}

} // namespace quendra::platform
