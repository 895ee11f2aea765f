#pragma once

#include "forms/view/FocusOrder.h"
#include "forms/view/FormPlacement.h"
#include "forms/view/RoundRect.h"
#include "forms/win32/views/ViewFactory.h"
#include "forms/win32/windows/FormScroll.h"
#include "forms/win32/windows/ModalBlock.h"
#include "forms/win32/windows/TopWindow.h"

#include <functional>
#include <optional>

namespace quendra::forms::win32 {

/// Handles events until a condition holds, or the program ends.
using Waiter = std::function<void(const std::function<bool()>&)>;

using ViewMaker = MadeView (*)(ViewContext& context, Control& control, HWND parent);

/// What the views of one form share: the desktop's own, save the scale, which fits the form to its screen,
/// and how the user works in it. A base of the form's view, so that it is there before the others.
class FormContext {
 protected:
  explicit FormContext(const ViewContext& desktops)
      : scale_(desktops.scale), shared_{desktops.desktop,    desktops.dispatcher, scale_,
                                        desktops.pictures,   desktops.fonts,      desktops.mouse,
                                        desktops.startTimer, desktops.active,     state_} {}

  Scale scale_;
  FormState state_;
  ViewContext shared_;
};

/// The view of a form: its window on the screen, and the body in it, which holds the views of all controls. A
/// screen that has too little room shows the whole form smaller, and one that has far too little a part of
/// it, to be scrolled.
class FormWindow : private FormContext, public TopWindow, public WindowView {
 public:
  FormWindow(const ViewContext& desktops, Form& form, WindowHandle handle, ViewMaker makeView = MakeView);
  ~FormWindow() override;

  void Release() override;
  void ControlGone() override;
  void Paint(Drawing& drawing) override;

  Form* TheForm() const { return static_cast<Form*>(TheControl()); }
  WindowHandle Handle() const { return handle_; }
  /// The form's window that a window is or lies in; nullptr for none.
  static FormWindow* Around(HWND window);
  /// The one that the user works in: the active one, else the foremost that no modal form or box blocks.
  static FormWindow* Front();
  /// A handler of it is under way, or of one of its controls.
  bool IsInUse() const;

  /// Shows the window in the middle of its owner or of the screen, once; a window that was moved stays where
  /// it is.
  void ShowOver(const TopWindow* owner);
  /// Returns when the form is hidden or released, or the program ends.
  void RunModal(FormWindow* owner, const Waiter& wait);
  /// Over or under other windows, or in or out of the band above all others.
  void PutAfter(InsertAfter place);
  void MoveToScreen(Spot corner);
  /// Cuts the window to a shape, in the pixels of the form as it was laid out; none takes the shape away.
  void Shape(std::optional<RoundRect> shape, bool redraw);

  /// To the next control that takes it.
  void MoveFocus(TabDirection direction);
  /// nullptr for none.
  const Control* ControlWithFocus() const;
  /// The focus comes back to where it is now when the window is the active one again. Asked for in time: a
  /// window that is minimised has lost it before it hears of anything.
  void KeepFocus();

  /// Called in place of unloading the form when its window is to be closed.
  std::function<void()> OnClose;

 protected:
  void Apply(Aspect aspect) override;
  void PutInPlace() override;
  void Show() override;
  void TellName() override {}
  std::optional<LRESULT> AnswerTop(UINT message, WPARAM wParam, LPARAM lParam) override;
  void ReportThrown() noexcept override;

 private:
  void AddViews(const Container& container, HWND parent, ViewMaker makeView);
  void Hide();
  void Close();
  void Activated(bool active, bool minimised);
  void RestoreFocus();
  void FocusFirst();
  void Refit();
  void Zoom(double factor);
  void CutOut(bool redraw);
  void CentreOver(const Area& over);
  void ComeOnScreen();
  void PaintGround();

  WindowHandle handle_;
  FormScroll scroll_;
  std::vector<std::unique_ptr<View>> views_;
  std::vector<WindowView*> windows_; ///< of those that have a window
  std::optional<RoundRect> shape_;
  ModalBlock* block_ = nullptr; ///< while the form is modal
  HWND lastFocus_ = nullptr;    ///< that it had while it was the active one
  bool wasPlaced_ = false;
  bool hadFocus_ = false;
};

} // namespace quendra::forms::win32
