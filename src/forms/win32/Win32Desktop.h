#pragma once

#include "forms/Desktop.h"
#include "forms/win32/drawing/Win32Drawing.h"
#include "forms/win32/input/KeyInput.h"
#include "forms/win32/input/MouseInput.h"
#include "forms/win32/loop/Win32EventLoop.h"
#include "forms/win32/windows/FormWindow.h"

namespace quendra::forms::win32 {

/// The desktop of the Windows edition, from XP on.
class Win32Desktop : public Desktop, public platform::EventLoop {
 public:
  Win32Desktop();
  ~Win32Desktop() override;

  /// Runs `start` as the first handler and then the loop, until the last form has gone or the program ends.
  /// Gives the exit status. The forms must still be alive; their views go before this returns.
  int Run(std::function<void()> start = {});

  [[noreturn]] void End(int status = 0) override { dispatcher_.End(status); }
  int MessageBox(const Text& text, int flags, const Text& title) override;
  void DoEvents() override { loop_.PumpIfDue(); }

  CursorHandle LoadCursor(int id) override;
  void SetCursor(CursorHandle cursor) override;
  WindowHandle HandleOf(Form& form) override;
  void ReleaseCapture() override { mouse_.ReleaseCapture(); }
  std::int32_t SendMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                           std::uint32_t lParam) override;
  std::uint32_t RegisterWindowMessageA(const std::string& name) override;
  double TwipsPerPixelX() const override { return scale_.twipsPerPixelX; }
  double TwipsPerPixelY() const override { return scale_.twipsPerPixelY; }
  RegionHandle CreateRoundRectRgn(int left, int top, int right, int bottom, int ellipseWidth,
                                  int ellipseHeight) override;
  void SetWindowRgn(WindowHandle window, RegionHandle region, bool redraw) override;
  bool SetWindowPos(WindowHandle window, InsertAfter insertAfter, int x, int y, int cx, int cy,
                    unsigned flags) override;
  void Repaint(Control& control) override;

  void FillBox(PictureBox& box, int x1, int y1, int x2, int y2, Colour colour) override {
    drawing_.FillBox(box, x1, y1, x2, y2, colour);
  }
  void BitBlt(PictureBox& target, int x, int y, int width, int height, const PictureBox& source, int sourceX,
              int sourceY) override {
    drawing_.BitBlt(target, x, y, width, height, source, sourceX, sourceY);
  }
  void Refresh(PictureBox& box) override { drawing_.Refresh(box); }
  bool DrawIconEx(PictureBox& box, int x, int y, const std::vector<std::uint8_t>& image, int width,
                  int height) override {
    return drawing_.DrawIconEx(box, x, y, image, width, height);
  }
  Picture ImageOf(const PictureBox& box) const override { return drawing_.ImageOf(box); }

  void Post(std::function<void()> work) override { loop_.Post(std::move(work)); }
  void PostMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                   std::uint32_t lParam) override {
    Post([=, this] { Windows.Dispatch(window, message, wParam, lParam); });
  }
  std::unique_ptr<Subscription> StartTimer(int milliseconds, std::function<void()> tick) override {
    return loop_.StartTimer(milliseconds, std::move(tick));
  }
  void PumpOnce() override { loop_.PumpOnce(); }
  int ModalDepth() const override { return StandingCount(); }

  /// Whether the program has ended, and with which status.
  bool Ended() const { return dispatcher_.Ended(); }
  int Status() const { return dispatcher_.Status(); }

 protected:
  void CreateView(Form& form) override;
  void DestroyView(Form& form) override;
  void ShowView(Form& form, Modality modality, Form* owner) override;
  void LastFormGone() override;

  const Scale& ScreenScale() const override { return scale_; }
  int WidthInPixels(const PictureBox& box, TextView text) const override {
    return drawing_.WidthInPixels(box, text);
  }
  int LineHeightInPixels(const PictureBox& box) const override { return drawing_.LineHeight(box); }
  void DropDrawings(PictureBox& box) override { drawing_.DropDrawings(box); }
  void PrintLine(PictureBox& box, TextView text, const Area& place) override {
    drawing_.PrintLine(box, text, place);
  }

 private:
  using FormWindows = std::map<WindowHandle, std::unique_ptr<FormWindow>>;

  int ShowBox(const Text& text, int flags, const Text& title);
  /// The end of the program counts from now on.
  Waiter WaiterFromNow();
  void Close(FormWindow& window);
  /// After each message.
  void TidyUp();
  /// Destroys the windows that were closed and in which no handler is under way any more.
  void Bury();
  /// The own procedure of a form's window.
  std::int32_t HandleMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam);
  FormWindow* WindowOf(WindowHandle window) const;
  static FormWindow* WindowOf(const Form& form) { return static_cast<FormWindow*>(form.View()); }

  Dispatcher dispatcher_;
  Scale scale_; ///< the screen's
  PictureStore pictures_;
  Fonts fonts_;
  MouseInput mouse_;
  KeyInput keys_;
  TimerStarter startTimer_;
  ActiveForm active_;
  FormState state_; ///< without a form
  ViewContext context_;
  Win32Drawing drawing_;
  Win32EventLoop loop_;
  std::map<RegionHandle, RoundRect> regions_;
  std::uint32_t lastRegion_ = 0;
  FormWindows windows_;
  std::vector<std::unique_ptr<FormWindow>> closed_;
};

} // namespace quendra::forms::win32
