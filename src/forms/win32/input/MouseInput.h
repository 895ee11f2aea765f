#pragma once

#include "forms/view/MouseRules.h"
#include "forms/view/WindowDrag.h"
#include "forms/win32/views/WindowView.h"

namespace quendra::forms::win32 {

/// The state of the modifier keys now, as handlers get it.
int ShiftStateNow();

/// Turns the mouse's messages into the events of the controls, holds the cursor that handlers set, and drags
/// windows.
class MouseInput {
 public:
  /// True for a message that is done with; what remains is for the window's own kind.
  bool Takes(WindowView& view, UINT message, WPARAM wParam, LPARAM lParam);
  void Forget(const WindowView& view);

  /// Sets the cursor over the control whose event is being handled, else over the one under the mouse. It
  /// stays until the mouse moves over a control whose handler sets none.
  void SetCursor(HCURSOR cursor);
  /// The pressed control gets no click any more.
  void ReleaseCapture() { rules_.ReleaseCapture(); }
  /// Moves a window with the mouse until its button is let go; `holder`, inside it, gets the mouse meanwhile
  /// and controls hear nothing of it.
  void DragWindow(HWND window, HWND holder);
  bool IsOver(const WindowView& view) const { return over_ == &view; }
  /// The mouse is over no control until it moves again.
  void Leave() { Enter(nullptr); }

 private:
  /// A message of the mouse.
  struct Event {
    UINT message;
    int button;    ///< the one that changed
    int held;      ///< a sum of MouseButton
    bool leftHeld; ///< with what the system says of the left one
    Spot place;    ///< in the window
    int shift;
  };
  static Event EventOf(UINT message, WPARAM wParam, LPARAM lParam);

  bool Dragged(const Event& event);
  void Handle(WindowView& view, const Event& event);
  void Pressed(WindowView& view, const Event& event, MouseRules::Meaning meaning);
  void Released(WindowView& view, const Event& event);
  void Act(WindowView& view, const Event& event, MouseRules::Meaning meaning);
  void Moved(WindowView& view, const Event& event);
  void Enter(WindowView* view);
  static void HideRing(const WindowView& view);
  static void Raise(WindowView& view, const forms::Event<int, int, int, int>& raised, int button,
                    const Event& event);

  MouseRules rules_;
  CursorRules cursor_;
  WindowView* moving_ = nullptr; ///< its move is being handled
  WindowView* over_ = nullptr;   ///< the mouse is over it
  WindowDrag drag_;
  HWND dragged_ = nullptr;
};

} // namespace quendra::forms::win32
