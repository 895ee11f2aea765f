#pragma once

#include "foundation/Looks.h"

/// What the two steps of the page look like alike.
namespace quendra::provisioning::steps {

using namespace foundation::looks;
using foundation::Px;

/// A little darker than white, so that a row that turns white stands out.
inline constexpr forms::Colour kStepGround = forms::Rgb(238, 246, 231);

// Pixels from the right edge of a step.
inline constexpr int kFieldsLeft = 26;
inline constexpr int kFieldsWidth = 340;
inline constexpr int kChoiceLeft = 412;

inline void StepFrame(forms::Frame& frame, const forms::Geometry& place) {
  frame.Caption = Text();
  frame.Border = true;
  frame.BackColour = kStepGround;
  frame.Visible = false;
  frame.Position = place;
}

inline void StepTitle(forms::Label& title, const char16_t* caption) {
  PlainText(title, caption, kEntry, kForest);
  title.Move(Px(kFieldsLeft), Px(22), Px(kFieldsWidth), Px(28));
}

inline void ChoicePrompt(forms::Label& prompt, const char16_t* caption) {
  PlainText(prompt, caption, kStrong);
  prompt.Move(Px(kChoiceLeft), Px(24), Px(kFieldsWidth), Px(24));
}

/// A field with its prompt above it, emptied; below it is room for a mark.
inline void StepField(forms::Label& prompt, const char16_t* caption, forms::TextBox& field, int top) {
  PlainText(prompt, caption, kBody);
  prompt.Move(Px(kFieldsLeft), Px(top), Px(kFieldsWidth), Px(22));
  field.Value = Text();
  field.TextFont = kBody;
  field.Move(Px(kFieldsLeft), Px(top + 24), Px(kFieldsWidth), Px(30));
}

/// The mark below a field that stands at `top`.
inline void ErrorMark(forms::Label& mark, int top) {
  PlainText(mark, u"", kStrong, forms::kRed);
  mark.Visible = false;
  mark.Move(Px(kFieldsLeft), Px(top + 56), Px(kFieldsWidth), Px(22));
}

/// The button that ends a step, on its plate at the foot of the fields.
inline void StepButton(forms::PictureBox& plate, const char* artwork, forms::CommandButton& button,
                       const char16_t* caption, int stepHeight) {
  constexpr int kPlateWidth = 300;
  constexpr int kPlateHeight = 64;
  plate.Contents = forms::Picture::Artwork(artwork);
  plate.BackColour = kStepGround;
  plate.Move(Px(kFieldsLeft), stepHeight - Px(kPlateHeight + 26), Px(kPlateWidth), Px(kPlateHeight));
  LeadingButton(button, caption);
  button.Enabled = false;
  button.Move(Px(72), Px(13), Px(kPlateWidth - 86), Px(kPlateHeight - 26));
}

} // namespace quendra::provisioning::steps
