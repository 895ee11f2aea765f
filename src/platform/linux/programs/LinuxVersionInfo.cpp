#include "platform/linux/programs/LinuxVersionInfo.h"

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

// A block is this mark and then pairs of texts, each ended by a NUL: a name and its value.
constexpr std::string_view kMark("desktop entry\0", 14);
constexpr std::string_view kStrings = "\\StringFileInfo\\040D04E7\\";

std::string_view NextText(std::string_view& rest) {
  const std::size_t end = std::min(rest.find('\0'), rest.size());
  const std::string_view text = rest.substr(0, end);
  rest.remove_prefix(std::min(end + 1, rest.size()));
  return text;
}

bool SameName(std::string_view left, std::string_view right) {
  return SameIgnoringCase(FromUtf8(left), FromUtf8(right));
}

void AddPair(std::string& block, std::string_view name, const Text& value) {
  if (value.empty()) return;
  block.append(name).push_back('\0');
  block.append(ToCodePage(value)).push_back('\0');
}

} // namespace

std::string LinuxVersionInfo::BlockOf(const std::string& path) {
  const DesktopEntry* entry = path.empty() ? nullptr : index_.EntryFor(paths_.ToRaw(path));
  if (entry == nullptr) return {};
  std::string block(kMark);
  AddPair(block, "ProductName", entry->name);
  AddPair(block, "FileDescription", entry->comment);
  return block;
}

std::uint32_t LinuxVersionInfo::GetFileVersionInfoSizeA(const std::string& path) {
  return static_cast<std::uint32_t>(BlockOf(path).size());
}

bool LinuxVersionInfo::GetFileVersionInfoA(const std::string& path, std::span<std::uint8_t> buffer) {
  const std::string block = BlockOf(path);
  if (block.empty() || buffer.size() < block.size()) return false;
  const auto end = std::copy(block.begin(), block.end(), buffer.begin());
  std::fill(end, buffer.end(), std::uint8_t{0});
  return true;
}

std::optional<std::vector<std::uint8_t>> LinuxVersionInfo::VerQueryValueA(std::span<const std::uint8_t> block,
                                                                          const std::string& subBlock) {
  std::string_view rest(reinterpret_cast<const char*>(block.data()), block.size());
  if (!rest.starts_with(kMark)) return {};
  rest.remove_prefix(kMark.size());
  const std::string_view query = CutAtNul(std::string_view(subBlock));
  // Hebrew and code page 1255, each a 16-bit number with the low byte first.
  if (SameName(query, kTranslation)) return std::vector<std::uint8_t>{0x0D, 0x04, 0xE7, 0x04};
  if (!SameName(query.substr(0, kStrings.size()), kStrings)) return {};
  const std::string_view name = query.substr(kStrings.size());
  while (!rest.empty()) {
    const std::string_view key = NextText(rest);
    const std::string_view value = NextText(rest);
    if (key.empty() || !SameName(name, key)) continue;
    std::vector<std::uint8_t> bytes(value.begin(), value.end());
    bytes.push_back(0);
    return bytes;
  }
  return {};
}

} // namespace quendra::platform::linux_
