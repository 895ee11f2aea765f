#include "platform/windows/process/IconBitmapsOf.h"

#include <memory>
#include <type_traits>

namespace quendra::platform::windows {

namespace {

struct DeleteBitmap {
  void operator()(HBITMAP bitmap) const { ::DeleteObject(bitmap); }
};
using Bitmap = std::unique_ptr<std::remove_pointer_t<HBITMAP>, DeleteBitmap>;

/// No icon that a window shows is larger.
constexpr LONG kLargestSide = 1024;

struct Size {
  LONG width = 0;
  LONG height = 0;
};

Size SizeOf(const Bitmap& bitmap) {
  BITMAP told{};
  const bool known = bitmap && ::GetObjectW(bitmap.get(), sizeof told, &told) != 0;
  const bool fits = known && told.bmWidth > 0 && told.bmHeight > 0 && told.bmWidth <= kLargestSide &&
                    told.bmHeight <= 2 * kLargestSide;
  return fits ? Size{told.bmWidth, told.bmHeight} : Size();
}

/// 32 bits a pixel, top row first, whatever the bitmap has.
std::vector<std::uint32_t> PixelsOf(const Bitmap& bitmap, Size size) {
  BITMAPINFO wanted{};
  wanted.bmiHeader.biSize = sizeof wanted.bmiHeader;
  wanted.bmiHeader.biWidth = size.width;
  wanted.bmiHeader.biHeight = -size.height;
  wanted.bmiHeader.biPlanes = 1;
  wanted.bmiHeader.biBitCount = 32;
  wanted.bmiHeader.biCompression = BI_RGB;
  std::vector<std::uint32_t> pixels(static_cast<std::size_t>(size.width * size.height));
  const HDC screen = ::GetDC(nullptr);
  const int rows = ::GetDIBits(screen, bitmap.get(), 0, static_cast<UINT>(size.height), pixels.data(),
                               &wanted, DIB_RGB_COLORS);
  ::ReleaseDC(nullptr, screen);
  if (rows != size.height) pixels.clear();
  return pixels;
}

/// An icon of two colours keeps them below its mask, in the same bitmap.
IconBitmaps OfTwoColours(const Bitmap& both) {
  const Size size = SizeOf(both);
  const std::vector<std::uint32_t> pixels = PixelsOf(both, size);
  const auto middle = pixels.begin() + static_cast<std::ptrdiff_t>(pixels.size() / 2);
  return {static_cast<std::size_t>(size.width), {middle, pixels.end()}, {pixels.begin(), middle}};
}

} // namespace

IconBitmaps IconBitmapsOf(HICON icon) {
  ICONINFO info{};
  if (!::GetIconInfo(icon, &info)) return {};
  const Bitmap mask(info.hbmMask);
  const Bitmap colours(info.hbmColor);
  if (!colours) return OfTwoColours(mask);
  const Size size = SizeOf(colours);
  return {static_cast<std::size_t>(size.width), PixelsOf(colours, size), PixelsOf(mask, size)};
}

} // namespace quendra::platform::windows
