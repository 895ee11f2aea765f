#include "forms/win32/views/LabelView.h"

#include "forms/view/VisibleText.h"

namespace quendra::forms::win32 {

LabelView::LabelView(ViewContext& context, Label& label, HWND parent) : WindowView(context, label) {
  Create(parent);
}

void LabelView::Apply(Aspect aspect) {
  if (aspect == Aspect::Look) PutInPlace();
}

void LabelView::PutInPlace() { MoveTo(Place().GrownBy(RingRoom(TheLabel()))); }

KeyUse LabelView::Use(const KeyPress& key) {
  if (!TheControl() || !PressesLabel(TheLabel(), key)) return KeyUse::Free;
  Press();
  return KeyUse::Done;
}

Text LabelView::TipAt(HWND /*window*/, Spot /*place*/) const {
  const LabelText set = TextOf(TheLabel());
  const int room = LabelPlace().extent.width - 2 * TextInset(TheLabel());
  const bool cut = !set.wraps && MeasureText(set.text, Letters(set.underlined)).width > room;
  return cut ? set.text : Text();
}

void LabelView::Paint(Drawing& drawing) {
  if (!TheControl()) return;
  const LabelState state = State();
  PaintFace(drawing, state);
  PaintText(drawing, state);
  PaintRings(drawing, state);
}

LabelState LabelView::State() const {
  return {IsEnabled(), IsUnderMouse(), IsHeldDown(), HasFocus(), UsesKeys()};
}

HFONT LabelView::Letters(bool underlined) const {
  Font font = TheLabel().TextFont();
  font.underline = underlined;
  return Context().fonts.FontOf(font, Context().scale);
}

Area LabelView::LabelPlace() const { return Area{{}, WindowPlace().extent}.GrownBy(-RingRoom(TheLabel())); }

void LabelView::PaintFace(Drawing& drawing, const LabelState& state) const {
  const LabelFace face = FaceOf(TheLabel(), state);
  if (!face.fill) return;
  if (!face.border) return drawing.Fill(LabelPlace(), *face.fill);
  drawing.RoundRect(LabelPlace(), face.corner, face.fill, face.border);
}

void LabelView::PaintText(Drawing& drawing, const LabelState& state) const {
  const LabelText set = TextOf(TheLabel());
  if (set.text.empty()) return;
  TextSetting setting;
  setting.direction = set.direction;
  setting.side = SideOf(set.align, ReadingDirection());
  setting.wraps = set.wraps;
  setting.fromTop = set.fromTop;
  const int inset = TextInset(TheLabel());
  Area place = LabelPlace();
  place.corner.left += inset;
  place.extent.width -= 2 * inset;
  drawing.Text(set.text, place, Letters(set.underlined), InkOf(TheLabel(), state), setting);
}

void LabelView::PaintRings(Drawing& drawing, const LabelState& state) const {
  const std::vector<Ring> rings = RingsOf(TheLabel(), state);
  if (rings.empty()) return;
  const HFONT font = Letters(false);
  const Text text = VisibleText(TheLabel().Caption(), LineBreaks::Keep);
  const Extent letters{MeasureText(text, font).width, Context().fonts.LineHeight(font)};
  drawing.Rings(RingedArea(TheLabel(), LabelPlace(), letters, ReadingDirection()), rings);
}

} // namespace quendra::forms::win32
