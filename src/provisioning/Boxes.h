#pragma once

#include "forms/MessageLoop.h"
#include "foundation/Wording.h"

namespace quendra::provisioning {

/// A box that says that something failed, and no more.
inline void TellFailure(forms::MessageLoop& boxes, const char16_t* text) {
  boxes.MessageBox(text, forms::kCritical | forms::kHebrewBox, foundation::kTitle);
}

} // namespace quendra::provisioning
