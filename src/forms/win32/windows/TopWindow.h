#pragma once

#include "forms/view/Area.h"
#include "winapi/Winapi.h"

#include <optional>

namespace quendra::forms::win32 {

/// A window of the screen, with or without a frame. It may be mirrored, which its frame and scroll bars are;
/// what stands in it is not.
class TopWindow {
 public:
  TopWindow(DWORD style, DWORD extendedStyle);
  virtual ~TopWindow();
  TopWindow(const TopWindow&) = delete;
  TopWindow& operator=(const TopWindow&) = delete;

  HWND Top() const { return top_; }
  /// With its frame, on the screen.
  Area OnScreen() const;
  /// What the screen that it stands on leaves for windows.
  Area UsableScreen() const;
  /// What its frame adds to its inside.
  Extent Frame() const;
  bool IsStanding() const { return ::IsWindowVisible(top_); }

 protected:
  virtual std::optional<LRESULT> AnswerTop(UINT message, WPARAM wParam, LPARAM lParam) = 0;
  /// No exception gets out of a window's procedure: what was thrown is reported here.
  virtual void ReportThrown() noexcept = 0;
  /// No message gets to AnswerTop any more.
  void Silence() { ::SetWindowLongPtrW(top_, GWLP_USERDATA, 0); }

 private:
  static LRESULT CALLBACK Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept;

  HWND top_;
};

/// The screen's usable part round a window, or that of the first screen without one.
Area UsableScreenRound(HWND window);

} // namespace quendra::forms::win32
