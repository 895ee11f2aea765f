#include "forms/loop/Dispatcher.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

namespace quendra::forms {
namespace {

struct DispatcherTest : testing::Test {
  std::vector<std::string> happened;
  std::function<void()> whileTheFaultIsShown;
  Dispatcher dispatcher{[this](const Text& text) {
                          happened.push_back("shown " + ToUtf8(text));
                          if (whileTheFaultIsShown) whileTheFaultIsShown();
                        },
                        [this](int status) { happened.push_back("left " + std::to_string(status)); }};
};

using Happened = std::vector<std::string>;

TEST_F(DispatcherTest, A_handler_that_returns_leaves_the_program_running) {
  int ran = 0;

  dispatcher.Dispatch([&] { ++ran; });

  EXPECT_EQ(ran, 1);
  EXPECT_FALSE(dispatcher.Ended());
  EXPECT_NO_THROW(dispatcher.UnwindIfEnded());
}

TEST_F(DispatcherTest, An_end_unwinds_the_handler_and_leaves_the_loops_with_its_status) {
  bool wentOn = false;

  dispatcher.Dispatch([&] {
    dispatcher.End(3);
    wentOn = true;
  });

  EXPECT_FALSE(wentOn);
  EXPECT_TRUE(dispatcher.Ended());
  EXPECT_EQ(dispatcher.Status(), 3);
  EXPECT_EQ(happened, Happened{"left 3"});
}

TEST_F(DispatcherTest, The_first_status_stands) {
  dispatcher.Quit(2);

  dispatcher.Quit(5);

  EXPECT_EQ(dispatcher.Status(), 2);
  EXPECT_EQ(happened, Happened{"left 2"});
}

TEST_F(DispatcherTest, A_fault_is_shown_and_ends_the_program_with_status_1) {
  dispatcher.Dispatch([] { throw Fault(Fault::kOverflow); });

  EXPECT_EQ(dispatcher.Status(), 1);
  EXPECT_EQ(happened, (Happened{"shown Run-time error '6':\n\nOverflow", "left 1"}));
}

TEST_F(DispatcherTest, Exhausted_memory_is_fault_7_and_a_fault_of_the_library_51) {
  dispatcher.Dispatch([] { throw std::bad_alloc(); });
  EXPECT_EQ(happened.at(0), "shown Run-time error '7':\n\nOut of memory");

  Dispatcher other([&](const Text& text) { happened.push_back(ToUtf8(text)); }, [](int) {});
  other.Dispatch([] { throw std::runtime_error("broken"); });

  EXPECT_EQ(happened.back(), "Run-time error '51':\n\nInternal error: broken");
}

TEST_F(DispatcherTest, No_handler_runs_while_the_fault_is_shown_or_after_it) {
  int ran = 0;
  whileTheFaultIsShown = [&] { dispatcher.Dispatch([&] { ++ran; }); };

  dispatcher.Dispatch([] { throw Fault(Fault::kDivision); });
  dispatcher.Dispatch([&] { ++ran; });

  EXPECT_EQ(ran, 0);
}

TEST_F(DispatcherTest, A_fault_that_cannot_be_shown_leaves_the_loops_all_the_same) {
  whileTheFaultIsShown = [] { throw std::bad_alloc(); };

  EXPECT_NO_THROW(dispatcher.Dispatch([] { throw Fault(Fault::kOverflow); }));

  EXPECT_EQ(dispatcher.Status(), 1);
  EXPECT_EQ(happened.back(), "left 1");
}

TEST_F(DispatcherTest, Whoever_pumps_below_an_end_goes_on_unwinding) {
  bool wentOn = false;

  dispatcher.Dispatch([&] {
    dispatcher.Dispatch([&] { dispatcher.End(4); });
    dispatcher.UnwindIfEnded();
    wentOn = true;
  });

  EXPECT_FALSE(wentOn);
  EXPECT_EQ(dispatcher.Status(), 4);
}

} // namespace
} // namespace quendra::forms
