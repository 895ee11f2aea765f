#pragma once

#include "forms/controls/Line.h"
#include "forms/win32/views/WindowView.h"

namespace quendra::forms::win32 {

/// Its window reaches beyond the line, with room for half of a thick stroke, and lets the mouse through.
class LineView : public WindowView {
 public:
  LineView(ViewContext& context, Line& line, HWND parent);

  void Paint(Drawing& drawing) override;

 protected:
  std::optional<LRESULT> Answer(UINT message, WPARAM wParam, LPARAM lParam) override;
  void PutInPlace() override;

 private:
  const Line& TheLine() const { return static_cast<const Line&>(*TheControl()); }
};

} // namespace quendra::forms::win32
