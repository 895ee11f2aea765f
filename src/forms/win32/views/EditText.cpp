#include "forms/win32/views/EditText.h"

#include "forms/win32/views/LineMarks.h"

#include <algorithm>

namespace quendra::forms::win32 {

namespace {

Text HeldOf(const Text& shown, EditText::Lines lines) {
  if (lines == EditText::Lines::One) return shown;
  return Replaced(lines == EditText::Lines::Marked ? WithLineMarks(shown) : shown, u"\n", u"\r\n");
}

} // namespace

EditText::EditText(TextView value, Lines lines)
    : text_(value, lines != Lines::One), held_(HeldOf(text_.Shown(), lines)) {}

// Before a line break is before both of its characters, and at the begin of a line behind its mark.
int EditText::HeldPlace(int valuePlace) const {
  const auto isAdded = [](char16_t unit) { return unit == u'\n' || IsLineMark(unit); };
  int before = text_.ShownPlace(valuePlace);
  std::size_t place = 0;
  for (; place < held_.size(); ++place)
    if (!isAdded(held_[place]) && before-- == 0) break;
  return static_cast<int>(place);
}

int EditText::ValuePlace(int heldPlace) const {
  const auto end = held_.begin() + std::clamp(heldPlace, 0, static_cast<int>(held_.size()));
  return text_.ValuePlace(static_cast<int>(
      std::count_if(held_.begin(), end, [](char16_t unit) { return unit != u'\r' && !IsLineMark(unit); })));
}

Text EditText::ValueOf(TextView held, bool ofManyLines) { return FieldText::ValueOf(held, ofManyLines); }

} // namespace quendra::forms::win32
