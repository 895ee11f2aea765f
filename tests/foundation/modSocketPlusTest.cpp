#include "foundation/modSocketPlus.h"

#include "foundation/SimulatedWorld.h"

namespace quendra::foundation {
namespace {

/// Windows that can't be made or destroyed when the test says so.
class StubbornWindows : public forms::MessageWindows {
 public:
  forms::WindowHandle Create() override { return FailCreate ? forms::kNoWindow : MessageWindows::Create(); }
  bool Destroy(forms::WindowHandle window) override {
    return !FailDestroy && MessageWindows::Destroy(window);
  }
  bool FailCreate = false;
  bool FailDestroy = false;
};

class SocketModule : public testing::Test {
 protected:
  std::unique_ptr<CSocketPlus> NewObject() { return std::make_unique<CSocketPlus>(Module); }
  static void Open(CSocketPlus& object, const Variant& index) {
    object.ArrayAdd(index);
    object.Bind(index);
  }
  platform::simulated::SimulatedSockets& Net() { return Machine.sockets; }

  forms::headless::HeadlessDesktop Desktop;
  platform::simulated::SimulatedMachine Machine{Desktop};
  StubbornWindows Windows;
  modSocketPlus Module{Machine.sockets, Machine.hostNames, Desktop, Windows};
};

// The library.

TEST_F(SocketModule, The_first_object_starts_the_library_and_the_last_ends_it) {
  EXPECT_FALSE(Module.WinsockStarted());
  auto first = NewObject();
  auto second = NewObject();
  EXPECT_EQ(Module.SocketClassCount(), 2);
  EXPECT_TRUE(Module.WinsockStarted());
  EXPECT_EQ(Net().Count("WSAStartup"), 1);
  first.reset();
  EXPECT_EQ(Net().Count("WSACleanup"), 0);
  second.reset();
  EXPECT_EQ(Net().Count("WSACleanup"), 1);
  EXPECT_FALSE(Module.WinsockStarted());
}

TEST_F(SocketModule, A_new_object_after_the_last_starts_the_library_again) {
  NewObject();
  NewObject();
  EXPECT_EQ(Net().Count("WSAStartup"), 2);
  EXPECT_EQ(Net().Count("WSACleanup"), 2);
}

TEST_F(SocketModule, A_library_that_does_not_start_is_raised) {
  Net().Fail("WSAStartup", 10091);
  EXPECT_EQ(FaultText([&] { NewObject(); }),
            "10091 Network subsystem is unavailable. [modSocketPlus.InitiateProcesses]");
}

TEST_F(SocketModule, After_a_start_that_failed_the_library_counts_as_started) {
  Net().Fail("WSAStartup", 10092);
  FaultText([&] { NewObject(); });
  EXPECT_TRUE(Module.WinsockStarted());
  const auto object = NewObject();
  EXPECT_EQ(Net().Count("WSAStartup"), 1);
}

TEST_F(SocketModule, A_library_that_does_not_end_is_raised_with_the_last_error) {
  const auto object = NewObject();
  Net().Fail("WSACleanup", 10050);
  EXPECT_EQ(FaultText([&] { object->Release(); }),
            "10050 Network is down. [modSocketPlus.FinalizeProcesses]");
  EXPECT_TRUE(Module.WinsockStarted());
  EXPECT_EQ(Module.SocketClassCount(), 0);
}

TEST_F(SocketModule, An_object_that_is_destroyed_swallows_what_its_release_raises) {
  auto object = NewObject();
  Net().Fail("WSACleanup", 10050);
  object.reset();
  EXPECT_EQ(Module.SocketClassCount(), 0);
}

TEST_F(SocketModule, The_arrays_are_empty_after_the_last_object) {
  auto object = NewObject();
  Open(*object, 1);
  Open(*object, 2);
  EXPECT_EQ(Module.SocketCount(), 2);
  object.reset();
  EXPECT_EQ(Module.SocketCount(), 0);
}

// The window.

TEST_F(SocketModule, The_window_stands_from_the_first_socket_to_the_last) {
  const auto first = NewObject();
  const auto second = NewObject();
  EXPECT_EQ(Module.SocketWindow(), kNoWindow);
  Open(*first, 1);
  const auto window = Module.SocketWindow();
  EXPECT_NE(window, kNoWindow);
  Open(*second, 1);
  EXPECT_EQ(Module.SocketWindow(), window);
  first->CloseSck(1);
  EXPECT_EQ(Module.SocketWindow(), window);
  second->CloseSck(1);
  EXPECT_EQ(Module.SocketWindow(), kNoWindow);
  EXPECT_EQ(Windows.Count(), 0);
}

TEST_F(SocketModule, A_socket_after_the_last_was_closed_makes_a_new_window) {
  const auto object = NewObject();
  Open(*object, 1);
  const auto window = Module.SocketWindow();
  object->CloseSck(1);
  object->Bind(1);
  EXPECT_NE(Module.SocketWindow(), kNoWindow);
  EXPECT_NE(Module.SocketWindow(), window);
}

TEST_F(SocketModule, A_window_that_can_not_be_made_raises_7_and_the_next_socket_tries_again) {
  const auto object = NewObject();
  object->ArrayAdd(1);
  Windows.FailCreate = true;
  EXPECT_EQ(FaultText([&] { object->Bind(1); }), "7 Out of memory [modSocketPlus.RegisterSocket]");
  Windows.FailCreate = false;
  object->CloseSck(1);
  object->Bind(1);
  EXPECT_EQ(object->State(1), sckOpen);
}

TEST_F(SocketModule, A_window_that_can_not_be_destroyed_raises_7_at_the_close_of_the_last_socket) {
  const auto object = NewObject();
  Open(*object, 1);
  Windows.FailDestroy = true;
  EXPECT_EQ(FaultText([&] { object->CloseSck(1); }),
            "7 Out of memory [modSocketPlus.DestroyWinsockMessageWindow]");
  EXPECT_EQ(object->State(1), sckClosing);
  EXPECT_NE(object->SocketHandle(1), -1);
  EXPECT_NE(Module.SocketWindow(), kNoWindow);
}

TEST_F(SocketModule, The_window_asks_for_its_five_events_with_message_32769) {
  const auto object = NewObject();
  Open(*object, 1);
  EXPECT_EQ(Machine.Calls.back(), "WSAAsyncSelect " + std::to_string(object->SocketHandle(1)) + " " +
                                      std::to_string(Module.SocketWindow().Value()) + " 32769 59");
}

// The dispatcher.

/// Windows whose own procedure answers 77, so that what reaches it is seen.
class AnsweringWindows : public forms::MessageWindows {
 public:
  forms::WindowHandle Create() override {
    const auto window = MessageWindows::Create();
    using Procedure = forms::WindowProcedure::element_type;
    Replace(window, std::make_shared<Procedure>([](auto...) { return 77; }));
    return window;
  }
};

TEST_F(SocketModule, The_former_procedure_sees_all_but_the_messages_that_have_an_owner) {
  AnsweringWindows windows;
  modSocketPlus module(Machine.sockets, Machine.hostNames, Desktop, windows);
  CSocketPlus object(module);
  Open(object, 1);
  const auto window = module.SocketWindow();
  const auto socket = static_cast<std::uint32_t>(object.SocketHandle(1));
  EXPECT_EQ(windows.Dispatch(window, 32769, socket, 2), 0);
  EXPECT_EQ(windows.Dispatch(window, 32769, socket + 1, 2), 77);
  EXPECT_EQ(windows.Dispatch(window, 32768, socket, 2), 77);
  EXPECT_EQ(windows.Dispatch(window, 1, socket, 2), 77);
  // A free entry of the arrays is no socket.
  Open(object, 2);
  object.CloseSck(2);
  EXPECT_EQ(windows.Dispatch(window, 32769, 0xFFFFFFFF, 2), 77);
}

TEST_F(SocketModule, A_module_that_ends_leaves_no_dispatcher_behind) {
  AnsweringWindows windows;
  forms::WindowHandle window;
  {
    modSocketPlus module(Machine.sockets, Machine.hostNames, Desktop, windows);
    CSocketPlus object(module);
    Open(object, 1);
    window = module.SocketWindow();
    Net().Fail("closesocket", 10050, 2);
    FaultText([&] { object.Release(); });
  }
  EXPECT_EQ(windows.Dispatch(window, 32769, 0x404, 1), 0);
}

TEST_F(SocketModule, Messages_reach_the_object_that_owns_the_socket_and_no_other) {
  const auto first = NewObject();
  const auto second = NewObject();
  Open(*first, 1);
  Open(*second, 1);
  std::string seen;
  first->Events.Error = [&](auto&&...) { seen += "first"; };
  second->Events.Error = [&](auto&&...) { seen += "second"; };
  Windows.Dispatch(Module.SocketWindow(), 32769, static_cast<std::uint32_t>(second->SocketHandle(1)),
                   10050u << 16 | 1);
  EXPECT_EQ(seen, "second");
}

// The arrays.

TEST_F(SocketModule, The_arrays_keep_the_peak_number_of_parallel_entries) {
  const auto object = NewObject();
  for (std::int32_t i = 1; i <= 5; ++i) {
    object->ArrayAdd(i);
    object->Connect(i, Text(u"name"), 80);
  }
  for (std::int32_t i = 1; i <= 5; ++i) object->CloseSck(i);
  EXPECT_EQ(Module.ResolveCount(), 5);
  object->Connect(3, Text(u"name"), 80);
  EXPECT_EQ(Module.ResolveCount(), 5);
  EXPECT_EQ(Module.SocketCount(), 5);
}

TEST_F(SocketModule, IsSocketRegistered_knows_the_sockets_of_all_objects) {
  const auto object = NewObject();
  EXPECT_FALSE(Module.IsSocketRegistered(platform::SocketHandle(1)));
  Open(*object, 1);
  const platform::SocketHandle socket(static_cast<std::uint32_t>(object->SocketHandle(1)));
  EXPECT_TRUE(Module.IsSocketRegistered(socket));
  EXPECT_FALSE(Module.IsSocketRegistered(platform::SocketHandle(socket.Value() + 4)));
  object->CloseSck(1);
  EXPECT_FALSE(Module.IsSocketRegistered(socket));
}

TEST_F(SocketModule, An_object_that_ends_with_a_socket_that_can_not_be_closed_gets_no_more_messages) {
  auto object = NewObject();
  const auto other = NewObject();
  Open(*object, 1);
  Open(*other, 1);
  const auto socket = static_cast<std::uint32_t>(object->SocketHandle(1));
  Net().Fail("closesocket", 10050);
  object.reset();
  EXPECT_EQ(Windows.Dispatch(Module.SocketWindow(), 32769, socket, 1), 0);
  EXPECT_FALSE(Module.IsSocketRegistered(platform::SocketHandle(socket)));
}

TEST_F(SocketModule, An_object_that_ends_closes_its_other_sockets_though_one_can_not_be_closed) {
  const auto object = NewObject();
  Open(*object, 1);
  Open(*object, 2);
  Net().Fail("closesocket", 10050);
  EXPECT_EQ(FaultText([&] { object->Release(); }), "10050 Network is down. [CSocketPlus.DestroySocket]");
  EXPECT_EQ(Module.SocketClassCount(), 0);
  EXPECT_EQ(Windows.Count(), 0);
}

TEST_F(SocketModule, An_object_that_ends_cancels_its_look_ups) {
  auto object = NewObject();
  Net().NeverAnswer("silent");
  object->ArrayAdd(1);
  object->Connect(1, Text(u"silent"), 80);
  EXPECT_EQ(Net().LookUpsUnderWay(), 1);
  object.reset();
  EXPECT_EQ(Net().LookUpsUnderWay(), 0);
}

TEST_F(SocketModule, An_answer_to_a_socket_that_no_longer_waits_for_one_changes_nothing) {
  const auto object = NewObject();
  object->ArrayAdd(1);
  EXPECT_EQ(object->WndProc(WindowHandle(), 32768, 4711, 0), 0);
  EXPECT_EQ(object->WndProc(WindowHandle(), 32769, 4711, 1), 0);
  EXPECT_EQ(object->State(1), sckClosed);
}

} // namespace
} // namespace quendra::foundation
