#include "forms/MessageWindows.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>

namespace quendra::forms {
namespace {

using Procedure = WindowProcedure::element_type;

struct WindowProceduresTest : testing::Test {
  /// A procedure that counts its calls and passes the message to the one before.
  WindowProcedure Counting(const WindowProcedure& previous) {
    return std::make_shared<Procedure>([this, previous](auto sentTo, auto message, auto wParam, auto lParam) {
      ++calls;
      return windows.Call(previous, sentTo, message, wParam, lParam);
    });
  }
  MessageWindows windows;
  const WindowHandle window = windows.Add(std::make_shared<Procedure>([](auto...) { return 77; }));
  int calls = 0;
};

TEST_F(WindowProceduresTest, A_replaced_procedure_can_pass_a_message_on_to_the_one_before) {
  const WindowProcedure before = windows.Procedure(window);
  EXPECT_EQ(windows.Replace(window, Counting(before)), before);

  EXPECT_EQ(windows.Dispatch(window, 5, 0, 0), 77);
  EXPECT_EQ(calls, 1);
}

TEST_F(WindowProceduresTest, An_empty_predecessor_is_the_windows_own_procedure) {
  windows.Replace(window, Counting(nullptr));

  EXPECT_EQ(windows.Dispatch(window, 5, 0, 0), 77);
  EXPECT_EQ(calls, 1);
}

TEST_F(WindowProceduresTest, A_procedure_that_is_its_own_predecessor_comes_to_the_windows_own) {
  WindowProcedure self;
  self = std::make_shared<Procedure>([&](auto sentTo, auto message, auto wParam, auto lParam) {
    ++calls;
    return windows.Call(self, sentTo, message, wParam, lParam);
  });
  windows.Replace(window, self);

  EXPECT_EQ(windows.Dispatch(window, 5, 0, 0), 77);
  EXPECT_EQ(calls, 1);
}

TEST_F(WindowProceduresTest, Two_procedures_that_follow_each_other_come_to_the_windows_own) {
  WindowProcedure first;
  WindowProcedure second;
  first = std::make_shared<Procedure>([&](auto sentTo, auto... rest) {
    ++calls;
    return windows.Call(second, sentTo, rest...);
  });
  second = std::make_shared<Procedure>([&](auto sentTo, auto... rest) {
    ++calls;
    return windows.Call(first, sentTo, rest...);
  });
  windows.Replace(window, first);

  EXPECT_EQ(windows.Dispatch(window, 5, 0, 0), 77);
  EXPECT_EQ(calls, 2);
}

TEST_F(WindowProceduresTest, A_message_that_arrives_inside_an_equal_one_is_handled_like_the_first) {
  const WindowProcedure before = windows.Procedure(window);
  windows.Replace(window, std::make_shared<Procedure>([&](auto sentTo, auto... rest) {
                    if (++calls < 3) windows.Dispatch(window, 5, 0, 0);
                    return windows.Call(before, sentTo, rest...);
                  }));

  EXPECT_EQ(windows.Dispatch(window, 5, 0, 0), 77);
  EXPECT_EQ(calls, 3);
}

TEST_F(WindowProceduresTest, An_empty_procedure_puts_the_windows_own_back) {
  windows.Replace(window, Counting(nullptr));
  windows.Replace(window, nullptr);

  EXPECT_EQ(windows.Dispatch(window, 5, 0, 0), 77);
  EXPECT_EQ(calls, 0);
}

TEST_F(WindowProceduresTest, A_procedure_that_throws_leaves_no_trace) {
  windows.Replace(window, std::make_shared<Procedure>([&](auto...) -> std::int32_t {
                    if (++calls == 1) throw std::runtime_error("once");
                    return 5;
                  }));

  EXPECT_THROW(windows.Dispatch(window, 5, 0, 0), std::runtime_error);
  EXPECT_EQ(windows.Dispatch(window, 5, 0, 0), 5);
}

TEST_F(WindowProceduresTest, A_window_that_goes_inside_its_message_has_no_own_procedure_any_more) {
  windows.Replace(window, std::make_shared<Procedure>([&](auto sentTo, auto... rest) {
                    windows.Remove(window);
                    return windows.Call(nullptr, sentTo, rest...);
                  }));

  EXPECT_EQ(windows.Dispatch(window, 5, 0, 0), 0);
  EXPECT_EQ(windows.Dispatch(window, 5, 0, 0), 0);
}

} // namespace
} // namespace quendra::forms
