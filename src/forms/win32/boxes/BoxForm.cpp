#include "forms/win32/boxes/BoxForm.h"

#include "forms/view/Palette.h"
#include "forms/win32/drawing/Drawing.h"

#include <algorithm>

namespace quendra::forms::win32 {

namespace {

// Pixels.
constexpr int kSide = 20;
constexpr int kTop = 18;
constexpr int kBottom = 16;
constexpr int kSignSide = 40;
constexpr int kBesideSign = 16;
constexpr int kBetween = 14;
constexpr int kLeastWidth = 340; ///< room for the title of a short box
constexpr int kMostTextWidth = 420;
constexpr int kMostFieldWidth = 640;
constexpr int kButtonWidth = 88;
constexpr int kButtonHeight = 30;
constexpr int kBesideCaption = 16;
constexpr int kBetweenButtons = 8;
/// What a box needs beside and above its text, its frame included.
constexpr Extent kAroundText{140, 180};
/// What a field needs beside and above its lines.
constexpr Extent kInField{36, 14};

} // namespace

Extent MeasureLines(const std::vector<BoxLine>& lines, HFONT font, int width, int lineHeight) {
  Extent taken;
  for (const BoxLine& line : lines) {
    const Extent one = MeasureText(line.text, font, width);
    taken.width = std::max(taken.width, one.width);
    taken.height += std::max(one.height, lineHeight);
  }
  return taken;
}

BoxForm::BoxForm(const BoxContent& content, ViewContext& context, Extent screen)
    : Form(u"box"), content_(content), answer_(content.defaultButton) {
  Caption = content.title;
  RightToLeft = content.rightToLeft;
  Border = BorderStyle::FixedDialog;
  BackColour = Palette::Page;
  PutSign(context);
  PutText(context, screen);
  PutButtons(context);
  Move(0, 0, context.scale.TwipsX(inside_.width), context.scale.TwipsY(inside_.height));
  Visible = true;
}

void BoxForm::Place(Control& control, Area area, const Scale& scale) {
  control.Move(scale.TwipsX(area.corner.left), scale.TwipsY(area.corner.top), scale.TwipsX(area.extent.width),
               scale.TwipsY(area.extent.height));
}

void BoxForm::PutSign(ViewContext& context) {
  sign_.sign = content_.sign;
  sign_.Visible = content_.sign != BoxSign::None;
  textLeft_ = sign_.Visible() ? kSide + kSignSide + kBesideSign : kSide;
  Place(sign_, {{kSide, kTop}, {kSignSide, kSignSide}}, context.scale);
}

void BoxForm::PutText(ViewContext& context, Extent screen) {
  text_.Caption = content_.text;
  text_.lines = LinesOf(content_);
  const HFONT font = context.fonts.FontOf(text_.TextFont(), context.scale);
  const int lineHeight = context.fonts.LineHeight(font);
  const Extent most{std::min(kMostTextWidth, screen.width - kAroundText.width),
                    screen.height - kAroundText.height};
  Extent taken = MeasureLines(text_.lines, font, most.width, lineHeight);
  const bool fits = taken.width <= most.width && taken.height <= most.height;
  text_.Visible = fits;
  field_.Visible = !fits;
  if (!fits) {
    const int width = std::min(kMostFieldWidth, screen.width - kAroundText.width);
    taken = MeasureLines(text_.lines, font, width - kInField.width, lineHeight);
    // A word that is longer than a line is broken, which this measure doesn't know.
    const int letters = taken.width > width ? lineHeight * (taken.width / width) : 0;
    taken = {width, std::clamp(taken.height + letters + kInField.height, lineHeight, most.height)};
    field_.MultiLine = field_.ReadOnly = field_.VerticalScrollBar = true;
    field_.Description = content_.title;
    Text shown;
    for (const BoxLine& line : text_.lines) (shown += shown.empty() ? u"" : u"\r\n") += line.text;
    field_.Value = shown;
  }
  const int height = std::max(taken.height, sign_.Visible() ? kSignSide : 0);
  const Area place{{textLeft_, kTop}, {std::max(taken.width, kLeastWidth - textLeft_ - kSide), height}};
  Place(text_, place, context.scale);
  Place(field_, place, context.scale);
  inside_ = {place.Right() + kSide, place.Bottom() + kBetween + kButtonHeight + kBottom};
}

void BoxForm::PutButtons(ViewContext& context) {
  int right = inside_.width - kSide;
  for (const BoxButton& wanted : content_.buttons)
    buttons_.push_back(std::make_unique<CommandButton>(*this, DecimalText(wanted.number)));
  for (std::size_t i = buttons_.size(); i-- > 0;) {
    const BoxButton& wanted = content_.buttons[i];
    CommandButton& button = *buttons_[i];
    button.Caption = wanted.caption;
    button.TabIndex = wanted.number == content_.defaultButton ? -1 : 0;
    button.Click = [this, number = wanted.number] { AnswerBy(number); };
    if (wanted.number == content_.defaultButton) Default = &button;
    if (wanted.number == content_.cancelButton) Cancel = &button;
    const HFONT font = context.fonts.FontOf(button.TextFont(), context.scale);
    const int width = std::max(kButtonWidth, MeasureText(wanted.caption, font).width + 2 * kBesideCaption);
    Place(button, {{right - width, inside_.height - kBottom - kButtonHeight}, {width, kButtonHeight}},
          context.scale);
    right -= width + kBetweenButtons;
  }
}

void BoxForm::AnswerBy(int button) {
  if (button == 0) return;
  answer_ = button;
  Visible = false;
}

} // namespace quendra::forms::win32
