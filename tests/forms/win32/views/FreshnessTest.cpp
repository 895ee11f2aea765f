#include "forms/view/Palette.h"
#include "forms/win32/views/ViewFixture.h"

// What changes is drawn anew, and nothing else: after each change the window must show what it would show if
// all of it were drawn anew.

namespace quendra::forms::win32 {

class Freshness : public ViewFixture {
 protected:
  Freshness() {
    form.design = [this] {
      ground.Move(0, 0, 6000, 4500);
      ground.Contents = Picture::Of(Stripes());
      frame.Move(300, 300, 4500, 3000);
      frame.Caption = u"מסגרת";
      label.Move(150, 400, 2000, 300);
      label.Caption = u"כתובת:";
      button.Move(150, 900, 1800, 450);
      button.Caption = u"המשך";
      line.Ends = LineEnds{100, 2000, 4000, 2000};
      field.Move(2400, 400, 1800, 450);
      other.Move(2000, 2500, 3600, 1500);
      other.BackColour = Palette::Selection;
    };
  }
  static Picture::Pixels Stripes() {
    Picture::Pixels pixels{4, 1, {0xFFFF0000, 0x8000FF00, 0xFF0000FF, 0x00FFFFFF}};
    return pixels;
  }

  std::vector<std::uint32_t> Shown() {
    Settle();
    const HWND body = WindowOf(form).Body();
    ::UpdateWindow(body);
    Surface shown({400, 300});
    const HDC device = ::GetDC(body);
    ::BitBlt(shown.Dc(), 0, 0, 400, 300, device, 0, 0, SRCCOPY);
    ::ReleaseDC(body, device);
    const auto pixels = shown.Pixels();
    std::vector<std::uint32_t> colours(pixels.begin(), pixels.end());
    for (std::uint32_t& colour : colours) colour &= 0xFFFFFF;
    return colours;
  }
  /// Whether the window shows something else than before, and just what it would show if drawn anew.
  testing::AssertionResult Shows(const std::function<void()>& change) {
    const auto before = Shown();
    change();
    const auto after = Shown();
    if (after == before) return testing::AssertionFailure() << "nothing has changed";
    WindowOf(form).Changed(Aspect::Look);
    const auto anew = Shown();
    const auto differing = std::mismatch(after.begin(), after.end(), anew.begin());
    if (differing.first == after.end()) return testing::AssertionSuccess();
    const auto place = differing.first - after.begin();
    return testing::AssertionFailure() << "differs at " << place % 400 << ", " << place / 400;
  }

  PictureBox ground{form, u"ground"};
  Frame frame{ground, u"frame"};
  Label label{frame, u"label"};
  CommandButton button{frame, u"button"};
  Line line{frame, u"line"};
  TextBox field{frame, u"field"};
  Frame other{ground, u"other"};
};

TEST_F(Freshness, Holds_for_every_kind_of_change) {
  Show();

  EXPECT_TRUE(Shows([&] { label.Caption = u"שם:"; }));
  EXPECT_TRUE(Shows([&] { label.ForeColour = Palette::Link; }));
  EXPECT_TRUE(Shows([&] { label.TextFont = Font{14, true, false}; }));
  EXPECT_TRUE(Shows([&] { button.Enabled = false; }));
  EXPECT_TRUE(Shows([&] { frame.BackColour = Palette::QuietPage; }));
  EXPECT_TRUE(Shows([&] { line.BorderWidth = 5; }));
  EXPECT_TRUE(Shows([&] { button.Move(450, 1200, 2400, 600); }));
  EXPECT_TRUE(Shows([&] { frame.Move(600, 0, 4500, 3300); }));
  EXPECT_TRUE(Shows([&] { frame.BringToFront(); }));
  EXPECT_TRUE(Shows([&] { label.Visible = false; }));
  EXPECT_TRUE(Shows([&] { frame.Visible = false; }));
  EXPECT_TRUE(Shows([&] { label.Visible = true, label.Caption = u"בינתיים", frame.Visible = true; }));
  EXPECT_TRUE(Shows([&] { form.BackColour = Palette::Focus, ground.Visible = false; }));
  EXPECT_TRUE(Shows([&] { ground.Visible = true; }));
}

TEST_F(Freshness, Holds_for_drawings_and_for_what_the_user_does) {
  Show();

  EXPECT_TRUE(Shows([&] {
    desktop.FillBox(ground, 5000, 100, 5800, 900, kBlack);
    desktop.Refresh(ground);
  }));
  EXPECT_TRUE(Shows([&] { MoveMouse(button, {10, 10}); }));
  EXPECT_TRUE(Shows([&] { SendMouse(button, WM_MOUSELEAVE, {}); }));
  EXPECT_TRUE(Shows([&] { Key(kTabKey); }));
  EXPECT_TRUE(Shows([&] { Key(kTabKey); }));
}

TEST_F(Freshness, Holds_when_the_window_comes_back) {
  Show();
  const auto before = Shown();

  form.Visible = false;
  button.Caption = u"סגור";
  Show();

  EXPECT_NE(Shown(), before);
  EXPECT_TRUE(Shows([&] { frame.Visible = false; }));
}

} // namespace quendra::forms::win32
