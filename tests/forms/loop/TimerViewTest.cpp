#include "forms/loop/TimerView.h"

#include "forms/Form.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

struct TimedForm : Form {
  TimedForm() : Form(u"frmTimed") {}
  void Design() override {}
};

/// A loop with room for one timer, which ticks when the test says so.
struct TimerViewTest : testing::Test {
  TimerViewTest() { timer->Attach(&view); }

  std::shared_ptr<void> Start(int milliseconds, std::function<void()> tick) {
    started.push_back(milliseconds);
    Tick = std::move(tick);
    auto running = std::make_shared<int>(milliseconds);
    alive = running;
    return running;
  }
  bool Runs() const { return !alive.expired(); }

  TimedForm form;
  std::unique_ptr<Timer> timer = std::make_unique<Timer>(form, u"timer", 10, false);
  TimerView view{*timer, [this](int milliseconds, auto tick) { return Start(milliseconds, tick); }};
  std::vector<int> started;
  std::weak_ptr<void> alive;
  std::function<void()> Tick;
};

TEST_F(TimerViewTest, The_loops_timer_runs_while_the_control_is_enabled) {
  EXPECT_FALSE(Runs());
  timer->Enabled = true;
  EXPECT_TRUE(Runs());
  timer->Enabled = false;

  EXPECT_FALSE(Runs());
  EXPECT_EQ(started, std::vector<int>{10});
}

TEST_F(TimerViewTest, A_tick_of_the_loop_ticks_the_control) {
  int ticks = 0;
  timer->Tick = [&] { ++ticks; };
  timer->Enabled = true;

  Tick();

  EXPECT_EQ(ticks, 1);
}

TEST_F(TimerViewTest, Another_interval_starts_anew_even_within_a_tick) {
  timer->Tick = [this] { timer->Interval = 25; };
  timer->Enabled = true;

  const auto tick = Tick;
  tick();

  EXPECT_EQ(started, (std::vector<int>{10, 25}));
  EXPECT_TRUE(Runs());
}

TEST_F(TimerViewTest, No_interval_is_no_timer) {
  timer->Interval = 0;

  timer->Enabled = true;
  timer->Interval = -5;

  EXPECT_TRUE(started.empty());
}

TEST_F(TimerViewTest, Properties_that_do_not_concern_time_leave_it_running) {
  timer->Enabled = true;

  timer->Tag = u"changed";
  timer->Visible = false;

  EXPECT_EQ(started.size(), 1U);
  EXPECT_TRUE(Runs());
}

TEST_F(TimerViewTest, It_stops_when_it_is_released_and_when_its_control_goes) {
  timer->Enabled = true;
  view.Release();
  EXPECT_FALSE(Runs());
  EXPECT_EQ(timer->View(), nullptr);

  TimerView other(*timer, [this](int milliseconds, auto tick) { return Start(milliseconds, tick); });
  timer->Attach(&other);
  EXPECT_TRUE(Runs());
  timer.reset();

  EXPECT_FALSE(Runs());
}

} // namespace
} // namespace quendra::forms
