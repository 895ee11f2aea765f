#include "forms/FormHost.h"

#include <optional>

namespace quendra::forms {

void FormHost::Load(Form& form) {
  if (form.loaded_) return;
  form.loaded_ = true;
  ++loadedForms_;
  form.Tag = {};
  form.Design();
  form.Visible = false;
  CreateView(form);
  form.Form_Load();
}

void FormHost::Show(Form& form, Modality modality, Form* owner) {
  Load(form);
  form.Visible = true;
  std::optional<Standing> standing;
  if (modality == Modality::Modal) standing.emplace(*this);
  ShowView(form, modality, owner);
}

void FormHost::Unload(Form& form) {
  if (!form.loaded_ || form.unloading_) return;
  form.unloading_ = true;
  try {
    form.Form_Unload();
  } catch (...) {
    form.unloading_ = false;
    throw;
  }
  form.unloading_ = false;
  form.Visible = false;
  DestroyView(form);
  form.loaded_ = false;
  if (--loadedForms_ == 0) LastFormGone();
}

} // namespace quendra::forms
