#pragma once

#include "forms/win32/views/WindowView.h"

#include <functional>
#include <memory>

namespace quendra::forms::win32 {

/// A window of one of the system's kinds inside that of a view, which hears of its messages first. What the
/// system's kind tells its container comes to the view's own window.
class InnerWindow {
 public:
  /// None lets the class's own procedure answer.
  using Hearer = std::function<std::optional<LRESULT>(UINT message, WPARAM wParam, LPARAM lParam)>;

  struct Kind {
    const wchar_t* windowClass;
    DWORD style = 0;
    DWORD extendedStyle = 0;
    HWND parent = nullptr; ///< inside the view's own, which it else is itself
  };
  /// Makes a window that fills nothing yet.
  InnerWindow(WindowView& view, const Kind& kind, Hearer hear);
  /// Takes one that a window of the system has made.
  InnerWindow(WindowView& view, HWND window, Hearer hear);
  ~InnerWindow();
  /// Puts one in the place of another, or of none, and gives it the focus that that one had.
  static void Replace(std::unique_ptr<InnerWindow>& standing, std::unique_ptr<InnerWindow> made);
  InnerWindow(const InnerWindow&) = delete;
  InnerWindow& operator=(const InnerWindow&) = delete;

  /// nullptr once the system has destroyed it.
  HWND Window() const { return window_; }
  LRESULT Send(UINT message, WPARAM wParam = 0, LPARAM lParam = 0) const {
    return ::SendMessageW(window_, message, wParam, lParam);
  }
  /// What the class's own procedure does with a message.
  LRESULT PassOn(UINT message, WPARAM wParam = 0, LPARAM lParam = 0) const;
  void MoveTo(const Area& place) const;
  Extent Inside() const;
  bool HasFocus() const { return window_ && ::GetFocus() == window_; }
  bool Has(DWORD style) const { return (Style(GWL_STYLE) & style) != 0; }
  /// Sets and takes bits of GWL_STYLE or GWL_EXSTYLE. False where they were so already.
  bool SetStyle(int index, DWORD bits, bool on) const;
  void Redraw() const { ::InvalidateRect(window_, nullptr, FALSE); }

 private:
  DWORD Style(int index) const { return static_cast<DWORD>(::GetWindowLongW(window_, index)); }
  void Join();
  /// A message of the mouse, which the view's control hears of.
  bool IsTaken(UINT message, WPARAM wParam, LPARAM lParam) const;
  LRESULT Handle(UINT message, WPARAM wParam, LPARAM lParam);
  LRESULT Answer(UINT message, WPARAM wParam, LPARAM lParam);
  static LRESULT CALLBACK Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept;

  WindowView& view_;
  HWND window_;
  Hearer hear_;
  WNDPROC before_ = nullptr;
};

/// The text of a window, whole.
Text TextOfWindow(HWND window);

} // namespace quendra::forms::win32
