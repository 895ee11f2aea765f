#include "forms/view/LabelLook.h"

#include "forms/view/ControlPlacement.h"
#include "forms/view/Palette.h"
#include "forms/view/VisibleText.h"

#include <algorithm>

namespace quendra::forms {

namespace {

constexpr int kLinkRingRoom = 4;
constexpr int kTextInset = 8;

bool IsLink(const Label& label) { return label.Style() == Label::Look::Link; }
bool HasButtonFace(const Label& label) { return label.Style() == Label::Look::Button; }

Colour ButtonFill(const Label& label, const LabelState& state) {
  if (!state.enabled) return Palette::QuietPage;
  const Colour face = label.Transparent() ? Palette::Page : label.BackColour();
  if (!state.underMouse) return face;
  return Darker(face, state.heldDown ? 115 : 105);
}

} // namespace

LabelFace FaceOf(const Label& label, const LabelState& state) {
  if (HasButtonFace(label))
    return {ButtonFill(label, state), state.enabled ? Palette::StrongBorder : Palette::Border, 6};
  if (label.Transparent()) return {};
  return {label.BackColour(), {}, 0};
}

Colour InkOf(const Label& label, const LabelState& state) {
  if (!state.enabled) return Palette::QuietInk;
  return InkOr(label.ForeColour(), IsLink(label) ? Palette::Link : Palette::Ink);
}

LabelText TextOf(const Label& label) {
  LabelText set;
  set.text = VisibleText(label.Caption(), LineBreaks::Keep);
  set.direction = DirectionOf(set.text);
  set.align = HasButtonFace(label) ? Alignment::Centre : label.Align();
  set.underlined = IsLink(label) || label.TextFont().underline;
  set.wraps = label.WordWrap() || set.text.find(u'\n') != Text::npos;
  set.fromTop = set.wraps && !HasButtonFace(label);
  return set;
}

std::vector<Ring> RingsOf(const Label& label, const LabelState& state) {
  if (!state.hasFocus || !state.usesKeys) return {};
  if (IsLink(label)) return {{-2, 2, 4, Palette::Focus}};
  // The light line within sets the ring off from dark faces and pictures.
  return {{1, 2, 5, Palette::Focus}, {2.5, 1, 4, Palette::Page}};
}

Area RingedArea(const Label& label, Area place, Extent letters, Direction direction) {
  if (!IsLink(label)) return place;
  const Extent shown{std::min(letters.width, place.extent.width),
                     std::min(letters.height, place.extent.height)};
  return AlignedIn(SideOf(label.Align(), direction), shown, place);
}

int TextInset(const Label& label) {
  const bool underRing =
      label.IsButton() && label.Style() == Label::Look::Plain && label.Align() != Alignment::Centre;
  return underRing ? kTextInset : 0;
}

int RingRoom(const Label& label) { return IsLink(label) ? kLinkRingRoom : 0; }

} // namespace quendra::forms
