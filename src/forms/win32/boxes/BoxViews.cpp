#include "forms/win32/boxes/BoxViews.h"

#include "forms/view/Palette.h"

namespace quendra::forms::win32 {

namespace {

// All signs are drawn on a square of 40.

constexpr Colour kCriticalColour = Rgb(0xC6, 0x28, 0x28);
constexpr Colour kWarningColour = Rgb(0xF2, 0xA9, 0x1C);
constexpr Colour kQuietColour = Rgb(0x1B, 0x6E, 0xC2);

void DrawDisc(Drawing& drawing, Colour colour) { drawing.RoundRect({{2, 2}, {36, 36}}, 18, colour, {}); }

void DrawSign(Drawing& drawing, BoxSign sign, HFONT letters) {
  const auto write = [&](TextView mark, int top) {
    drawing.Text(mark, {{0, top}, {40, 40}}, letters, kWhite, {Direction::LeftToRight, Side::Middle});
  };
  switch (sign) {
  case BoxSign::None: return;
  case BoxSign::Critical:
    DrawDisc(drawing, kCriticalColour);
    drawing.Line({14, 14}, {26, 26}, kWhite, 4);
    drawing.Line({26, 14}, {14, 26}, kWhite, 4);
    return;
  case BoxSign::Exclamation:
    drawing.Triangle({{{20, 3}, {39, 37}, {1, 37}}}, kWarningColour);
    return write(u"!", 3);
  case BoxSign::Question: DrawDisc(drawing, kQuietColour); return write(u"?", 0);
  case BoxSign::Information: DrawDisc(drawing, kQuietColour); return write(u"i", 0);
  }
}

} // namespace

BoxSignView::BoxSignView(ViewContext& context, BoxSignControl& control, HWND parent)
    : WindowView(context, control), sign_(control.sign) {
  Create(parent);
}

void BoxSignView::Paint(Drawing& drawing) {
  const Font large{18, true, false};
  DrawSign(drawing, sign_, Context().fonts.FontOf(large, Context().scale));
}

BoxTextView::BoxTextView(ViewContext& context, BoxTextControl& control, HWND parent)
    : WindowView(context, control) {
  Create(parent);
}

void BoxTextView::TellName() {
  ::SetWindowTextW(Window(), winapi::Wide(static_cast<const BoxTextControl&>(*TheControl()).Caption()));
}

void BoxTextView::Paint(Drawing& drawing) {
  if (!TheControl()) return;
  const auto& lines = static_cast<const BoxTextControl&>(*TheControl()).lines;
  const HFONT font = Context().fonts.FontOf(TheControl()->TextFont(), Context().scale);
  const int lineHeight = Context().fonts.LineHeight(font);
  const Extent room = WindowPlace().extent;
  const Side side = SideOf(Alignment::Leading, ReadingDirection());
  // A short text stands beside the middle of the sign.
  int top = (room.height - MeasureLines(lines, font, room.width, lineHeight).height) / 2;
  for (const BoxLine& line : lines) {
    const int height = MeasureLines({line}, font, room.width, lineHeight).height;
    drawing.Text(line.text, {{0, top}, {room.width, height}}, font, Palette::Ink,
                 {line.direction, side, true, true});
    top += height;
  }
}

MadeView MakeBoxView(ViewContext& context, Control& control, HWND parent) {
  if (auto* sign = dynamic_cast<BoxSignControl*>(&control)) {
    auto view = std::make_unique<BoxSignView>(context, *sign, parent);
    WindowView* const window = view.get();
    return {std::move(view), window};
  }
  if (auto* text = dynamic_cast<BoxTextControl*>(&control)) {
    auto view = std::make_unique<BoxTextView>(context, *text, parent);
    WindowView* const window = view.get();
    return {std::move(view), window};
  }
  return MakeView(context, control, parent);
}

} // namespace quendra::forms::win32
