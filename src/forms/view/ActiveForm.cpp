#include "forms/view/ActiveForm.h"

#include <utility>

namespace quendra::forms {

void ActiveForm::Activate(Form& form) {
  if (form_ == &form) return;
  Form* const before = std::exchange(form_, &form);
  if (before) before->Form_Deactivate();
  // That handler may have made another the active one, or unloaded this one.
  if (form_ == &form) form.Form_Activate();
}

void ActiveForm::Deactivate(Form& form) {
  if (form_ != &form) return;
  form_ = nullptr;
  form.Form_Deactivate();
}

void ActiveForm::Forget(const Control& form) {
  if (form_ == &form) form_ = nullptr;
}

} // namespace quendra::forms
