#include "platform/windows/capture/WindowsCapture.h"

#include "platform/windows/capture/WindowsCaptureAdapters.h"

namespace quendra::platform::windows {

WindowsCapture::WindowsCapture(EventLoop& loop, const IpHelperLibrary& ipHelper, WpcapLibrary library)
    : LiveCapture(loop, std::make_unique<WindowsCaptureAdapters>(loop, std::move(library), ipHelper)) {}

} // namespace quendra::platform::windows
