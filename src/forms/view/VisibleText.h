#pragma once

#include "forms/view/Direction.h"
#include "runtime/Text.h"

namespace quendra::forms {

enum class LineBreaks { Keep, Show };

/// The text as it can be shown without harm: control characters, direction marks and broken code units become
/// visible signs, and what goes beyond `limit` code units is cut with an ellipsis. Line breaks stay or are
/// made visible too.
Text VisibleText(TextView text, LineBreaks lineBreaks = LineBreaks::Show, std::size_t limit = 1024);

/// Right to left for a text whose first letter is Hebrew, left to right for any other: addresses, paths and
/// names keep their order, also with Hebrew in them.
Direction DirectionOf(TextView text);

/// The text set apart from its surroundings when it reads from left to right, for views that lay out by
/// themselves.
Text Isolated(TextView text);

} // namespace quendra::forms
