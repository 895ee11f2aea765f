#include "forms/qt/views/ViewFactory.h"

#include "forms/qt/views/ComboBoxView.h"
#include "forms/qt/views/FrameView.h"
#include "forms/qt/views/ImageView.h"
#include "forms/qt/views/LabelView.h"
#include "forms/qt/views/LineView.h"
#include "forms/qt/views/ListViewView.h"
#include "forms/qt/views/PictureBoxView.h"
#include "forms/qt/views/TimerView.h"

namespace quendra::forms::qt {

namespace {

template <typename Kind, typename KindView>
bool MakeIf(ViewContext& context, Control& control, QWidget& parent, MadeView& made) {
  auto* kind = dynamic_cast<Kind*>(&control);
  if (!kind) return false;
  auto* view = new KindView(context, *kind, &parent);
  made = {view, view};
  return true;
}

} // namespace

MadeView MakeView(ViewContext& context, Control& control, QWidget& parent) {
  MadeView made;
  if (auto* timer = dynamic_cast<Timer*>(&control)) return {new TimerView(context, *timer), nullptr};
  static_cast<void>(MakeIf<Label, LabelView>(context, control, parent, made) ||
                    MakeIf<Frame, FrameView>(context, control, parent, made) ||
                    MakeIf<Line, LineView>(context, control, parent, made) ||
                    MakeIf<Image, ImageView>(context, control, parent, made) ||
                    MakeIf<PictureBox, PictureBoxView>(context, control, parent, made) ||
                    MakeIf<ComboBox, ComboBoxView>(context, control, parent, made) ||
                    MakeIf<ListView, ListViewView>(context, control, parent, made));
  return made;
}

} // namespace quendra::forms::qt
