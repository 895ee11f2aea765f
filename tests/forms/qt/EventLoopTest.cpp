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

} // namespace quendra::forms::qt
