#include "forms/win32/views/ViewFixture.h"

namespace quendra::forms::win32 {

void ViewFixture::Show() {
  ShowActive();
  Settle();
}

void ViewFixture::Settle() {
  bool through = false;
  user.Loop().Post([&] { through = true; });
  ASSERT_TRUE(user.WaitUntil([&] { return through; }));
}

void ViewFixture::Press(HWND window, Spot place, UINT message, WPARAM keys) {
  ::SendMessageW(window, message, keys, MAKELPARAM(place.left, place.top));
}

void ViewFixture::Click(HWND window, Spot place) {
  Press(window, place);
  Press(window, place, WM_LBUTTONUP, 0);
}

Colour ViewFixture::PixelIn(HWND window, int x, int y) {
  ::RedrawWindow(window, nullptr, nullptr, RDW_INVALIDATE | RDW_UPDATENOW | RDW_ALLCHILDREN);
  const HDC device = ::GetWindowDC(window);
  ::SetLayout(device, 0);
  const Colour pixel = ::GetPixel(device, x, y);
  ::ReleaseDC(window, device);
  return pixel;
}

} // namespace quendra::forms::win32
