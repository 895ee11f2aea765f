#pragma once

#include "forms/view/View.h"
#include "forms/win32/drawing/Drawing.h"
#include "forms/win32/views/ViewContext.h"

#include <optional>

namespace quendra::forms::win32 {

/// What all windows that stand for a control have in common. A window's text is the accessible name of its
/// control. What we draw ourselves is put together by the form's window, over what lies below: controls may
/// be transparent. Windows of the system's kinds draw themselves.
class WindowView : public View {
 public:
  WindowView(ViewContext& context, Control& control);
  ~WindowView() override;

  void Changed(Aspect aspect) override;
  void Release() override;
  void ControlGone() override;

  /// nullptr once released.
  Control* TheControl() const { return control_; }
  HWND Window() const { return window_; }
  /// The window in which what the control holds is placed.
  virtual HWND Body() const { return window_; }
  ViewContext& Context() const { return context_; }
  Direction ReadingDirection() const { return direction_; }
  /// In the pixels of the container's body.
  Area Place() const;

  /// Draws the control without what it holds, in its own pixels. Nothing for windows that draw themselves.
  virtual void Paint(Drawing& /*drawing*/) {}
  /// Draws the control and what it holds at once.
  void Repaint();
  /// To be drawn again when the loop is idle, with whatever lies over it.
  void Invalidate();
  /// A press by the mouse, a key or assistive technology.
  void Press();
  /// False for windows that need mouse events for themselves, too.
  virtual bool TakesMouse() const { return true; }

  /// The view that a window was made for; nullptr for any other window.
  static WindowView* Of(HWND window);

 protected:
  /// Makes the window, once, in the constructor of the kind: of the class that we register ourselves where
  /// `windowClass` is nullptr, else of one of the system's, whose procedure stays behind ours.
  void Create(HWND parent, const wchar_t* windowClass, DWORD style, DWORD extendedStyle = 0);
  /// A message of the own window. None lets the class's own procedure answer. Faults leave it to the
  /// dispatcher's gate: call handlers through Context().dispatcher alone.
  virtual std::optional<LRESULT> Answer(UINT message, WPARAM wParam, LPARAM lParam);
  /// A message with which the window of a system's kind tells its container something (WM_COMMAND, WM_NOTIFY,
  /// WM_DRAWITEM, WM_MEASUREITEM, WM_CTLCOLOR...): the container hands it back to the view. None lets the
  /// container answer.
  virtual std::optional<LRESULT> AnswerReflected(UINT message, WPARAM wParam, LPARAM lParam);
  /// The parts of the state that only this kind of control has.
  virtual void Apply(Aspect /*aspect*/) {}
  virtual void PutInPlace();
  virtual void Show();
  /// Gives the window the accessible name that the control has now, as its text. Not for fields, whose text
  /// is their content.
  virtual void TellName();
  static bool Concerns(Aspect told, Aspect wanted) { return told == wanted || told == Aspect::All; }
  /// What the class's own procedure does with a message.
  LRESULT PassOn(UINT message, WPARAM wParam, LPARAM lParam);

 private:
  static LRESULT CALLBACK Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept;

  ViewContext& context_;
  Control* control_;
  Direction direction_;
  HWND window_ = nullptr;
  WNDPROC before_ = nullptr;
};

} // namespace quendra::forms::win32
