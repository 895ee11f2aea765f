#include "forms/headless/HeadlessDesktop.h"
#include "forms/suite/DesktopSuite.h"

namespace quendra::forms::headless {
namespace {

/// The user of a desktop without a screen: what stands lets the clock run until somebody answers.
class HeadlessDriver : public DesktopDriver {
 public:
  HeadlessDriver() {
    desktop_.OnBox = [this] { AnswerWhatStands(); };
    desktop_.OnModal = [this](Form& form) {
      EXPECT_TRUE(WaitUntil([&] { return desktop_.Ended || !form.Visible(); }));
    };
  }

  Desktop& TheDesktop() override { return desktop_; }
  platform::EventLoop& Loop() override { return desktop_; }

  int Run(std::function<void()> start) override {
    desktop_.Post(std::move(start));
    return WaitUntil([this] { return desktop_.Ended; }) ? desktop_.EndStatus : -1;
  }
  bool WaitUntil(const std::function<bool()>& condition) override {
    for (int waited = 0; waited < kMostMilliseconds; ++waited) {
      if (condition()) return true;
      desktop_.Advance(1);
    }
    return condition();
  }

  void Click(Control& control) override { desktop_.Click(control); }
  void PressKey(Form& form, int keyCode, int shift) override { desktop_.PressKey(form, keyCode, shift); }
  void PressCloseBox(Form& form) override { desktop_.CloseBox(form); }
  void AnswerBox(SeenBox& seen, int button) override { answers_.push_back({&seen, button}); }

  bool Stands(Form& form) override { return form.IsLoaded() && form.Visible(); }
  const Control* Focused(Form& form) override { return desktop_.Focused(form); }

 private:
  static constexpr int kMostMilliseconds = 5000;
  struct Answer {
    SeenBox* seen;
    int button;
  };

  void AnswerWhatStands() {
    const HeadlessDesktop::Box box = desktop_.Boxes.back();
    EXPECT_TRUE(WaitUntil([this] { return desktop_.Ended || !answers_.empty(); }));
    if (answers_.empty()) return;
    const Answer answer = answers_.front();
    answers_.pop_front();
    *answer.seen = {BoxContentOf(box.text, box.flags, box.title), answer.seen->count + 1};
    desktop_.AnswerNextBox(answer.button);
  }

  HeadlessDesktop desktop_;
  std::deque<Answer> answers_;
};

std::unique_ptr<DesktopDriver> MakeDriver() { return std::make_unique<HeadlessDriver>(); }

} // namespace
} // namespace quendra::forms::headless

namespace quendra::forms {
INSTANTIATE_TEST_SUITE_P(Headless, DesktopSuite, testing::Values(&headless::MakeDriver));
} // namespace quendra::forms
