#pragma once

#include "forms/Form.h"

namespace quendra::forms {

/// A form without a view, to lay controls on.
struct BareForm : Form {
  BareForm() : Form(u"frmBare") {}
  void Design() override {}
};

} // namespace quendra::forms
