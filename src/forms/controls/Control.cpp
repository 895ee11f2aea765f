#include "forms/controls/Control.h"

#include "forms/Form.h"

#include <algorithm>
#include <utility>

namespace quendra::forms {

void TellChanged(Control& owner, Aspect aspect) {
  if (owner.view_) owner.view_->Changed(aspect);
}

Control::Control(Container& parent, Text name) : name_(std::move(name)), parent_(&parent) {
  parent.children_.push_back(this);
}

Control::~Control() {
  if (view_) {
    view_->control_ = nullptr;
    view_->ControlGone();
  }
  if (parent_) std::erase(parent_->children_, this);
}

const Form& Control::OwnerForm() const {
  const Control* top = this;
  while (top->parent_) top = top->parent_;
  return static_cast<const Form&>(*top);
}

Form& Control::OwnerForm() { return const_cast<Form&>(std::as_const(*this).OwnerForm()); }

bool Control::IsShown() const {
  for (const Control* control = this; control; control = control->parent_)
    if (!control->Visible()) return false;
  return true;
}

bool Control::IsUsable() const {
  for (const Control* control = this; control; control = control->parent_)
    if (!control->Visible() || !control->Enabled()) return false;
  return true;
}

void Control::BringToFront() {
  if (!parent_ || parent_->children_.back() == this) return;
  std::erase(parent_->children_, this);
  parent_->children_.push_back(this);
  TellChanged(*this, Aspect::Order);
}

ControlView::~ControlView() {
  if (control_) control_->view_ = nullptr;
}

void Control::Attach(ControlView* view) {
  if (view_) view_->control_ = nullptr;
  if (view && view->control_) view->control_->view_ = nullptr;
  view_ = view;
  if (view_) view_->control_ = this;
  TellChanged(*this, Aspect::All);
}

namespace {

void AddControlsIn(const Container& container, std::vector<Control*>& controls) {
  for (Control* child : container.Children()) {
    controls.push_back(child);
    if (const Container* inner = child->AsContainer()) AddControlsIn(*inner, controls);
  }
}

} // namespace

std::vector<Control*> ControlsIn(const Container& container) {
  std::vector<Control*> controls;
  AddControlsIn(container, controls);
  return controls;
}

} // namespace quendra::forms
