#pragma once

#include "forms/view/Keyboard.h"
#include "forms/view/View.h"
#include "forms/win32/drawing/Drawing.h"
#include "forms/win32/views/ViewContext.h"

#include <optional>

namespace quendra::forms::win32 {

/// What becomes of a key that was pressed in a control.
enum class KeyUse {
  Free,   ///< the form's Default or Cancel may be pressed by it; else it is the window's
  Window, ///< the window of the system's kind needs it for itself
  Done,   ///< the view has done what the key does
};

/// What all windows that stand for a control have in common. A window's text is the accessible name of its
/// control, and a property tells the control's own name. What we draw ourselves is put together by the form's
/// window, over what lies below: controls may be transparent. Windows of the system's kinds draw themselves.
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
  /// Of the control, in the pixels of its container's body.
  Area Place() const;
  /// Of the window, which may reach beyond the control.
  const Area& WindowPlace() const { return windowPlace_; }

  /// Draws the control without what it holds, in the pixels of its window. Nothing for windows that draw
  /// themselves.
  virtual void Paint(Drawing& /*drawing*/) {}
  /// Draws the control and what it holds at once.
  void Repaint();
  /// To be drawn again when the loop is idle, with whatever lies over it.
  void Invalidate() const;
  /// A press by the mouse, a key or assistive technology.
  void Press();

  /// With all its containers.
  bool IsEnabled() const;
  /// The focus is in this window, or in one of the system's inside it.
  bool HasFocus() const;
  /// The last thing that the user took in hand was the keyboard.
  bool UsesKeys() const { return context_.state.usesKeys; }
  bool IsUnderMouse() const;
  /// By the left button, with the mouse over it.
  bool IsHeldDown() const;

  /// False for windows that need mouse events for themselves, too.
  virtual bool TakesMouse() const { return true; }
  /// A key was pressed while the focus was in this window. The form has heard of it, and Tab never comes.
  virtual KeyUse Use(const KeyPress& /*key*/) { return KeyUse::Free; }

  /// The whole text where a window of this view cuts it, in the pixels of the window's inside; else empty.
  virtual Text TipAt(HWND /*window*/, Spot /*place*/) const { return {}; }
  /// A message to a window of this view, of which those of the mouse show and hide the tip.
  void HearForTip(HWND window, UINT message, LPARAM lParam) const;

  /// The view that a window was made for; nullptr for any other window.
  static WindowView* Of(HWND window);
  /// That of the nearest window upwards that has one.
  static WindowView* Around(HWND window);

  /// Holds a view that is at work: it is not destroyed meanwhile, only released.
  class Work {
   public:
    explicit Work(WindowView& view) : view_(view) { ++view_.underWay_; }
    ~Work() {
      if (--view_.underWay_ == 0) view_.Rested();
    }
    Work(const Work&) = delete;
    Work& operator=(const Work&) = delete;

   private:
    WindowView& view_;
  };
  bool IsAtWork() const { return underWay_ > 0; }

  /// The cursor that a handler set for the control; nullptr for the usual one.
  HCURSOR cursor = nullptr;

 protected:
  /// Makes the window, once, in the constructor of the kind: of the class that we register ourselves where
  /// `windowClass` is nullptr, else of one of the system's, whose procedure stays behind ours. It is hidden
  /// and has the style of a child that clips its siblings and what it holds, beside what is asked for.
  void Create(HWND parent, const wchar_t* windowClass = nullptr, DWORD style = 0, DWORD extendedStyle = 0);
  /// A message of the own window. None lets the class's own procedure answer. Handlers of the program are
  /// called through Context().dispatcher alone.
  virtual std::optional<LRESULT> Answer(UINT message, WPARAM wParam, LPARAM lParam);
  /// A message with which the window of a system's kind tells its container something (WM_COMMAND, WM_NOTIFY,
  /// WM_DRAWITEM, WM_MEASUREITEM, WM_CTLCOLOR...): the container hands it back to the view. None lets the
  /// container answer.
  virtual std::optional<LRESULT> AnswerReflected(UINT message, WPARAM wParam, LPARAM lParam);
  /// The focus came to this window from elsewhere in the program, not with the form's window.
  virtual void FocusCame() {}
  /// Nothing of this view is at work any more.
  virtual void Rested() {}
  /// What is being handled is the only work that is under way.
  bool IsAlone() const { return underWay_ == 1; }
  /// The parts of the state that only this kind of control has.
  virtual void Apply(Aspect /*aspect*/) {}
  virtual void PutInPlace();
  virtual void Show();
  /// Gives the window the accessible name that the control has now, as its text. Not for fields, whose text
  /// is their content. Told again whenever the window is shown: handlers and descriptions are plain members.
  virtual void TellName();
  void MoveTo(const Area& place);
  static bool Concerns(Aspect told, Aspect wanted) { return told == wanted || told == Aspect::All; }
  /// What the class's own procedure does with a message.
  LRESULT PassOn(UINT message, WPARAM wParam, LPARAM lParam);

 private:
  static LRESULT CALLBACK Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept;
  LRESULT Handle(UINT message, WPARAM wParam, LPARAM lParam);
  std::optional<LRESULT> AnswerCommonly(UINT message, WPARAM wParam, LPARAM lParam);
  std::optional<LRESULT> AnswerAsOwn(UINT message, LPARAM lParam);
  std::optional<LRESULT> ShowCursorAt(WPARAM wParam, LPARAM lParam) const;
  /// What the form's picture shows where the window stands has changed. Gives that place, none without form.
  std::optional<Area> ForgetPlace() const;
  /// The window goes.
  LRESULT Forget(WPARAM wParam, LPARAM lParam);
  void ShareFont() const;
  void Enable();

  ViewContext& context_;
  Control* control_;
  Direction direction_;
  Text mark_; ///< the property that tells the control's name
  HWND window_ = nullptr;
  WNDPROC before_ = nullptr;
  Area windowPlace_{};
  int underWay_ = 0;
};

/// Places the views of a container's controls anew: mirrored ones hang on its width.
void PlaceChildren(const Container& container);

} // namespace quendra::forms::win32
