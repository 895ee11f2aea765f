#include "forms/qt/views/ViewFactory.h"

#include "forms/qt/views/ComboBoxView.h"
#include "forms/qt/views/FrameView.h"
#include "forms/qt/views/ImageView.h"
#include "forms/qt/views/LabelView.h"
#include "forms/qt/views/LineView.h"
#include "forms/qt/views/ListBoxView.h"
#include "forms/qt/views/ListViewView.h"
#include "forms/qt/views/PictureBoxView.h"
#include "forms/qt/views/TextAreaView.h"
#include "forms/qt/views/TextLineView.h"

namespace quendra::forms::qt {

namespace {

/// Makes the view of the control that it visits.
class ViewMaker : public ControlVisitor {
 public:
  ViewMaker(ViewContext& context, QWidget& parent) : context_(context), parent_(parent) {}
  MadeView Made;

  void Visit(ComboBox& combo) override { Make<ComboBoxView>(combo); }
  void Visit(Frame& frame) override { Make<FrameView>(frame); }
  void Visit(Image& image) override { Make<ImageView>(image); }
  void Visit(ImageList& /*images*/) override {} // lists show its pictures
  void Visit(Label& label) override { Make<LabelView>(label); }
  void Visit(Line& line) override { Make<LineView>(line); }
  void Visit(ListBox& list) override { Make<ListBoxView>(list); }
  void Visit(ListView& list) override { Make<ListViewView>(list); }
  void Visit(PictureBox& box) override { Make<PictureBoxView>(box); }
  void Visit(TextBox& box) override {
    if (box.MultiLine)
      Make<TextAreaView>(box);
    else
      Make<TextLineView>(box);
  }
  void Visit(Timer& timer) override { Made = {new TimerView(timer, context_.startTimer), nullptr}; }

 private:
  template <typename KindView, typename Kind> void Make(Kind& control) {
    auto* view = new KindView(context_, control, &parent_);
    Made = {view, view};
  }

  ViewContext& context_;
  QWidget& parent_;
};

} // namespace

MadeView MakeView(ViewContext& context, Control& control, QWidget& parent) {
  ViewMaker maker(context, parent);
  control.Accept(maker);
  return maker.Made;
}

} // namespace quendra::forms::qt
