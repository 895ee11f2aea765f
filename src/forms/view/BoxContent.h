#pragma once

#include "runtime/Text.h"

#include <vector>

namespace quendra::forms {

enum class BoxSign { None, Critical, Question, Exclamation, Information };

struct BoxButton {
  int number = 0; ///< the answer that it gives
  Text caption{};
  friend bool operator==(const BoxButton&, const BoxButton&) = default;
};

/// What a message box shows, as its flags want it.
struct BoxContent {
  Text title{};
  Text text{};
  BoxSign sign = BoxSign::None;
  bool rightToLeft = false;
  std::vector<BoxButton> buttons{};
  /// Has the focus when the box comes up.
  int defaultButton = 0;
  /// Pressed by Escape and the close box; 0 where they press none.
  int cancelButton = 0;
};

/// How much of a text a box shows at most, in code units.
inline constexpr std::size_t kMostBoxText = 4096;

BoxContent BoxContentOf(TextView text, int flags, TextView title);

} // namespace quendra::forms
