#pragma once

#include "forms/controls/Label.h"
#include "forms/view/Area.h"
#include "forms/view/Direction.h"
#include "forms/view/Ring.h"

#include <optional>
#include <vector>

namespace quendra::forms {

// What labels look like: as text, as links and as buttons. All lengths are pixels.

/// What a view knows of a label beside the label itself.
struct LabelState {
  bool enabled = true; ///< with all its containers
  bool underMouse = false;
  bool heldDown = false; ///< by the left button
  bool hasFocus = false;
  /// The last thing that the user took in hand was the keyboard.
  bool usesKeys = false;
};

struct LabelFace {
  /// None lets what lies below shine through.
  std::optional<Colour> fill{};
  /// A line of one pixel; only buttons have it.
  std::optional<Colour> border{};
  int corner = 0;
};
LabelFace FaceOf(const Label& label, const LabelState& state);

Colour InkOf(const Label& label, const LabelState& state);

/// How the caption is set.
struct LabelText {
  Text text{};
  Direction direction = Direction::LeftToRight;
  Alignment align = Alignment::Leading;
  bool underlined = false;
  /// On more than one line. A text that doesn't is cut with an ellipsis.
  bool wraps = false;
  /// Else it stands half way down.
  bool fromTop = false;
};
LabelText TextOf(const Label& label);

/// The ring in the order in which it is drawn; none where it isn't shown. It is for those who use the keys: a
/// window gives the focus to its first control when it comes up.
std::vector<Ring> RingsOf(const Label& label, const LabelState& state);

/// What the ring goes round: the label, or the letters of a link, which may take up a small part of it.
Area RingedArea(const Label& label, Area place, Extent letters, Direction direction);

/// How far a text keeps from the sides of its label: a text that acts as a button and stands at a side would
/// lie under the ring.
int TextInset(const Label& label);

/// How far a label's view reaches beyond the label on each side: a ring within would cover the letters of a
/// link, which is as wide as its text.
int RingRoom(const Label& label);

} // namespace quendra::forms
