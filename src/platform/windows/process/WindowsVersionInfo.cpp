#include "platform/windows/process/WindowsVersionInfo.h"

#include "platform/process/VersionBlock.h"

#include <winver.h>

namespace quendra::platform::windows {

std::uint32_t WindowsVersionInfo::GetFileVersionInfoSizeA(const std::string& path) {
  const Text file = FromCodePage(path);
  const auto getSize = version_.Find<decltype(::GetFileVersionInfoSizeW)>("GetFileVersionInfoSizeW");
  DWORD unused = 0;
  return getSize && !file.empty() ? getSize(winapi::Wide(file), &unused) : 0;
}

bool WindowsVersionInfo::GetFileVersionInfoA(const std::string& path, std::span<std::uint8_t> buffer) {
  const Text file = FromCodePage(path);
  const auto getInfo = version_.Find<decltype(::GetFileVersionInfoW)>("GetFileVersionInfoW");
  return getInfo && !file.empty() &&
         getInfo(winapi::Wide(file), 0, static_cast<DWORD>(buffer.size()), buffer.data()) != FALSE;
}

std::optional<std::vector<std::uint8_t>>
WindowsVersionInfo::VerQueryValueA(std::span<const std::uint8_t> block, const std::string& subBlock) {
  return ValueOfVersionBlock(block, FromCodePage(CutAtNul(std::string_view(subBlock))));
}

} // namespace quendra::platform::windows
