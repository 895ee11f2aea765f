#pragma once

#include "runtime/Text.h"

namespace quendra::shell {

/// The terms of use, paragraphs apart by CR LF.
Text AgreementText();

} // namespace quendra::shell
