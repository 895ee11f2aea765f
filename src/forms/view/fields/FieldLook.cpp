#include "forms/view/fields/FieldLook.h"

#include "forms/view/Palette.h"

namespace quendra::forms {

FieldFace FaceOf(const FieldState& state) {
  constexpr int kCorner = 6;
  FieldFace face{Palette::Page, Palette::StrongBorder, kCorner};
  if (!state.enabled || state.readOnly) face.fill = Palette::QuietPage;
  if (!state.enabled) face.border = Palette::Border;
  if (state.enabled && state.hasFocus) face.border = Palette::Focus;
  return face;
}

std::vector<Ring> RingsOf(const FieldState& state) {
  if (!state.hasFocus || !state.usesKeys) return {};
  return {{1, 2, 5, Palette::Focus}};
}

} // namespace quendra::forms
