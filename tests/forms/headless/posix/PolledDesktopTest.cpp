#include "forms/headless/posix/PolledDesktop.h"

#include <gtest/gtest.h>

#include <unistd.h>

#include <thread>

namespace quendra::forms::headless {
namespace {

struct PolledDesktopTest : testing::Test {
  PolledDesktop desktop;
};

TEST_F(PolledDesktopTest, A_post_from_another_thread_arrives) {
  bool arrived = false;
  std::thread worker([&] { desktop.Post([&] { arrived = true; }); });

  EXPECT_TRUE(desktop.WaitFor([&] { return arrived; }, 5000));
  worker.join();
}

TEST_F(PolledDesktopTest, A_watched_descriptor_is_called_as_long_as_it_can_be_read) {
  int ends[2];
  ASSERT_EQ(pipe(ends), 0);
  int calls = 0;
  auto watch = desktop.WatchDescriptor(ends[0], [&] { ++calls; });

  desktop.PumpOnce();
  EXPECT_EQ(calls, 0);
  ASSERT_EQ(write(ends[1], "x", 1), 1);
  desktop.PumpOnce();
  desktop.PumpOnce();
  EXPECT_EQ(calls, 2);
  watch.reset();
  desktop.PumpOnce();

  EXPECT_EQ(calls, 2);
  close(ends[0]);
  close(ends[1]);
}

TEST_F(PolledDesktopTest, A_watch_may_be_dropped_by_its_own_handler) {
  int ends[2];
  ASSERT_EQ(pipe(ends), 0);
  ASSERT_EQ(write(ends[1], "x", 1), 1);
  int calls = 0;
  std::unique_ptr<platform::EventLoop::Subscription> watch;
  watch = desktop.WatchDescriptor(ends[0], [&] {
    ++calls;
    watch.reset();
  });

  desktop.RunUntilIdle();

  EXPECT_EQ(calls, 1);
  close(ends[0]);
  close(ends[1]);
}

TEST_F(PolledDesktopTest, Waiting_in_vain_gives_up) {
  EXPECT_FALSE(desktop.WaitFor([] { return false; }, 1));
}

TEST_F(PolledDesktopTest, Work_that_is_posted_during_a_pump_waits_for_the_next_one) {
  int ran = 0;
  desktop.Post([&] { desktop.Post([&] { ++ran; }); });

  desktop.PumpOnce();
  EXPECT_EQ(ran, 0);
  desktop.PumpOnce();

  EXPECT_EQ(ran, 1);
}

TEST_F(PolledDesktopTest, A_descriptor_that_can_be_read_is_served_after_what_was_posted) {
  int ends[2];
  ASSERT_EQ(pipe(ends), 0);
  ASSERT_EQ(write(ends[1], "x", 1), 1);
  std::string order;
  const auto watch = desktop.WatchDescriptor(ends[0], [&] { order += "descriptor "; });
  desktop.Post([&] { order += "posted "; });

  desktop.PumpOnce();

  EXPECT_EQ(order, "posted descriptor ");
  close(ends[0]);
  close(ends[1]);
}

} // namespace
} // namespace quendra::forms::headless
