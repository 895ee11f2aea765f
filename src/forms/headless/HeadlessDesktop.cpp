#include "forms/headless/HeadlessDesktop.h"

#include "forms/loop/TimerView.h"
#include "forms/view/FocusOrder.h"
#include "forms/view/fields/Typing.h"

#include <algorithm>

namespace quendra::forms::headless {

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
  Control* Focused() const {
    // It may have gone since.
    const std::vector<Control*> controls = ControlsIn(*form_);
    const auto found = std::find(controls.begin(), controls.end(), focused_);
    return found == controls.end() ? nullptr : *found;
  }
  void SetFocus(const Control* control) { focused_ = control; }
  /// This object goes too.
  void ControlGone() override { desktop_.Forget(*std::exchange(form_, nullptr)); }

 private:
  void Visit(ComboBox& /*combo*/) override {}
  void Visit(Frame& /*frame*/) override {}
  void Visit(Image& /*image*/) override {}
  void Visit(ImageList& /*images*/) override {}
  void Visit(Label& /*label*/) override {}
  void Visit(Line& /*line*/) override {}
  void Visit(ListBox& /*list*/) override {}
  void Visit(ListView& /*list*/) override {}
  void Visit(PictureBox& box) override { boxes_.push_back(&box); }
  void Visit(TextBox& /*box*/) override {}
  void Visit(Timer& timer) override {
    timers_.push_back(std::make_unique<TimerView>(timer, [this](int milliseconds, auto tick) {
      return desktop_.StartTimer(milliseconds, std::move(tick));
    }));
    timer.Attach(timers_.back().get());
  }

  HeadlessDesktop& desktop_;
  Form* form_;
  const Control* focused_ = nullptr;
  std::vector<std::unique_ptr<TimerView>> timers_;
  std::vector<const PictureBox*> boxes_;
};

HeadlessDesktop::HeadlessDesktop()
    : dispatcher_([this](const Text& text) { ShowBox(text, kCritical, u"Quendra"); },
                  [this](int status) {
                    Ended = true;
                    EndStatus = status;
                  }) {}

HeadlessDesktop::~HeadlessDesktop() = default;

int HeadlessDesktop::CountOf(const std::string& call) const {
  return static_cast<int>(std::count(Calls.begin(), Calls.end(), call));
}

void HeadlessDesktop::Dispatch(const std::function<void()>& work) {
  {
    const Inside handler(handlers_);
    dispatcher_.Dispatch(work);
  }
  if (handlers_ == 0) EndWithoutForms();
}

// After what the handler does next: a program that shows another form at once goes on.
void HeadlessDesktop::LastFormGone() {
  if (handlers_ == 0) End(0);
  lastFormWent_ = true;
  Post([this] { EndWithoutForms(); });
}

void HeadlessDesktop::EndWithoutForms() {
  if (std::exchange(lastFormWent_, false) && views_.empty()) dispatcher_.Quit(0);
}

void HeadlessDesktop::ShowBox(const Text& text, int flags, const Text& title) {
  Boxes.push_back({text, flags, title});
  if (OnBox) OnBox();
}

int HeadlessDesktop::MessageBox(const Text& text, int flags, const Text& title) {
  {
    const Standing box(*this);
    ShowBox(text, flags, title);
  }
  dispatcher_.UnwindIfEnded();
  if (answers_.empty()) return 1;
  const int answer = answers_.front();
  answers_.pop_front();
  return answer;
}

void HeadlessDesktop::DoEvents() {
  ++YieldCount;
  if (OnYield && !yielding_) {
    const Inside script(yielding_);
    Dispatch(OnYield);
  }
  PumpOnce();
  dispatcher_.UnwindIfEnded();
}

std::uint32_t HeadlessDesktop::RegisterWindowMessageA(const std::string& name) {
  Record("RegisterWindowMessageA " + name);
  return FailRegisterWindowMessage ? 0 : Windows.RegisterMessage(name);
}

CursorHandle HeadlessDesktop::LoadCursor(int id) {
  Record("LoadCursor " + std::to_string(id));
  return CursorHandleToGive;
}

void HeadlessDesktop::SetCursor(CursorHandle cursor) {
  Record("SetCursor " + std::to_string(cursor.Value()));
}

WindowHandle HeadlessDesktop::HandleOf(Form& form) {
  const auto found = windows_.find(&form);
  return found == windows_.end() ? kNoWindow : found->second;
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
  return Windows.Dispatch(window, message, wParam, lParam);
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

bool HeadlessDesktop::SetWindowPos(WindowHandle window, InsertAfter insertAfter, int x, int y, int cx, int cy,
                                   unsigned flags) {
  std::string call = "SetWindowPos " + NameOfWindow(window);
  for (const int number : {static_cast<int>(insertAfter), x, y, cx, cy, static_cast<int>(flags)})
    call += " " + std::to_string(number);
  Record(std::move(call));
  return windowNames_.contains(window) && (flags & kKeepsSize) != 0;
}

void HeadlessDesktop::Repaint(Control& control) { Record("Repaint " + ToUtf8(control.Name())); }

void HeadlessDesktop::CreateView(Form& form) {
  using Procedure = WindowProcedure::element_type;
  const WindowHandle window = Windows.Add(std::make_shared<Procedure>([](auto...) { return 0; }));
  windows_[&form] = window;
  windowNames_[window] = ToUtf8(form.Name());
  views_[&form] = std::make_unique<FormView>(*this, form);
}

void HeadlessDesktop::DestroyView(Form& form) { Forget(form); }

void HeadlessDesktop::Forget(const Form& form) {
  active_.Forget(form);
  if (const auto window = windows_.extract(&form)) Windows.Remove(window.mapped());
  const auto view = views_.extract(&form);
}

void HeadlessDesktop::ShowView(Form& form, Modality modality, Form* owner) {
  Record("Show " + ToUtf8(form.Name()) + (modality == Modality::Modal ? " modal" : "") +
         (owner ? " owner " + ToUtf8(owner->Name()) : ""));
  if (!Focused(form)) MoveFocus(form, FirstFocus(form));
  active_.Activate(form);
  if (modality == Modality::Modeless || !OnModal) return;
  OnModal(form);
  dispatcher_.UnwindIfEnded();
}

Control* HeadlessDesktop::Focused(const Form& form) const {
  const auto view = views_.find(&form);
  return view == views_.end() ? nullptr : view->second->Focused();
}

void HeadlessDesktop::MoveFocus(const Form& form, Control* to) {
  const auto view = views_.find(&form);
  if (view == views_.end() || view->second->Focused() == to) return;
  view->second->SetFocus(to);
  if (TextEntry* field = to ? FieldOf(*to) : nullptr) field->GotFocus();
}

} // namespace quendra::forms::headless
