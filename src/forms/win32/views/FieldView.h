#pragma once

#include "forms/view/fields/FieldLook.h"
#include "forms/win32/views/InnerWindow.h"

#include <memory>

namespace quendra::forms::win32 {

/// A field that the form draws, with a window of one of the system's kinds inside its edge. The accessible
/// name of that window is the text of one without extent before it, as assistive technology finds the names
/// of fields by the labels before them.
class FieldView : public WindowView {
 public:
  FieldView(ViewContext& context, Control& control, HWND parent);
  void Paint(Drawing& drawing) override;
  bool TakesMouse() const override { return false; }
  /// The window of the system's kind.
  const InnerWindow& Inner() const { return *inner_; }

 protected:
  /// Makes the window of the system's kind, in the constructor of the view's kind and whenever another one is
  /// to take its place.
  void Hold(const wchar_t* windowClass, DWORD style, DWORD extendedStyle = 0);
  std::optional<LRESULT> Answer(UINT message, WPARAM wParam, LPARAM lParam) override;
  /// The extended style by which the scroll bar of the window stands where its lines end.
  DWORD BarSide() const { return ReadingDirection() == Direction::RightToLeft ? WS_EX_LEFTSCROLLBAR : 0; }
  /// A message to the window of the system's kind.
  virtual std::optional<LRESULT> AnswerInner(UINT message, WPARAM wParam, LPARAM lParam);
  /// The window of the system's kind tells of something.
  virtual void Notified(int /*code*/) {}
  void TellName() override;
  /// A window without extent, for the name of the one that is made after it.
  std::unique_ptr<InnerWindow> MakeName(HWND parent);
  void GiveName(const InnerWindow& name) const;
  /// The window of the system's that has the keys.
  virtual HWND KeyWindow() const { return inner_->Window(); }
  /// The focus has come to a window of the system's inside the field.
  void FocusCameFrom(HWND before);
  /// Where the window of the system's kind stands in a field of this extent.
  virtual Area Room(Extent field) const = 0;
  virtual bool IsReadOnly() const { return false; }
  virtual HFONT Letters() const;
  void GiveLetters();
  /// Puts the window of the system's kind in its place.
  virtual void Arrange();
  FieldState State() const;
  /// Has Turn called when the messages that are there are handled, and nothing of the field is under way: not
  /// all systems let an EDIT window turn once it is made, and it can't be replaced while it tells of
  /// something.
  void TurnSoon();
  /// Puts a window that reads in the other direction in the place of the one that is there.
  virtual void Turn() {}
  void Rested() override;

 private:
  LRESULT ColourText(HDC device) const;
  void TurnOrWait();

  std::unique_ptr<InnerWindow> name_;
  std::unique_ptr<InnerWindow> inner_;
  bool turnWaits_ = false;
};

} // namespace quendra::forms::win32
