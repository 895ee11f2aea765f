#include "forms/view/Accessible.h"

#include "forms/controls/Controls.h"
#include "forms/view/VisibleText.h"

namespace quendra::forms {

namespace {

Text CaptionOf(const Frame& frame) { return Text(Trimmed(VisibleText(frame.Caption()))); }

bool IsEnabled(const Control& control) {
  for (const Control* outer = &control; outer; outer = outer->Parent())
    if (!outer->Enabled()) return false;
  return true;
}

Text NameOfFrame(const Control& control) {
  const auto* frame = dynamic_cast<const Frame*>(control.Parent());
  return frame ? CaptionOf(*frame) : Text();
}

/// The text nearest before a control in its container.
Text LabelBefore(const Control& control) {
  Text nearest;
  for (const Control* sibling : control.Parent()->Children()) {
    if (sibling == &control) break;
    const auto* label = dynamic_cast<const Label*>(sibling);
    if (label && !label->IsButton() && !label->Caption().empty()) nearest = VisibleText(label->Caption());
  }
  return nearest;
}

Text NameOfField(const Control& control, const Text& description) {
  if (!description.empty()) return VisibleText(description);
  const Text label = LabelBefore(control);
  return label.empty() ? NameOfFrame(control) : label;
}

/// Gives the control that it visits its role and name.
class Describer : public ControlVisitor {
 public:
  Accessible Description{};

  // It has no caption of its own; that of the frame around it tells what is chosen here.
  void Visit(ComboBox& combo) override {
    Description.name = combo.FreeText ? NameOfField(combo, combo.Description) : NameOfFrame(combo);
  }
  void Visit(Frame& frame) override {
    Description.role = Role::Grouping;
    Description.name = CaptionOf(frame);
  }
  void Visit(Image& image) override { VisitPicture(image); }
  void Visit(ImageList& /*images*/) override {}
  void Visit(Label& label) override {
    const Text& caption = label.Caption();
    Description.role = label.IsButton() ? Role::Button : Role::Text;
    Description.name = VisibleText(caption.empty() ? label.Description : caption, LineBreaks::Keep);
  }
  void Visit(Line& /*line*/) override { Description.role = Role::Separator; }
  void Visit(ListBox& list) override { Description.name = NameOfField(list, list.Description); }
  void Visit(ListView& list) override { Description.name = VisibleText(list.Description); }
  void Visit(PictureBox& box) override { VisitPicture(box); }
  void Visit(TextBox& box) override { Description.name = NameOfField(box, box.Description); }
  void Visit(Timer& /*timer*/) override {}

 private:
  void VisitPicture(const Control& picture) {
    Description.role = picture.Click ? Role::Button : Role::Graphic;
    // It says nothing of itself, and goes by the title of the window that it fills or stands in.
    if (picture.Click) Description.name = VisibleText(picture.OwnerForm().Caption());
  }
};

} // namespace

Accessible AccessibleOf(Control& control) {
  Describer describer;
  control.Accept(describer);
  Accessible& told = describer.Description;
  if (!control.Parent()) told = {Role::Window, VisibleText(control.OwnerForm().Caption()), {}};
  told.description = control.Name();
  return told;
}

Text AccessibleNameOf(const ColumnHeader& column) {
  return VisibleText(column.caption.empty() ? column.description : column.caption);
}

bool OffersPress(Control& control) {
  return IsEnabled(control) && AccessibleOf(control).role == Role::Button;
}

} // namespace quendra::forms
