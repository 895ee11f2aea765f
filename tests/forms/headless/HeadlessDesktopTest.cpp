#include "forms/headless/HeadlessDesktopFixture.h"

// The dispatcher, boxes, yields, the loop and time.

namespace quendra::forms::headless {
namespace {

using Lines = std::vector<std::string>;

TEST_F(HeadlessDesktopTest, Nothing_is_dispatched_after_the_end) {
  int ran = 0;
  desktop.Dispatch([&] { desktop.End(3); });

  desktop.Post([&] { ++ran; });
  desktop.RunUntilIdle();
  form.timer.Tick = [&] { ++ran; };
  form.timer.Enabled = true;
  desktop.Advance(100);
  EXPECT_FALSE(desktop.Click(form.label));

  EXPECT_EQ(desktop.EndStatus, 3);
  EXPECT_EQ(ran, 0);
}

TEST_F(HeadlessDesktopTest, Boxes_are_answered_as_scripted_and_with_1_beyond_the_script) {
  desktop.AnswerNextBox(7);
  desktop.AnswerNextBox(6);

  EXPECT_EQ(desktop.MessageBox(u"a", 4, u"t"), 7);
  EXPECT_EQ(desktop.MessageBox(u"b", 4, u"t"), 6);
  EXPECT_EQ(desktop.MessageBox(u"c", kHebrewBox, u"t"), 1);
  EXPECT_EQ(desktop.Boxes[2], (HeadlessDesktop::Box{u"c", 0x180000, u"t"}));
}

TEST_F(HeadlessDesktopTest, A_yield_is_counted_and_runs_what_was_posted) {
  Lines order;
  desktop.Post([&] { order.push_back("posted"); });
  desktop.OnYield = [&] { order.push_back("yield"); };

  desktop.DoEvents();

  EXPECT_EQ(order, (Lines{"yield", "posted"}));
  EXPECT_EQ(desktop.YieldCount, 1);
}

TEST_F(HeadlessDesktopTest, The_yield_script_is_not_run_within_itself) {
  int scripted = 0;
  desktop.OnYield = [&] {
    ++scripted;
    desktop.DoEvents();
  };

  desktop.DoEvents();
  desktop.DoEvents();

  EXPECT_EQ(scripted, 2);
  EXPECT_EQ(desktop.YieldCount, 4);
}

TEST_F(HeadlessDesktopTest, Work_that_posts_itself_for_ever_is_found_out) {
  std::function<void()> again = [&] { desktop.Post(again); };
  again();

  EXPECT_THROW(desktop.RunUntilIdle(), std::runtime_error);
}

TEST_F(HeadlessDesktopTest, Timers_tick_in_the_order_of_their_times) {
  Lines order;
  auto slow = desktop.StartTimer(30, [&] { order.push_back("slow " + std::to_string(desktop.Now())); });
  auto fast = desktop.StartTimer(20, [&] { order.push_back("fast " + std::to_string(desktop.Now())); });

  desktop.Advance(70);

  EXPECT_EQ(order, (Lines{"fast 20", "slow 30", "fast 40", "slow 60", "fast 60"}));
  EXPECT_EQ(desktop.Now(), 70);
}

TEST_F(HeadlessDesktopTest, A_timer_whose_subscription_went_ticks_no_more) {
  int ticks = 0;
  auto timer = desktop.StartTimer(10, [&] { ++ticks; });
  desktop.Advance(20);
  timer.reset();

  desktop.Advance(100);

  EXPECT_EQ(ticks, 2);
}

TEST_F(HeadlessDesktopTest, A_Timer_ticks_while_it_is_enabled) {
  int ticks = 0;
  form.timer.Tick = [&] { ++ticks; };

  desktop.Advance(100);
  EXPECT_EQ(ticks, 0);
  form.timer.Enabled = true;
  desktop.Advance(25);
  EXPECT_EQ(ticks, 2);
  form.timer.Enabled = false;
  desktop.Advance(100);

  EXPECT_EQ(ticks, 2);
}

TEST_F(HeadlessDesktopTest, A_Timer_may_change_its_interval_and_stop_itself_inside_a_tick) {
  Lines ticks;
  form.timer.Tick = [&] {
    ticks.push_back(std::to_string(desktop.Now()));
    form.timer.Interval = 25;
    if (ticks.size() == 3) form.timer.Enabled = false;
  };
  form.timer.Enabled = true;

  desktop.Advance(200);

  EXPECT_EQ(ticks, (Lines{"10", "35", "60"}));
}

TEST_F(HeadlessDesktopTest, A_modal_form_stands_as_long_as_its_script_runs) {
  MainForm dialog;
  Form* shown = nullptr;
  desktop.OnModal = [&](Form& standing) { shown = &standing; };

  desktop.Show(dialog, Modality::Modal, &form);

  EXPECT_EQ(shown, &dialog);
  EXPECT_EQ(desktop.CountOf("Show frmMenu modal owner frmMenu"), 1);
}

TEST_F(HeadlessDesktopTest, A_box_stands_as_long_as_its_script_runs) {
  std::size_t boxes = 0;
  desktop.OnBox = [&] { boxes = desktop.Boxes.size(); };
  desktop.AnswerNextBox(7);

  EXPECT_EQ(desktop.MessageBox(u"text", 0, u"title"), 7);

  EXPECT_EQ(boxes, 1U);
}

} // namespace
} // namespace quendra::forms::headless
