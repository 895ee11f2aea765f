#include "forms/suite/DesktopSuite.h"

namespace quendra::forms {

// Posted work, messages and the timers of the loop.

TEST_P(DesktopSuite, Posted_work_runs_in_order_at_the_next_pump) {
  std::string events;
  loop.Post([&] { events += 'a'; });
  loop.Post([&] { events += 'b'; });
  EXPECT_EQ(events, "");

  loop.PumpOnce();

  EXPECT_EQ(events, "ab");
}

TEST_P(DesktopSuite, One_pump_leaves_what_its_work_posted) {
  int runs = 0;
  std::function<void()> again = [&] {
    ++runs;
    loop.Post(again);
  };
  loop.Post(again);

  loop.PumpOnce();
  EXPECT_EQ(runs, 1);
  loop.PumpOnce();

  EXPECT_EQ(runs, 2);
}

TEST_P(DesktopSuite, Work_that_yields_lets_the_work_behind_it_run_first) {
  std::string order;
  loop.Post([&] {
    desktop.DoEvents();
    order += "first";
  });
  loop.Post([&] { order += "second "; });

  loop.PumpOnce();

  EXPECT_EQ(order, "second first");
}

TEST_P(DesktopSuite, DoEvents_handles_posted_work_at_once) {
  int runs = 0;
  for (int i = 0; i < 1000; ++i) {
    loop.Post([&] { ++runs; });
    desktop.DoEvents();
    ASSERT_EQ(runs, i + 1);
  }
}

TEST_P(DesktopSuite, A_message_reaches_its_window_after_what_was_posted_before) {
  std::vector<std::uint32_t> got;
  const WindowHandle window = desktop.Windows.Create();
  desktop.Windows.Replace(
      window, std::make_shared<WindowProcedure::element_type>(
                  [&](WindowHandle to, std::uint32_t message, std::uint32_t wParam, std::uint32_t lParam) {
                    EXPECT_EQ(to, window);
                    got.insert(got.end(), {message, wParam, lParam});
                    return 0;
                  }));

  loop.Post([&] { got.push_back(1); });
  loop.PostMessage(window, 32769, 5, 6);
  loop.Post([&] { got.push_back(2); });
  EXPECT_TRUE(got.empty());
  loop.PumpOnce();

  EXPECT_EQ(got, (std::vector<std::uint32_t>{1, 32769, 5, 6, 2}));
}

TEST_P(DesktopSuite, A_message_for_a_window_that_has_gone_is_lost) {
  int got = 0;
  const WindowHandle window = desktop.Windows.Create();
  desktop.Windows.Replace(
      window, std::make_shared<WindowProcedure::element_type>(
                  [&](WindowHandle, std::uint32_t, std::uint32_t, std::uint32_t) { return ++got; }));
  loop.PostMessage(window, 32769, 5, 6);

  desktop.Windows.Destroy(window);
  loop.PumpOnce();

  EXPECT_EQ(got, 0);
}

TEST_P(DesktopSuite, A_timer_ticks_until_its_subscription_goes) {
  int ticks = 0;
  auto timer = loop.StartTimer(1, [&] { ++ticks; });
  ASSERT_TRUE(user->WaitUntil([&] { return ticks >= 2; }));

  timer.reset();
  const int before = ticks;
  Pass(10);

  EXPECT_EQ(ticks, before);
}

TEST_P(DesktopSuite, A_tick_keeps_what_it_remembers) {
  int told = 0;
  const auto timer = loop.StartTimer(1, [&told, own = 0]() mutable { told = ++own; });

  EXPECT_TRUE(user->WaitUntil([&] { return told >= 3; }));
}

TEST_P(DesktopSuite, A_timer_may_end_in_its_own_tick) {
  int ticks = 0;
  std::unique_ptr<platform::EventLoop::Subscription> timer;
  timer = loop.StartTimer(1, [&] {
    ++ticks;
    timer.reset();
  });

  Pass(10);

  EXPECT_EQ(ticks, 1);
}

TEST_P(DesktopSuite,
       A_timer_that_another_replaces_in_its_tick_leaves_the_other_to_tick_in_a_box_opened_there) {
  SeenBox box;
  int ticks = 0;
  std::unique_ptr<platform::EventLoop::Subscription> timer;
  std::function<void()> tick = [&] {
    timer.reset();
    timer = loop.StartTimer(1, tick);
    const int number = ++ticks;
    if (number == 1) desktop.MessageBox(u"text", 0, u"title");
    if (number == 5) user->AnswerBox(box);
  };

  timer = loop.StartTimer(1, tick);

  ASSERT_TRUE(user->WaitUntil([&] { return box.count == 1; }));
  EXPECT_GE(ticks, 5);
}

TEST_P(DesktopSuite, A_subscription_may_outlive_its_desktop) {
  std::unique_ptr<platform::EventLoop::Subscription> timer;
  {
    const auto another = GetParam()();
    timer = another->Loop().StartTimer(1, [] {});
  }
  timer.reset();
}

// Timer controls.

TEST_P(DesktopSuite, A_Timer_ticks_while_it_is_enabled) {
  Timer timer(form, u"ReDrawTimer", 1, true);
  int ticks = 0;
  timer.Tick = [&] { ++ticks; };
  Pass(10);
  EXPECT_EQ(ticks, 0);
  desktop.Load(form);
  ASSERT_TRUE(user->WaitUntil([&] { return ticks >= 3; }));

  timer.Enabled = false;
  const int whenDisabled = ticks;
  Pass(20);

  EXPECT_EQ(ticks, whenDisabled);
}

TEST_P(DesktopSuite, A_Timer_with_interval_0_never_ticks) {
  Timer timer(form, u"timer", 0, true);
  int ticks = 0;
  timer.Tick = [&] { ++ticks; };
  desktop.Load(form);

  Pass(10);

  EXPECT_EQ(ticks, 0);
}

TEST_P(DesktopSuite, A_Timer_may_change_its_interval_and_stop_itself_inside_a_tick) {
  Timer timer(form, u"timer", 1, true);
  int ticks = 0;
  timer.Tick = [&] {
    timer.Interval = timer.Interval() + 1;
    if (++ticks == 3) timer.Enabled = false;
  };
  desktop.Load(form);
  ASSERT_TRUE(user->WaitUntil([&] { return ticks == 3; }));

  Pass(20);

  EXPECT_EQ(ticks, 3);
}

TEST_P(DesktopSuite, A_Timer_stops_when_its_form_unloads_and_starts_when_it_loads_again) {
  Timer timer(form, u"timer", 1, true);
  int ticks = 0;
  timer.Tick = [&] { ++ticks; };
  desktop.Load(other);
  desktop.Load(form);
  desktop.Unload(form);

  Pass(10);
  EXPECT_EQ(ticks, 0);
  desktop.Load(form);

  EXPECT_TRUE(user->WaitUntil([&] { return ticks > 0; }));
}

TEST_P(DesktopSuite, A_form_that_goes_while_it_is_loaded_leaves_no_timer_behind) {
  int ticks = 0;
  {
    TracedForm shortLived(u"frmShort", trace);
    Timer timer(shortLived, u"timer", 1, true);
    timer.Tick = [&] { ++ticks; };
    desktop.Load(shortLived);
  }

  Pass(10);

  EXPECT_EQ(ticks, 0);
}

} // namespace quendra::forms
