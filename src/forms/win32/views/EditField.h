#pragma once

#include "forms/controls/TextEntry.h"
#include "forms/win32/views/EditText.h"
#include "forms/win32/views/InnerWindow.h"

namespace quendra::forms::win32 {

/// What keys, the focus and the mouse do in an EDIT window, whatever view it stands in.
class EditField {
 public:
  /// `readFrom` has the window read in a direction.
  EditField(WindowView& view, TextEntry& entry, bool ofManyLines, std::function<void(Direction)> readFrom)
      : view_(view), entry_(&entry), ofManyLines_(ofManyLines), readFrom_(std::move(readFrom)) {}

  /// The window, which must stay until it is left for another one.
  void Take(const InnerWindow& edit);
  void Leave() { edit_ = nullptr; }
  /// nullptr once released.
  TextEntry* Entry() const { return entry_; }
  /// The control goes or is let go of.
  void Release() { entry_ = nullptr; }

  /// What becomes of a message to the window. None lets its class answer.
  std::optional<LRESULT> Answer(UINT message, WPARAM wParam, LPARAM lParam);
  /// The window tells that its text has changed.
  void Edited();

  void ShowText();
  void ShowCaret();

 private:
  LRESULT Typed(WPARAM unit, LPARAM lParam);
  int CharacterOf(WPARAM key, char16_t unit);
  void Command(int character, LPARAM lParam);
  void DeleteBack(LPARAM lParam);
  void TellSelection();
  void Hold(const Text& text);
  void ShowMenu(LPARAM place);
  /// What can't be edited has marks in it.
  EditText::Lines Lines() const;

  WindowView& view_;
  TextEntry* entry_;
  bool ofManyLines_;
  std::function<void(Direction)> readFrom_;
  const InnerWindow* edit_ = nullptr;
  bool showing_ = false; ///< what changes now is what the field says, not the user
  WPARAM key_ = 0;       ///< that went down last and has given no character yet
  char16_t high_ = 0;    ///< the first half of a character of two units
};

} // namespace quendra::forms::win32
