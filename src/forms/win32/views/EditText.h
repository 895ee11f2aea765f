#pragma once

#include "forms/view/fields/FieldText.h"

namespace quendra::forms::win32 {

/// The text of a field as an EDIT window holds it, and what stands where in both: a line break has two
/// characters there, however it is written in the field, and lines may have marks of their direction.
class EditText {
 public:
  enum class Lines { One, Many, Marked };
  EditText(TextView value, Lines lines);

  const Text& Held() const { return held_; }
  int HeldPlace(int valuePlace) const;
  int ValuePlace(int heldPlace) const;
  /// What the user has made of a held text.
  static Text ValueOf(TextView held, bool ofManyLines);

 private:
  FieldText text_;
  Text held_;
};

} // namespace quendra::forms::win32
