#include "provisioning/remote_access/MdlDunFixture.h"

namespace quendra::provisioning {
namespace {

using Procedure = forms::WindowProcedure::element_type;

/// Two windows whose own procedures write down what reaches them, and a handler that does so, too.
struct MdlDunEvents : MdlDunFixture {
  MdlDunEvents() {
    ras.AddEntry("Home");
    dun.OnDialEvent = [this](auto message, auto state, auto error) {
      EXPECT_EQ(message, dun.RasDialEventMessage);
      trace.push_back("told " + std::to_string(state) + " " + std::to_string(error));
    };
  }
  WindowHandle MakeWindow(const std::string& name) {
    return desktop.Windows.Add(std::make_shared<Procedure>([this, name](auto, auto message, auto...) {
      trace.push_back(name + " " + (message == Event() ? "event" : std::to_string(message)));
      return 77;
    }));
  }
  std::uint32_t Event() { return desktop.Windows.RegisterMessage("RasDialEvent"); }
  std::int32_t Send(WindowHandle target, std::uint32_t message) {
    return desktop.Windows.Dispatch(target, message, 5, 691);
  }
  void Dial(std::optional<WindowHandle> target) {
    dun.DialEntry(kTrue16, home, none, user, password, target);
  }

  Lines trace;
  const WindowHandle first = MakeWindow("first");
  const WindowHandle second = MakeWindow("second");
  Text user;
  Text password;
};

TEST_F(MdlDunEvents, A_hook_tells_of_the_dial_and_passes_every_message_on) {
  dun.HookDialEvents(first);

  EXPECT_EQ(Send(first, Event()), 77);
  EXPECT_EQ(Send(first, 5), 77);

  EXPECT_EQ(trace, (Lines{"told 5 691", "first event", "first 5"}));
  EXPECT_EQ(dun.HookedWindow, first);
}

TEST_F(MdlDunEvents, A_hook_without_a_handler_passes_on_alone) {
  dun.OnDialEvent = nullptr;
  dun.HookDialEvents(first);

  EXPECT_EQ(Send(first, Event()), 77);
  EXPECT_EQ(trace, Lines{"first event"});
}

TEST_F(MdlDunEvents, A_window_that_is_hooked_no_more_has_its_procedure_back) {
  const auto own = desktop.Windows.Procedure(first);
  dun.HookDialEvents(first);

  dun.UnhookDialEvents(first);

  EXPECT_EQ(desktop.Windows.Procedure(first), own);
  EXPECT_EQ(dun.HookedWindow, kNoWindow);
  EXPECT_EQ(dun.RasDialEventMessage, 0U);
  Send(first, Event());
  EXPECT_EQ(trace, Lines{"first event"});
}

TEST_F(MdlDunEvents, Unhooking_without_a_hooked_window_does_nothing) {
  dun.HookDialEvents(first);
  dun.HookedWindow = kNoWindow;

  dun.UnhookDialEvents(first);

  Send(first, Event());
  EXPECT_EQ(trace, (Lines{"told 5 691", "first event"}));
}

TEST_F(MdlDunEvents, The_procedure_goes_back_to_the_window_that_is_named) {
  dun.HookDialEvents(first);
  const auto own = dun.PreviousWndProc;

  dun.UnhookDialEvents(second);

  EXPECT_EQ(desktop.Windows.Procedure(second), own);
  EXPECT_NE(desktop.Windows.Procedure(first), own);
}

TEST_F(MdlDunEvents, A_second_hook_takes_the_first_one_off) {
  const auto own = desktop.Windows.Procedure(first);
  dun.HookDialEvents(first);

  dun.HookDialEvents(second);

  EXPECT_EQ(desktop.Windows.Procedure(first), own);
  EXPECT_EQ(dun.HookedWindow, second);
  Send(second, Event());
  EXPECT_EQ(trace, (Lines{"told 5 691", "second event"}));
}

TEST_F(MdlDunEvents, The_message_is_registered_once_a_hook) {
  dun.HookDialEvents(first);
  dun.HookedWindow = kNoWindow;
  dun.HookDialEvents(first);
  EXPECT_EQ(desktop.CountOf("RegisterWindowMessageA RasDialEvent"), 1);

  dun.UnhookDialEvents(first);
  dun.HookDialEvents(first);
  EXPECT_EQ(desktop.CountOf("RegisterWindowMessageA RasDialEvent"), 2);
}

TEST_F(MdlDunEvents, A_message_that_cannot_be_registered_has_a_fixed_number) {
  desktop.FailRegisterWindowMessage = true;

  dun.HookDialEvents(first);

  EXPECT_EQ(dun.RasDialEventMessage, 52429U);
  Send(first, 52429);
  EXPECT_EQ(trace, (Lines{"told 5 691", "first 52429"}));
}

// Dials.

TEST_F(MdlDunEvents, Each_change_of_a_dial_is_told_once) {
  ras.Dial("Home").Then(0).Then(5).ThenError(691);

  Dial(first);
  desktop.RunUntilIdle();

  EXPECT_EQ(trace,
            (Lines{"told 0 0", "first event", "told 5 0", "first event", "told 5 691", "first event"}));
}

TEST_F(MdlDunEvents, A_dial_that_can_register_no_message_is_told_by_the_fixed_number) {
  desktop.FailRegisterWindowMessage = true;
  ras.Dial("Home").ThenError(678);

  Dial(first);
  desktop.RunUntilIdle();

  EXPECT_EQ(trace, (Lines{"told 0 678", "first 52429"}));
}

TEST_F(MdlDunEvents, The_hook_of_a_dial_stays_on_its_window) {
  Dial(first);
  EXPECT_EQ(dun.HookedWindow, kNoWindow);

  dun.UnhookDialEvents(first);

  Send(first, Event());
  EXPECT_EQ(trace, (Lines{"told 5 691", "first event"}));
}

TEST_F(MdlDunEvents, A_second_dial_makes_the_hook_its_own_predecessor_and_messages_still_come_to_an_end) {
  Dial(first);
  desktop.RunUntilIdle();
  dun.HangUpActive(kFalse16);
  Dial(first);
  desktop.RunUntilIdle();
  trace.clear();

  EXPECT_EQ(dun.PreviousWndProc, desktop.Windows.Procedure(first));
  EXPECT_EQ(Send(first, 5), 77);
  EXPECT_EQ(trace, Lines{"first 5"});
}

TEST_F(MdlDunEvents, Behind_a_second_dial_each_change_is_told_once_and_reaches_the_window) {
  Dial(first);
  desktop.RunUntilIdle();
  dun.HangUpActive(kFalse16);
  trace.clear();
  ras.Dial("Home").ThenError(678);

  Dial(first);
  desktop.RunUntilIdle();

  EXPECT_EQ(trace, (Lines{"told 0 678", "first event"}));
}

TEST_F(MdlDunEvents, A_dial_with_the_window_0_leaves_a_predecessor_of_0_that_is_the_windows_own) {
  Dial(first);
  dun.HangUpActive(kFalse16);
  Dial(kNoWindow);
  ASSERT_EQ(dun.PreviousWndProc, nullptr);

  EXPECT_EQ(Send(first, 5), 77);
  EXPECT_EQ(trace, Lines{"first 5"});
}

TEST_F(MdlDunEvents, A_window_that_goes_during_a_dial_is_told_nothing_more) {
  ras.Dial("Home").Then(0).Then(5);
  Dial(first);

  desktop.Windows.Destroy(first);
  desktop.RunUntilIdle();

  EXPECT_TRUE(trace.empty());
}

TEST_F(MdlDunEvents, A_handler_may_hang_up_and_dial_again) {
  ras.Dial("Home").ThenError(678);
  bool again = false;
  dun.OnDialEvent = [&](auto, auto state, auto error) {
    trace.push_back("told " + std::to_string(state) + " " + std::to_string(error));
    if (std::exchange(again, true)) return;
    dun.HangUpActive(kFalse16);
    ras.Dial("Home").ThenConnected();
    Dial(first);
  };

  Dial(first);
  desktop.RunUntilIdle();

  EXPECT_EQ(trace, (Lines{"told 0 678", "first event", "told 8192 0", "first event"}));
}

TEST_F(MdlDunEvents, A_handler_may_put_another_in_its_place) {
  dun.OnDialEvent = [this](auto...) {
    dun.OnDialEvent = nullptr;
    trace.push_back("told");
  };
  dun.HookDialEvents(first);

  Send(first, Event());
  Send(first, Event());

  EXPECT_EQ(trace, (Lines{"told", "first event", "first event"}));
}

TEST_F(MdlDunEvents, A_window_outlives_the_module_that_hooked_it) {
  auto gone = std::make_unique<mdlDun>(mdlDun::RemoteAccess{ras, ras}, machine.system, desktop);
  gone->HookDialEvents(first);

  gone.reset();

  EXPECT_EQ(Send(first, Event()), 77);
  EXPECT_EQ(trace, Lines{"first event"});
}

} // namespace
} // namespace quendra::provisioning
