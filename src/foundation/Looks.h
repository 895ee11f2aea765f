#pragma once

#include "forms/controls/Controls.h"
#include "foundation/Twips.h"

/// Colours and letter sizes that the forms share.
namespace quendra::foundation::looks {

inline constexpr forms::Colour kLime = forms::Rgb(162, 233, 93);
/// The foot of the main window, as its background picture has it.
inline constexpr forms::Colour kFoot = forms::Rgb(205, 243, 168);
inline constexpr forms::Colour kForest = forms::Rgb(24, 61, 16);
inline constexpr forms::Colour kLeaf = forms::Rgb(46, 125, 50);
inline constexpr forms::Colour kPaper = forms::Rgb(250, 253, 247);
inline constexpr forms::Colour kInk = forms::Rgb(33, 37, 41);
inline constexpr forms::Colour kQuiet = forms::Rgb(90, 105, 84);
inline constexpr forms::Colour kAlert = forms::Rgb(176, 42, 24);

inline constexpr forms::Font kBody{10, false, false};
inline constexpr forms::Font kStrong{10, true, false};
inline constexpr forms::Font kSmall{9, false, false};
inline constexpr forms::Font kHeading{15, true, false};
inline constexpr forms::Font kEntry{12, true, false};
inline constexpr forms::Font kFigure{14, true, false};

/// A plain text that lets what lies under it shine through.
inline void PlainText(forms::Label& label, const char16_t* caption, forms::Font font,
                      forms::Colour colour = kInk) {
  label.Caption = Text(caption);
  label.TextFont = font;
  label.ForeColour = colour;
  label.Transparent = true;
}

inline void Link(forms::Label& label, const char16_t* caption, forms::Font font,
                 forms::Colour colour = kForest) {
  PlainText(label, caption, font, colour);
  label.Style = forms::Label::Look::Link;
}

/// A button that nothing answers to is shown disabled until its form gives it a handler.
inline void Button(forms::Label& label, const char16_t* caption) {
  PlainText(label, caption, kBody);
  label.Style = forms::Label::Look::Button;
  label.Align = forms::Alignment::Centre;
  label.Enabled = static_cast<bool>(label.Click);
}

/// The one button of a page that leads on.
inline void LeadingButton(forms::Label& label, const char16_t* caption) {
  Button(label, caption);
  label.TextFont = kStrong;
  label.ForeColour = forms::kWhite;
  label.BackColour = kLeaf;
  label.Transparent = false;
}

/// The title of a page of this width and the link that leaves the page.
inline void PageHead(forms::Label& title, forms::Label& back, const char16_t* caption, int pageWidth) {
  PlainText(title, caption, kHeading, kForest);
  title.Move(Px(20), Px(14), Px(400), Px(32));
  Link(back, u"חזרה", kBody);
  back.Align = forms::Alignment::Trailing;
  back.Move(pageWidth - Px(120), Px(20), Px(100), Px(22));
}

} // namespace quendra::foundation::looks
