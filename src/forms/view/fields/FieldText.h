#pragma once

#include "runtime/Text.h"

namespace quendra::forms {

/// The text of a field as it is shown, and what stands where in both. A field of many lines shows a line
/// break as one character and keeps tabs; one of a single line makes both visible.
class FieldText {
 public:
  FieldText(TextView value, bool ofManyLines) : value_(value), ofManyLines_(ofManyLines) {}

  Text Shown() const;
  int ShownPlace(int place) const;
  int ValuePlace(int shownPlace) const;
  /// What the user has made of a shown text.
  static Text ValueOf(TextView shown, bool ofManyLines);

 private:
  bool IsShown(std::size_t unit) const { return !ofManyLines_ || value_[unit] != u'\r'; }

  TextView value_;
  bool ofManyLines_;
};

} // namespace quendra::forms
