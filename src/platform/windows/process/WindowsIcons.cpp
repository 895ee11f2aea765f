#include "platform/windows/process/WindowsIcons.h"

#include "platform/windows/process/IconBitmapsOf.h"
#include "platform/windows/process/SystemHandle.h"

#include <shellapi.h>

namespace quendra::platform::windows {

namespace {

HICON IconOf(Handle handle) { return static_cast<HICON>(ToSystem(handle)); }

} // namespace

WindowsIcons::~WindowsIcons() {
  for (const auto& [icon, image] : images_) ::DestroyIcon(IconOf(icon));
}

Handle WindowsIcons::ExtractIconExA(const std::string& path, int index) {
  const Text file = FromCodePage(path);
  const auto extract = shell32_.Find<decltype(::ExtractIconExW)>("ExtractIconExW");
  HICON large = nullptr;
  if (!extract || file.empty() || extract(winapi::Wide(file), index, &large, nullptr, 1) == 0)
    return kNoHandle;
  if (large) images_[FromSystem(large)];
  return FromSystem(large);
}

const std::vector<std::uint8_t>& WindowsIcons::ImageOf(Handle icon) {
  static const std::vector<std::uint8_t> kNone;
  const auto found = images_.find(icon);
  if (found == images_.end()) return kNone;
  if (found->second.empty()) found->second = PngOf(IconBitmapsOf(IconOf(icon)));
  return found->second;
}

bool WindowsIcons::DestroyIcon(Handle icon) {
  return images_.erase(icon) != 0 && ::DestroyIcon(IconOf(icon)) != FALSE;
}

} // namespace quendra::platform::windows
