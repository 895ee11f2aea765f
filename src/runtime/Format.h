#pragma once

#include "runtime/Text.h"

namespace quendra {

/// A number in a format of "#" and "0" places with an optional point, as in u"###00.00": "0" pads, "#"
/// doesn't, a comma between places parts all digits before the point in threes, digits beyond the format's
/// width are kept. Rounds half away from zero on the number's decimal form. Values that are not finite raise
/// fault 6.
Text Format(double value, TextView format);

/// The number that a text holds (blanks around it allowed, a point, an exponent); fault 13 when it holds
/// none.
double NumberOf(TextView text);

/// The shortest decimal text that stands for a double, to 15 significant digits.
Text NumberText(double value);

} // namespace quendra
