#include "foundation/cSubCls.h"

#include "forms/MessageWindows.h"

#include <gtest/gtest.h>

#include <string>

namespace quendra::foundation {
namespace {

using Trace = std::vector<std::string>;
using Procedure = forms::WindowProcedure::element_type;

/// Writes down what it sees and answers as it was told.
struct Owner : iSubCls {
  explicit Owner(Trace& trace_) : trace(trace_) {}
  void Despues(std::int32_t& lReturn, WindowHandle, std::uint32_t uMsg, std::uint32_t,
               std::uint32_t) override {
    trace.push_back("after " + std::to_string(uMsg) + " got " + std::to_string(lReturn));
    if (leaves) lReturn = *leaves;
  }
  void Antes(std::int32_t& bHandled, std::int32_t& lReturn, WindowHandle, std::uint32_t uMsg,
             std::uint32_t wParam, std::uint32_t lParam) override {
    trace.push_back("before " + std::to_string(uMsg) + " " + std::to_string(wParam) + " " +
                    std::to_string(lParam) + " with " + std::to_string(bHandled) + " " +
                    std::to_string(lReturn));
    if (during) during();
    bHandled = handles;
    if (leaves) lReturn = *leaves;
  }
  Trace& trace;
  std::int32_t handles = 0;
  std::optional<std::int32_t> leaves;
  std::function<void()> during;
};

/// A window whose own procedure answers 77.
struct Subclassing : testing::Test {
  Subclassing() {
    windows.Replace(window, std::make_shared<Procedure>([this](auto, std::uint32_t message, auto...) {
                      trace.push_back("procedure " + std::to_string(message));
                      if (during) during();
                      return 77;
                    }));
  }
  std::int32_t Send(std::uint32_t message) { return windows.Dispatch(window, message, 3, 4); }

