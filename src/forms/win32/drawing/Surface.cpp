#include "forms/win32/drawing/Surface.h"

#include "runtime/Fault.h"

#include <algorithm>

namespace quendra::forms::win32 {

namespace {

BITMAPINFO FormatOf(Extent extent) {
  BITMAPINFO info{};
  info.bmiHeader.biSize = sizeof info.bmiHeader;
  info.bmiHeader.biWidth = extent.width;
  info.bmiHeader.biHeight = -extent.height; // rows from the top
  info.bmiHeader.biPlanes = 1;
  info.bmiHeader.biBitCount = 32;
  info.bmiHeader.biCompression = BI_RGB;
  return info;
}

} // namespace

Surface::Surface(Extent extent)
    : extent_{std::max(1, extent.width), std::max(1, extent.height)}, dc_(::CreateCompatibleDC(nullptr)) {
  const BITMAPINFO format = FormatOf(extent_);
  void* pixels = nullptr;
  bitmap_ = ::CreateDIBSection(dc_, &format, DIB_RGB_COLORS, &pixels, nullptr, 0);
  if (!bitmap_) {
    if (dc_) ::DeleteDC(dc_);
    throw Fault(Fault::kOutOfMemory);
  }
  pixels_ = static_cast<std::uint32_t*>(pixels);
  before_ = ::SelectObject(dc_, bitmap_);
  ::SetBkMode(dc_, TRANSPARENT);
}

Surface::~Surface() {
  ::SelectObject(dc_, before_);
  ::DeleteObject(bitmap_);
  ::DeleteDC(dc_);
}

std::span<std::uint32_t> Surface::Pixels() {
  ::GdiFlush();
  return {pixels_, static_cast<std::size_t>(extent_.width) * static_cast<std::size_t>(extent_.height)};
}

void Surface::ShowOn(HDC device, Area part) const {
  const auto [left, top] = part.corner;
  ::BitBlt(device, left, top, part.extent.width, part.extent.height, dc_, left, top, SRCCOPY);
}

} // namespace quendra::forms::win32
