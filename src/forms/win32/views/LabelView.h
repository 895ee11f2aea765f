#pragma once

#include "forms/view/LabelLook.h"
#include "forms/win32/views/WindowView.h"

namespace quendra::forms::win32 {

class LabelView : public WindowView {
 public:
  LabelView(ViewContext& context, Label& label, HWND parent);

  void Paint(Drawing& drawing) override;
  KeyUse Use(const KeyPress& key) override;
  Text TipAt(HWND window, Spot place) const override;

 protected:
  void Apply(Aspect aspect) override;
  void PutInPlace() override;

 private:
  const Label& TheLabel() const { return static_cast<const Label&>(*TheControl()); }
  LabelState State() const;
  HFONT Letters(bool underlined) const;
  /// Where the control lies. A link's window reaches beyond it, with room for its ring.
  Area LabelPlace() const;
  void PaintFace(Drawing& drawing, const LabelState& state) const;
  void PaintText(Drawing& drawing, const LabelState& state) const;
  void PaintRings(Drawing& drawing, const LabelState& state) const;
};

} // namespace quendra::forms::win32
