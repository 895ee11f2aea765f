#pragma once

#include "forms/view/Area.h"
#include "forms/view/Ring.h"

#include <vector>

namespace quendra::forms {

// What fields for text look like. All lengths are pixels.

struct FieldState {
  bool enabled = true; ///< with all its containers
  bool readOnly = false;
  bool hasFocus = false;
  /// The last thing that the user took in hand was the keyboard.
  bool usesKeys = false;
};

struct FieldFace {
  Colour fill = kWhite;
  Colour border = kBlack; ///< of one pixel
  int corner = 0;
};
FieldFace FaceOf(const FieldState& state);

/// The ring, in the order in which it is drawn, for those who use the keys.
std::vector<Ring> RingsOf(const FieldState& state);

/// Pixels between the edge of a field and its text.
inline constexpr int kFieldPadding = 6;

/// How many letters lie between the places that a tab goes to.
inline constexpr int kLettersOfTab = 8;

} // namespace quendra::forms