  forms::MessageWindows windows;
  const WindowHandle window = windows.Create();
  std::function<void()> during;
  Trace trace;
  Owner owner{trace};
  cSubCls subclass{windows};
};

TEST_F(Subclassing, A_message_that_is_not_in_the_filter_is_the_procedures_alone) {
  subclass.AddMsg(5, kTrue16);
  subclass.SubClass(window, owner, kFalse16);

  EXPECT_EQ(Send(6), 77);
  EXPECT_EQ(trace, Trace{"procedure 6"});
}

TEST_F(Subclassing, Before_sees_the_message_first_and_leaves_the_result_to_the_procedure) {
  subclass.AddMsg(5, kTrue16);
  subclass.SubClass(window, owner, kFalse16);
  owner.leaves = 9;

  EXPECT_EQ(Send(5), 77);
  EXPECT_EQ(trace, (Trace{"before 5 3 4 with 0 0", "procedure 5"}));
}

TEST_F(Subclassing, A_handled_message_never_reaches_the_procedure) {
  subclass.AddMsg(5, kTrue16);
  subclass.SubClass(window, owner, kFalse16);
  owner.handles = 1;
  owner.leaves = 9;

  EXPECT_EQ(Send(5), 9);
  EXPECT_EQ(trace, Trace{"before 5 3 4 with 0 0"});
}

TEST_F(Subclassing, A_handled_message_whose_result_was_left_alone_returns_0) {
  subclass.AddMsg(5, kTrue16);
  subclass.SubClass(window, owner, kFalse16);
  owner.handles = -1;

  EXPECT_EQ(Send(5), 0);
  EXPECT_EQ(trace, Trace{"before 5 3 4 with 0 0"});
}

TEST_F(Subclassing, After_gets_the_procedures_result_and_what_it_leaves_goes_back) {
  subclass.AddMsg(5, kFalse16);
  subclass.SubClass(window, owner, kFalse16);

  EXPECT_EQ(Send(5), 77);
  owner.leaves = 9;
  EXPECT_EQ(Send(5), 9);
  EXPECT_EQ(trace, (Trace{"procedure 5", "after 5 got 77", "procedure 5", "after 5 got 77"}));
}

TEST_F(Subclassing, Of_a_message_added_twice_the_first_entry_decides) {
  subclass.AddMsg(5, kFalse16);
  subclass.AddMsg(5, kTrue16);
  subclass.SubClass(window, owner, kFalse16);

  Send(5);

  EXPECT_EQ(trace, (Trace{"procedure 5", "after 5 got 77"}));
}

TEST_F(Subclassing, With_all_messages_each_is_seen_after_and_the_filter_is_not_used) {
  subclass.AddMsg(5, kTrue16);
  subclass.SubClass(window, owner, kTrue16);

  Send(5);
  Send(6);

  EXPECT_EQ(trace, (Trace{"procedure 5", "after 5 got 77", "procedure 6", "after 6 got 77"}));
}

TEST_F(Subclassing, A_message_added_while_attached_has_no_effect) {
  subclass.SubClass(window, owner, kFalse16);
  subclass.AddMsg(5, kTrue16);

  Send(5);

  EXPECT_EQ(trace, Trace{"procedure 5"});
}

TEST_F(Subclassing, Detaching_restores_the_procedure_and_forgets_the_filter) {
  const auto before = windows.Procedure(window);
  subclass.AddMsg(5, kTrue16);
  subclass.SubClass(window, owner, kFalse16);
  EXPECT_EQ(subclass.Subclassed(), kTrue16);

  subclass.UnSubclass();

  EXPECT_EQ(subclass.Subclassed(), kFalse16);
  EXPECT_EQ(windows.Procedure(window), before);
  subclass.SubClass(window, owner, kFalse16);
  Send(5);
  EXPECT_EQ(trace, Trace{"procedure 5"});
}

TEST_F(Subclassing, A_detached_object_can_be_filled_and_attached_anew) {
  subclass.AddMsg(5, kTrue16);
  subclass.SubClass(window, owner, kFalse16);
  subclass.UnSubclass();
  subclass.AddMsg(6, kTrue16);
  subclass.SubClass(window, owner, kFalse16);

  Send(5);
  Send(6);

  EXPECT_EQ(trace, (Trace{"procedure 5", "before 6 3 4 with 0 0", "procedure 6"}));
}

TEST_F(Subclassing, Detaching_without_attachment_does_nothing_and_keeps_the_filter) {
  subclass.AddMsg(5, kTrue16);
  subclass.UnSubclass();
  subclass.SubClass(window, owner, kFalse16);

  Send(5);

  EXPECT_EQ(trace, (Trace{"before 5 3 4 with 0 0", "procedure 5"}));
}

TEST_F(Subclassing, The_end_of_an_attached_object_detaches) {
  const auto before = windows.Procedure(window);
  {
    cSubCls other(windows);
    other.SubClass(window, owner, kTrue16);
    EXPECT_NE(windows.Procedure(window), before);
  }
  EXPECT_EQ(windows.Procedure(window), before);
}

TEST_F(Subclassing, A_message_under_way_finds_the_procedure_alone_after_a_detachment) {
  subclass.SubClass(window, owner, kTrue16);
  during = [this] { subclass.UnSubclass(); };

  EXPECT_EQ(Send(5), 77);
  EXPECT_EQ(trace, Trace{"procedure 5"});
}

TEST_F(Subclassing, An_owner_may_detach_before_the_procedure_and_the_message_goes_on) {
  subclass.AddMsg(5, kTrue16);
  subclass.SubClass(window, owner, kFalse16);
  owner.during = [this] { subclass.UnSubclass(); };

  EXPECT_EQ(Send(5), 77);
  EXPECT_EQ(trace, (Trace{"before 5 3 4 with 0 0", "procedure 5"}));
}

TEST_F(Subclassing, More_than_34_messages_can_be_chosen) {
  for (std::uint32_t message = 1; message <= 100; ++message) subclass.AddMsg(message, kTrue16);
  subclass.SubClass(window, owner, kFalse16);

  for (const std::uint32_t message : {1U, 34U, 35U, 100U}) {
    trace.clear();
    Send(message);
    EXPECT_EQ(trace.size(), 2U) << message;
  }
}

TEST_F(Subclassing, Two_objects_on_one_window_both_see_a_message) {
  cSubCls second(windows);
  subclass.SubClass(window, owner, kTrue16);
  second.SubClass(window, owner, kTrue16);

  Send(5);

  EXPECT_EQ(trace, (Trace{"procedure 5", "after 5 got 77", "after 5 got 77"}));
  second.UnSubclass();
}

TEST_F(Subclassing, Objects_detached_in_the_order_of_their_attachment_leave_nothing_that_reaches_an_owner) {
  cSubCls second(windows);
  subclass.SubClass(window, owner, kTrue16);
  second.SubClass(window, owner, kTrue16);

  subclass.UnSubclass();
  second.UnSubclass();

  EXPECT_EQ(Send(5), 77);
  EXPECT_EQ(trace, Trace{"procedure 5"});
}

TEST_F(Subclassing, An_attached_object_stays_with_its_window_owner_and_mode) {
  Trace others;
  Owner other(others);
  const auto before = windows.Procedure(window);
  subclass.AddMsg(5, kFalse16);
  subclass.SubClass(window, owner, kFalse16);

  subclass.SubClass(windows.Create(), other, kTrue16);
  Send(5);
  Send(6);
  subclass.UnSubclass();

  EXPECT_EQ(subclass.Window(), window);
  EXPECT_EQ(windows.Procedure(window), before);
  EXPECT_EQ(trace, (Trace{"procedure 5", "after 5 got 77", "procedure 6"}));
  EXPECT_EQ(others, Trace{});
}

/// Keeps what came with the last message.
struct Listener : iSubCls {
  void Despues(std::int32_t&, WindowHandle hWnd, std::uint32_t uMsg, std::uint32_t wParam,
               std::uint32_t lParam) override {
    after = {hWnd.Value(), uMsg, wParam, lParam};
    if (during) during();
  }
  void Antes(std::int32_t&, std::int32_t&, WindowHandle hWnd, std::uint32_t uMsg, std::uint32_t wParam,
             std::uint32_t lParam) override {
    before = {hWnd.Value(), uMsg, wParam, lParam};
    if (during) during();
  }
  std::vector<std::uint32_t> before;
  std::vector<std::uint32_t> after;
  std::function<void()> during;
};

TEST_F(Subclassing, Both_operations_are_told_the_window_the_message_and_its_two_numbers) {
  Listener listener;
  subclass.AddMsg(5, kTrue16);
  subclass.AddMsg(6, kFalse16);
  subclass.SubClass(window, listener, kFalse16);

  windows.Dispatch(window, 5, 0xFFFFFFFF, 2);
  windows.Dispatch(window, 6, 3, 0x80000000);

  EXPECT_EQ(listener.before, (std::vector<std::uint32_t>{window.Value(), 5, 0xFFFFFFFF, 2}));
  EXPECT_EQ(listener.after, (std::vector<std::uint32_t>{window.Value(), 6, 3, 0x80000000}));
}

TEST_F(Subclassing, An_owner_may_end_the_object_in_either_of_its_operations) {
  for (const Boolean16 before : {kTrue16, kFalse16}) {
    Listener listener;
    auto ending = std::make_unique<cSubCls>(windows);
    listener.during = [&] { ending.reset(); };
    ending->AddMsg(5, before);
    ending->SubClass(window, listener, kFalse16);

    EXPECT_EQ(Send(5), 77);
    EXPECT_EQ(ending, nullptr);
    EXPECT_EQ(Send(5), 77);
  }
}

TEST_F(Subclassing, A_window_that_goes_inside_its_message_takes_nobody_along) {
  subclass.SubClass(window, owner, kTrue16);
  during = [this] { windows.Remove(window); };

  EXPECT_EQ(Send(5), 77);
  EXPECT_EQ(Send(5), 0);
  subclass.UnSubclass();

  EXPECT_EQ(trace, (Trace{"procedure 5", "after 5 got 77"}));
}

TEST_F(Subclassing, A_window_that_does_not_exist_harms_nobody) {
  subclass.SubClass(WindowHandle(1), owner, kTrue16);
  subclass.UnSubclass();

  EXPECT_EQ(subclass.Subclassed(), kFalse16);
}

} // namespace
} // namespace quendra::foundation
