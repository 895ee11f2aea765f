#include "forms/win32/views/ViewFactory.h"

#include "forms/win32/views/ComboBoxView.h"
#include "forms/win32/views/FrameView.h"
#include "forms/win32/views/ImageView.h"
#include "forms/win32/views/LabelView.h"
#include "forms/win32/views/LineView.h"
#include "forms/win32/views/ListBoxView.h"
#include "forms/win32/views/PictureBoxView.h"
#include "forms/win32/views/TextAreaView.h"
#include "forms/win32/views/TextLineView.h"
#include "forms/win32/views/list/ListViewView.h"

namespace quendra::forms::win32 {

namespace {

/// Makes the view of the control that it visits.
class Maker : public ControlVisitor {
 public:
  Maker(ViewContext& context, HWND parent) : context_(context), parent_(parent) {}
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
  void Visit(Timer& timer) override {
    Made = {std::make_unique<TimerView>(timer, context_.startTimer), nullptr};
  }

 private:
  template <typename KindView, typename Kind> void Make(Kind& control) {
    auto view = std::make_unique<KindView>(context_, control, parent_);
    WindowView* const window = view.get();
    Made = {std::move(view), window};
  }

  ViewContext& context_;
  HWND parent_;
};

} // namespace

MadeView MakeView(ViewContext& context, Control& control, HWND parent) {
  Maker maker(context, parent);
  control.Accept(maker);
  return std::move(maker.Made);
}

} // namespace quendra::forms::win32
