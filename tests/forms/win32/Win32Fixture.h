#pragma once

#include "forms/win32/Win32Driver.h"

#include <gtest/gtest.h>

namespace quendra::forms::win32 {

inline constexpr int kPixel = 15;

/// A form of 400 by 300 pixels, at 96 DPI 15 twips each, whose handlers are told by the test.
struct TestForm : Form {
  TestForm() : Form(u"frmTest") {}
  void Design() override {
    Move(0, 0, 6000, 4500);
    if (design) design();
  }
  void Form_Unload() override {
    if (unload) unload();
  }
  void Form_KeyDown(int keyCode, int shift) override { keys.push_back({keyCode, shift}); }

  std::function<void()> design;
  std::function<void()> unload;
  std::vector<std::pair<int, int>> keys;
};

/// A desktop on the screen of the bed, and a form for it.
class Win32Fixture : public testing::Test {
 protected:
  static FormWindow& WindowOf(const Form& form) { return *Win32Driver::WindowOf(form); }
  static WindowView& ViewOf(const Control& control) { return dynamic_cast<WindowView&>(*control.View()); }
  static Text TextOf(HWND window) {
    wchar_t text[256] = {};
    const int length = ::GetWindowTextW(window, text, 256);
    return winapi::TextOf(text, static_cast<std::size_t>(length));
  }
  /// What the screen shows of a control, left and top in its own pixels.
  static COLORREF PixelOf(const Control& control, int left, int top) {
    const HDC device = ::GetDC(ViewOf(control).Window());
    const COLORREF colour = ::GetPixel(device, left, top);
    ::ReleaseDC(ViewOf(control).Window(), device);
    return colour;
  }
  static void SendMouse(const Control& control, UINT message, Spot place, WPARAM held = 0) {
    ::SendMessageW(ViewOf(control).Window(), message, held, MAKELPARAM(place.left, place.top));
  }
  static void MoveMouse(const Control& control, Spot place, WPARAM held = 0) {
    SendMouse(control, WM_MOUSEMOVE, place, held);
  }
  void ShowActive() {
    desktop.Show(form);
    ASSERT_TRUE(user.WaitUntil([&] { return ::GetForegroundWindow() == WindowOf(form).Top(); }));
  }

  Win32Driver user;
  Win32Desktop& desktop = user.Win32();
  TestForm form;
};

} // namespace quendra::forms::win32
