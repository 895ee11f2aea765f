#include "forms/headless/HeadlessDesktop.h"

#include "runtime/Fault.h"

#include <algorithm>

namespace quendra::forms::headless {

/// Keeps the alarm of a Timer control in step with its properties.
class HeadlessDesktop::TimerView : public ControlView {
 public:
  TimerView(HeadlessDesktop& desktop, Timer& timer)
      : desktop_(desktop), timer_(&timer), alarm_(desktop.AddAlarm([&timer] { timer.Tick(); })) {
    timer.Attach(this);
  }
  ~TimerView() override {
    if (timer_) timer_->Attach(nullptr);
  }
  void Changed(Aspect aspect) override {
    if (aspect != Aspect::All && aspect != Aspect::Timer && aspect != Aspect::Enabled) return;
    desktop_.SetAlarm(*alarm_, timer_->Enabled() ? timer_->Interval() : 0);
  }
  void ControlGone() override {
    timer_ = nullptr;
    alarm_.reset();
  }

 private:
  HeadlessDesktop& desktop_;
  Timer* timer_;
  std::shared_ptr<Alarm> alarm_;
};

class HeadlessDesktop::FormView : public ControlView, private ControlVisitor {
 public:
  FormView(HeadlessDesktop& desktop, Form& form) : desktop_(desktop), form_(&form) {
    form.Attach(this);
    for (Control* control : ControlsIn(form)) control->Accept(*this);
  }
  ~FormView() override {
    for (const PictureBox* box : boxes_) desktop_.drawings_.erase(box);
    if (form_) form_->Attach(nullptr);
  }
  void Changed(Aspect) override {}
  /// This object goes too.
  void ControlGone() override { desktop_.Forget(*std::exchange(form_, nullptr)); }

 private:
  void Visit(ComboBox& /*combo*/) override {}
  void Visit(Frame& /*frame*/) override {}
  void Visit(Image& /*image*/) override {}
  void Visit(ImageList& /*images*/) override {}
  void Visit(Label& /*label*/) override {}
  void Visit(Line& /*line*/) override {}
  void Visit(ListView& /*list*/) override {}
  void Visit(PictureBox& box) override { boxes_.push_back(&box); }
  void Visit(Timer& timer) override { timers_.push_back(std::make_unique<TimerView>(desktop_, timer)); }

  HeadlessDesktop& desktop_;
  Form* form_;
  std::vector<std::unique_ptr<TimerView>> timers_;
  std::vector<const PictureBox*> boxes_;
};

HeadlessDesktop::HeadlessDesktop() = default;
HeadlessDesktop::~HeadlessDesktop() = default;

int HeadlessDesktop::CountOf(const std::string& call) const {
  return static_cast<int>(std::count(Calls.begin(), Calls.end(), call));
}

void HeadlessDesktop::Dispatch(const std::function<void()>& work) {
  if (Ended) return;
  try {
    work();
  } catch (const ProgramEnded&) {
    // Kept in Ended by End.
  } catch (const Fault& fault) {
    Boxes.push_back({u"Run-time error '" + DecimalText(fault.number) + u"':\n\n" + fault.description,
                     kCritical, u"Quendra"});
    Ended = true;
    EndStatus = 1;
  }
}

void HeadlessDesktop::End(int status) {
  if (!Ended) EndStatus = status;
  Ended = true;
  throw ProgramEnded{EndStatus};
}

int HeadlessDesktop::MessageBox(const Text& text, int flags, const Text& title) {
  Boxes.push_back({text, flags, title});
  if (OnBox) {
    const Standing box(*this);
    OnBox();
    if (Ended) throw ProgramEnded{EndStatus};
  }
  if (answers_.empty()) return 1;
  const int answer = answers_.front();
  answers_.pop_front();
  return answer;
}

void HeadlessDesktop::DoEvents() {
  ++YieldCount;
  if (OnYield && !yielding_) {
    struct Inside {
      bool& flag;
      explicit Inside(bool& yielding) : flag(yielding) { flag = true; }
      ~Inside() { flag = false; }
    } inside(yielding_);
    Dispatch(OnYield);
  }
  PumpOnce();
  if (Ended) throw ProgramEnded{EndStatus};
}

CursorHandle HeadlessDesktop::LoadCursor(int id) {
  Record("LoadCursor " + std::to_string(id));
  return CursorHandleToGive;
}

void HeadlessDesktop::SetCursor(CursorHandle cursor) {
  Record("SetCursor " + std::to_string(cursor.Value()));
}

WindowHandle HeadlessDesktop::HandleOf(Form& form) {
  const auto [place, isNew] =
      windows_.try_emplace(&form, WindowHandle(static_cast<std::uint32_t>(windowNames_.size() + 1)));
  if (isNew) windowNames_[place->second] = ToUtf8(form.Name());
  return place->second;
}

std::string HeadlessDesktop::NameOfWindow(WindowHandle window) const {
  const auto found = windowNames_.find(window);
  return found == windowNames_.end() ? std::to_string(window.Value()) : found->second;
}

void HeadlessDesktop::ReleaseCapture() { Record("ReleaseCapture"); }

std::int32_t HeadlessDesktop::SendMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                                          std::uint32_t lParam) {
  Record("SendMessage " + NameOfWindow(window) + " 0x" + ToUtf8(HexText(message)) + " " +
         std::to_string(wParam) + " " + std::to_string(lParam));
  return 0;
}

RegionHandle HeadlessDesktop::CreateRoundRectRgn(int left, int top, int right, int bottom, int ellipseWidth,
                                                 int ellipseHeight) {
  std::string call = "CreateRoundRectRgn";
  for (const int number : {left, top, right, bottom, ellipseWidth, ellipseHeight})
    call += " " + std::to_string(number);
  Record(std::move(call));
  return RegionHandle(++lastRegion_);
}

void HeadlessDesktop::SetWindowRgn(WindowHandle window, RegionHandle region, bool redraw) {
  Record("SetWindowRgn " + NameOfWindow(window) + " " + std::to_string(region.Value()) + " " +
         (redraw ? "1" : "0"));
}

void HeadlessDesktop::CreateView(Form& form) { views_[&form] = std::make_unique<FormView>(*this, form); }

void HeadlessDesktop::DestroyView(Form& form) { Forget(form); }

void HeadlessDesktop::Forget(const Form& form) {
  if (active_ == &form) active_ = nullptr;
  windows_.erase(&form);
  const auto view = views_.extract(&form);
}

void HeadlessDesktop::ShowView(Form& form, Modality modality, Form* owner) {
  Record("Show " + ToUtf8(form.Name()) + (modality == Modality::Modal ? " modal" : "") +
         (owner ? " owner " + ToUtf8(owner->Name()) : ""));
  Form* const before = active_;
  if (before && before != &form) before->Form_Deactivate();
  active_ = &form;
  if (before != &form) form.Form_Activate();
  if (modality == Modality::Modal && OnModal) OnModal(form);
}

} // namespace quendra::forms::headless
