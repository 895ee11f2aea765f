#include "forms/win32/views/EditText.h"

#include <algorithm>

namespace quendra::forms::win32 {

EditText::EditText(TextView value, bool ofManyLines)
    : text_(value, ofManyLines), ofManyLines_(ofManyLines), shown_(text_.Shown()),
      held_(ofManyLines ? Replaced(shown_, u"\n", u"\r\n") : shown_) {}

int EditText::HeldPlace(int valuePlace) const {
  const int shown = text_.ShownPlace(valuePlace);
  if (!ofManyLines_) return shown;
  return shown + static_cast<int>(std::count(shown_.begin(), shown_.begin() + shown, u'\n'));
}

int EditText::ValuePlace(int heldPlace) const {
  const int end = std::clamp(heldPlace, 0, static_cast<int>(held_.size()));
  if (!ofManyLines_) return text_.ValuePlace(end);
  return text_.ValuePlace(end - static_cast<int>(std::count(held_.begin(), held_.begin() + end, u'\r')));
}

Text EditText::ValueOf(TextView held, bool ofManyLines) { return FieldText::ValueOf(held, ofManyLines); }

} // namespace quendra::forms::win32
