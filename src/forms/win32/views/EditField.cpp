#include "forms/win32/views/EditField.h"

#include "forms/view/VisibleText.h"
#include "forms/view/fields/Typing.h"
#include "forms/win32/views/EditMenu.h"
#include "forms/win32/views/MarkedEdit.h"

#include <utility>

namespace quendra::forms::win32 {

namespace {

/// Its place in the window is brought into sight when the handlers are through: a text that grows at its end
/// would else jump to its start and back.
constexpr UINT kShowCaret = WM_APP + 0x210;

bool IsDown(int key) { return ::GetKeyState(key) < 0; }

/// Ctrl and Alt together are the key for third letters.
int ShiftOfTyping() {
  const bool ctrl = IsDown(VK_CONTROL);
  const bool alt = IsDown(VK_MENU);
  return ShiftSum(IsDown(VK_SHIFT), ctrl && !alt, alt && !ctrl);
}

/// Messages after which the caret may stand elsewhere.
bool MayMoveCaret(UINT message) {
  switch (message) {
  case WM_KEYDOWN:
  case WM_KEYUP:
  case WM_LBUTTONDOWN:
  case WM_LBUTTONUP:
  case WM_LBUTTONDBLCLK:
  case WM_UNDO: return true;
  default: return false;
  }
}

} // namespace

void EditField::Take(const InnerWindow& edit) {
  edit_ = &edit;
  edit_->Send(EM_SETLIMITTEXT, 0);
}

std::optional<LRESULT> EditField::Answer(UINT message, WPARAM wParam, LPARAM lParam) {
  if (!entry_ || !edit_) return std::nullopt;
  if (Lines() == EditText::Lines::Marked)
    if (const auto answer = AnswerWithoutMarks(*edit_, message, wParam, lParam)) return answer;
  switch (message) {
  case WM_CHAR: return Typed(wParam, lParam);
  case WM_CONTEXTMENU: ShowMenu(lParam); return 0;
  case kShowCaret: edit_->Send(EM_SCROLLCARET); return 0;
  case WM_KEYDOWN:
    key_ = LOWORD(wParam); // a character that comes without a key stands above it
    if (key_ != VK_INSERT || !IsDown(VK_CONTROL) || Lines() != EditText::Lines::Marked) break;
    return edit_->Send(WM_COPY);
  case WM_MOUSEMOVE:
    if (!(wParam & MK_LBUTTON)) return std::nullopt;
    break;
  default:
    if (!MayMoveCaret(message)) return std::nullopt;
  }
  const LRESULT answer = edit_->PassOn(message, wParam, lParam);
  TellSelection();
  return answer;
}

LRESULT EditField::Typed(WPARAM unit, LPARAM lParam) {
  const WPARAM key = std::exchange(key_, 0);
  const int character = CharacterOf(key, static_cast<char16_t>(unit));
  if (character == 0) return 0;
  const bool named = character < 0x20 && key != 0 && key != VK_PACKET;
  const int code = named ? static_cast<int>(key) : CodeOfCharacter(static_cast<char16_t>(character));
  if (!IsTyped(view_.TheControl()->OwnerForm(), {code, ShiftOfTyping(), false})) return 0;
  Typing typing;
  view_.Context().dispatcher.Dispatch([&] {
    if (entry_) typing = Type(*entry_, character, ofManyLines_);
  });
  if (!entry_) return 0;
  const bool readOnly = edit_->Has(ES_READONLY);
  if (typing.act == Typing::Act::Insert && !readOnly)
    edit_->Send(EM_REPLACESEL, TRUE, reinterpret_cast<LPARAM>(winapi::Wide(typing.text)));
  if (typing.act == Typing::Act::DeleteBack && !readOnly) DeleteBack(lParam);
  if (typing.act == Typing::Act::Command) Command(character, lParam);
  TellSelection();
  return 0;
}

/// 0 while the other half of the character is to come.
int EditField::CharacterOf(WPARAM key, char16_t unit) {
  // With Ctrl they give other control characters, and not the same ones on all systems.
  if (key == VK_RETURN) return kEnterKey;
  if (key == VK_BACK) return kBackspaceKey;
  constexpr int kFirstOutsidePlane = 0x10000;
  if (unit >= 0xD800 && unit <= 0xDBFF) {
    high_ = unit;
    return 0;
  }
  const char16_t high = std::exchange(high_, u'\0');
  if (unit < 0xDC00 || unit > 0xDFFF) return unit;
  return high ? kFirstOutsidePlane + ((high - 0xD800) << 10) + (unit - 0xDC00) : 0;
}

// The class would put the other control characters into the text.
void EditField::Command(int character, LPARAM lParam) {
  enum : int { kSelectAll = 1, kCopy = 3, kPaste = 22, kCut = 24, kUndo = 26 };
  if (character == kSelectAll) edit_->Send(EM_SETSEL, 0, -1);
  if (character == kCopy && Lines() == EditText::Lines::Marked)
    edit_->Send(WM_COPY);
  else if (character == kCopy || character == kPaste || character == kCut || character == kUndo)
    edit_->PassOn(WM_CHAR, static_cast<WPARAM>(character), lParam);
}

// Words of a masked text are nobody's business.
void EditField::DeleteBack(LPARAM lParam) {
  if (!IsDown(VK_CONTROL)) {
    edit_->PassOn(WM_CHAR, kBackspaceKey, lParam);
    return;
  }
  auto [from, to] = HeldSelectionIn(*edit_);
  const bool masked = edit_->Send(EM_GETPASSWORDCHAR) != 0;
  if (from == to) from = masked ? 0 : WordStart(HeldIn(*edit_), to);
  edit_->Send(EM_SETSEL, static_cast<WPARAM>(from), to);
  edit_->Send(EM_REPLACESEL, TRUE, reinterpret_cast<LPARAM>(L""));
}

void EditField::ShowMenu(LPARAM place) {
  if (!edit_->HasFocus()) ::SetFocus(edit_->Window());
  ShowEditMenu(edit_->Window(), place);
  TellSelection();
}

void EditField::Edited() {
  if (showing_ || !entry_) return;
  const Text value = EditText::ValueOf(HeldIn(*edit_), ofManyLines_);
  const int caret = EditText(value, Lines()).ValuePlace(HeldSelectionIn(*edit_).second);
  view_.Context().dispatcher.Dispatch([&] {
    if (entry_) entry_->Edited(value, caret);
  });
  if (!entry_) return;
  // What was pasted may have signs in it that are shown in another way.
  ShowText();
}

void EditField::TellSelection() {
  if (showing_ || !entry_) return;
  const EditText text(entry_->Value(), Lines());
  const auto [from, to] = HeldSelectionIn(*edit_);
  const int start = text.ValuePlace(from);
  entry_->Selected(start, text.ValuePlace(to) - start);
}

EditText::Lines EditField::Lines() const {
  if (!ofManyLines_) return EditText::Lines::One;
  return edit_->Has(ES_READONLY) ? EditText::Lines::Marked : EditText::Lines::Many;
}

void EditField::ShowText() {
  const bool before = std::exchange(showing_, true);
  // The caret of an empty field stands where Latin letters, which all fields here are for, begin.
  readFrom_(DirectionOf(entry_->Value()));
  Hold(EditText(entry_->Value(), Lines()).Held());
  showing_ = before;
  ShowCaret();
}

// A text that only grows keeps what stands there: it doesn't flicker, and undoing ends there.
void EditField::Hold(const Text& text) {
  const Text held = HeldIn(*edit_);
  if (held == text) return;
  if (!ofManyLines_ || held.empty() || text.compare(0, held.size(), held) != 0) {
    ::SetWindowTextW(edit_->Window(), winapi::Wide(text));
    return;
  }
  const Text tail = text.substr(held.size());
  edit_->Send(EM_SETSEL, held.size(), static_cast<LPARAM>(held.size()));
  edit_->Send(EM_REPLACESEL, FALSE, reinterpret_cast<LPARAM>(winapi::Wide(tail)));
  edit_->Send(EM_EMPTYUNDOBUFFER);
}

void EditField::ShowCaret() {
  const EditText text(entry_->Value(), Lines());
  const int from = text.HeldPlace(entry_->SelStart());
  const int to = text.HeldPlace(entry_->SelStart() + entry_->SelLength());
  if (HeldSelectionIn(*edit_) == std::pair(from, to)) return;
  const bool before = std::exchange(showing_, true);
  edit_->Send(EM_SETSEL, static_cast<WPARAM>(from), to);
  showing_ = before;
  ::PostMessageW(edit_->Window(), kShowCaret, 0, 0);
}

} // namespace quendra::forms::win32
