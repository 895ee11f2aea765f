#pragma once

#include "forms/Form.h"

namespace quendra::forms {

/// The form of a desktop that the user works in. A toolkit may tell of the new active window before the old
/// one: forms hear the old one go first, and each of both no oftener than it changes.
class ActiveForm {
 public:
  void Activate(Form& form);
  void Deactivate(Form& form);
  /// The form, of which no more than the control may be left, goes and hears nothing any more.
  void Forget(const Control& form);
  bool Is(const Form& form) const { return form_ == &form; }

 private:
  Form* form_ = nullptr;
};

} // namespace quendra::forms
