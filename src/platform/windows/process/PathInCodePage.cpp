#include "platform/windows/process/PathInCodePage.h"

#include "winapi/Winapi.h"

#include <array>

namespace quendra::platform::windows {

namespace {

Text ShortPath(const Text& path) {
  std::array<wchar_t, MAX_PATH> found{};
  const DWORD length = ::GetShortPathNameW(winapi::Wide(path), found.data(), MAX_PATH);
  return length < MAX_PATH ? winapi::TextOf(found.data(), length) : Text();
}

} // namespace

std::string PathInCodePage(const Text& path) {
  const std::string bytes = ToCodePage(path);
  if (FromCodePage(bytes) == path) return bytes;
  const Text shortPath = ShortPath(path);
  const std::string shortBytes = ToCodePage(shortPath);
  return !shortPath.empty() && FromCodePage(shortBytes) == shortPath ? shortBytes : bytes;
}

} // namespace quendra::platform::windows
