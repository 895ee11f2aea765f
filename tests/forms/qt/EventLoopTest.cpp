#include "forms/qt/QtFixture.h"

#include <QAbstractEventDispatcher>

#include <ctime>
#include <thread>

#include <unistd.h>

namespace quendra::forms::qt {

namespace {

std::int64_t CoarseNow() {
  timespec now{};
  clock_gettime(CLOCK_MONOTONIC_COARSE, &now);
  return now.tv_sec * 1'000'000'000LL + now.tv_nsec;
}

std::int64_t CoarseStep() {
  timespec step{};
  clock_getres(CLOCK_MONOTONIC_COARSE, &step);
  return step.tv_sec * 1'000'000'000LL + step.tv_nsec;
}

} // namespace

class EventLoop : public QtFixture {};

TEST_F(EventLoop, Posted_work_runs_in_order_at_the_next_pump) {
  std::string events;
  desktop.Post([&] { events += 'a'; });
  desktop.Post([&] { events += 'b'; });
  EXPECT_EQ(events, "");

  desktop.PumpOnce();

  EXPECT_EQ(events, "ab");
}

TEST_F(EventLoop, DoEvents_handles_posted_work_at_once) {
  int runs = 0;
  for (int i = 0; i < 1000; ++i) {
    desktop.Post([&] { ++runs; });
    desktop.DoEvents();
    ASSERT_EQ(runs, i + 1);
  }
}

TEST_F(EventLoop, DoEvents_asks_the_toolkit_no_oftener_than_the_coarse_clock_moves) {
  int pumps = 0;
  const auto counting = QObject::connect(QAbstractEventDispatcher::instance(),
                                         &QAbstractEventDispatcher::awake, [&] { ++pumps; });
  const std::int64_t start = CoarseNow();

  for (int i = 0; i < 200'000; ++i) desktop.DoEvents();

  QObject::disconnect(counting);
  EXPECT_LE(pumps, (CoarseNow() - start) / CoarseStep() + 1);
}

TEST_F(EventLoop, DoEvents_sees_what_comes_from_outside_when_the_coarse_clock_has_moved) {
  int ends[2];
  ASSERT_EQ(pipe(ends), 0);
  bool ready = false;
  const auto watch = desktop.WatchDescriptor(ends[0], [&] { ready = true; });
  desktop.PumpOnce();
  ASSERT_EQ(write(ends[1], "x", 1), 1);

  for (int moves = 0; moves < 3; ++moves) {
    for (const std::int64_t before = CoarseNow(); CoarseNow() == before;) {
    }
    desktop.DoEvents();
  }

  EXPECT_TRUE(ready);
  close(ends[0]);
  close(ends[1]);
}

TEST_F(EventLoop, Work_that_posts_itself_again_lets_a_pump_end) {
  int runs = 0;
  std::function<void()> again = [&] {
    ++runs;
    desktop.Post(again);
  };
  desktop.Post(again);

  desktop.PumpOnce();

  EXPECT_EQ(runs, 1);
  desktop.PumpOnce();
  EXPECT_EQ(runs, 2);
}

TEST_F(EventLoop, Work_posted_by_another_thread_runs_on_the_loops_thread) {
  std::thread::id ranOn;
  std::thread worker([&] { desktop.Post([&] { ranOn = std::this_thread::get_id(); }); });
  worker.join();

  desktop.DoEvents();

  EXPECT_EQ(ranOn, std::this_thread::get_id());
}

TEST_F(EventLoop, Posts_of_many_threads_all_run) {
  int runs = 0;
  std::vector<std::thread> workers;
  for (int i = 0; i < 4; ++i)
    workers.emplace_back([&] {
      for (int k = 0; k < 500; ++k) desktop.Post([&] { ++runs; });
    });
  for (std::thread& worker : workers) worker.join();

  desktop.PumpOnce();

  EXPECT_EQ(runs, 2000);
}

TEST_F(EventLoop, A_descriptor_is_told_as_long_as_it_can_be_read) {
  int ends[2];
  ASSERT_EQ(pipe(ends), 0);
  int calls = 0;
  auto watch = desktop.WatchDescriptor(ends[0], [&] { ++calls; });
  desktop.PumpOnce();
  EXPECT_EQ(calls, 0);
  ASSERT_EQ(write(ends[1], "x", 1), 1);

  desktop.PumpOnce();
  desktop.PumpOnce();
  EXPECT_GE(calls, 2);

  watch.reset();
  const int before = calls;
  desktop.PumpOnce();
  EXPECT_EQ(calls, before);
  close(ends[0]);
  close(ends[1]);
}

TEST_F(EventLoop, A_watch_can_end_from_within_its_own_call) {
  int ends[2];
  ASSERT_EQ(pipe(ends), 0);
  int calls = 0;
  std::unique_ptr<platform::EventLoop::Subscription> watch;
  watch = desktop.WatchDescriptor(ends[0], [&] {
    ++calls;
    watch.reset();
  });
  ASSERT_EQ(write(ends[1], "x", 1), 1);

  desktop.PumpOnce();
  desktop.PumpOnce();

  EXPECT_EQ(calls, 1);
  close(ends[0]);
  close(ends[1]);
}

TEST_F(EventLoop, A_timer_ticks_until_its_subscription_goes) {
  int ticks = 0;
  auto timer = desktop.StartTimer(1, [&] { ++ticks; });
  ASSERT_TRUE(RunUntil([&] { return ticks >= 2; }));

  timer.reset();
  const int before = ticks;
  bool passed = false;
  const auto after = desktop.StartTimer(10, [&] { passed = true; });
  ASSERT_TRUE(RunUntil([&] { return passed; }));

  EXPECT_EQ(ticks, before);
}

TEST_F(EventLoop, A_timer_that_another_replaces_in_its_tick_leaves_the_other_to_tick_in_a_box_opened_there) {
  Box box;
  int ticks = 0;
  std::unique_ptr<platform::EventLoop::Subscription> timer;
  std::function<void()> tick = [&] {
    timer.reset();
    timer = desktop.StartTimer(1, tick);
    const int number = ++ticks;
    if (number == 1) desktop.MessageBox(u"text", 0, u"title");
    if (number == 5) AnswerBox(box);
  };

  timer = desktop.StartTimer(1, tick);

  ASSERT_TRUE(RunUntil([&] { return box.count == 1; }));
  EXPECT_GE(ticks, 5);
}

TEST_F(EventLoop, It_tells_how_many_boxes_and_modal_forms_stand) {
  std::vector<int> depths;
  Box box;
  desktop.Post([&] {
    depths.push_back(desktop.ModalDepth());
    desktop.Post([&] {
      depths.push_back(desktop.ModalDepth());
      AnswerBox(box);
    });
    desktop.MessageBox(u"text", 0, u"title");
    depths.push_back(desktop.ModalDepth());
    form.Visible = false;
  });

  desktop.Show(form, Modality::Modal);
  depths.push_back(desktop.ModalDepth());

  EXPECT_EQ(depths, (std::vector<int>{1, 2, 1, 0}));
}

TEST_F(EventLoop, Pumping_is_no_modal_loop) {
  int depth = -1;
  desktop.Post([&] { depth = desktop.ModalDepth(); });

  desktop.DoEvents();

  EXPECT_EQ(depth, 0);
}

TEST_F(EventLoop, A_subscription_may_outlive_its_desktop) {
  std::unique_ptr<platform::EventLoop::Subscription> timer;
  {
    QtDesktop other("other");
    timer = other.StartTimer(1, [] {});
  }
  timer.reset();
}

} // namespace quendra::forms::qt
