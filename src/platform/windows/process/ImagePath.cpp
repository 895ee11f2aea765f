#include "platform/windows/process/ImagePath.h"

#include <vector>

namespace quendra::platform::windows {

namespace {

/// Longer than any path of the system's.
constexpr DWORD kImagePathRoom = 32'768;

} // namespace

Text ImagePath::Of(Handle process) {
  const auto query = Query();
  if (!query) return {};
  std::vector<wchar_t> found(kImagePathRoom);
  DWORD length = kImagePathRoom;
  if (!query(ToSystem(process), 0, found.data(), &length)) return {};
  const Text path = winapi::TextOf(found.data(), length);
  return IsRedirected() ? PastRedirection(path, winapi::SystemFolder()) : path;
}

bool ImagePath::IsRedirected() {
  const auto ask = kernel32_.Find<decltype(::IsWow64Process)>("IsWow64Process");
  BOOL isRedirected = FALSE;
  return ask && ask(::GetCurrentProcess(), &isRedirected) && isRedirected;
}

Text PastRedirection(const Text& path, const Text& systemFolder) {
  const Text inside = systemFolder + u"\\";
  const TextView start = TextView(path).substr(0, inside.size());
  if (systemFolder.empty() || !SameIgnoringCase(start, inside)) return path;
  return systemFolder.substr(0, systemFolder.rfind(u'\\')) + u"\\Sysnative" +
         path.substr(systemFolder.size());
}

Text WithoutKernelsNames(const Text& path, const Text& systemFolder) {
  constexpr TextView kWindows = u"\\SystemRoot\\";
  constexpr TextView kDevices = u"\\??\\";
  const bool isOnDrive = path.starts_with(kDevices) && path.find(u":\\") == kDevices.size() + 1;
  if (isOnDrive) return path.substr(kDevices.size());
  if (systemFolder.empty() || !SameIgnoringCase(TextView(path).substr(0, kWindows.size()), kWindows))
    return path;
  return systemFolder.substr(0, systemFolder.rfind(u'\\') + 1) + path.substr(kWindows.size());
}

} // namespace quendra::platform::windows
