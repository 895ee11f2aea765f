#include "platform/linux/remote_access/RasFixture.h"
#include "platform/linux/system/Files.h"

#include <chrono>
#include <filesystem>

namespace quendra::platform::linux_ {

namespace {

using Changes = DialLoop::Changes;

/// Dials through a NetworkManager that does what the test says.
struct ScriptedDialTest : RasTest {
  void SetUp() override {
    ASSERT_TRUE(bus.Start());
    StartManager("accepts");
    ASSERT_EQ(Put("097", EntryFor("pppoe")), 0U);
    ASSERT_EQ(Put("tunnel", EntryFor("vpn")), 0U);
  }

  void StartManager(const std::string& mode) {
    manager.reset();
    bus.folder.Write("asked", "");
    manager = std::make_unique<Child>(std::vector<std::string>{"/bin/sh", "-c",
                                                               "exec /usr/bin/python3 " QUENDRA_SOURCE_DIR
                                                               "/tests/standins/network_manager.py " +
                                                                   (bus.folder / "asked") + " " + mode});
    ASSERT_TRUE(loop.WaitFor([&] { return Asked().starts_with("ready\n"); }, 20'000));
  }
  std::string Asked() { return ReadFile(bus.folder / "asked", 100'000).value_or(""); }
  bool WasAsked(const std::string& line) {
    return loop.WaitFor([&] { return Asked().find(line + "\n") != std::string::npos; }, 20'000);
  }
  static std::string PlayCommand(const std::string& steps) {
    return "dbus-send --system --print-reply --dest=org.freedesktop.NetworkManager /script "
           "org.quendra.Script.Play string:'" +
           steps + "' >/dev/null 2>&1";
  }
  static void Play(const std::string& steps) { ASSERT_TRUE(RunShell(PlayCommand(steps))); }
  /// Dials, and waits until the manager is at it.
  void BeginDial(const char* name) {
    loop.changes.clear();
    ASSERT_EQ(Dial(name), 0U);
    ASSERT_TRUE(WasAsked("ActivateConnection " + std::string(name)));
  }
  void SpeakPpp() { std::filesystem::create_directory(kernel / "ppp"); }
  void Settle() {
    loop.WaitFor([] { return false; }, 50);
  }

  PrivateBus bus;
  std::unique_ptr<Child> manager;
};

} // namespace

TEST_F(ScriptedDialTest, A_PPPoE_line_that_comes_up_tells_each_state_once) {
  BeginDial("097");
  Play("device 40 0, device 50 0, device 60 0, device 50 0, device 70 0, device 80 0, device 90 0, "
       "device 100 0, active 2 1");
  EXPECT_TRUE(Comes(kRasConnected, 0));
  Settle();
  EXPECT_EQ(loop.changes, (Changes{{kRasOpenPort, 0},
                                   {kRasPortOpened, 0},
                                   {kRasConnectDevice, 0},
                                   {kRasAuthenticated, 0},
                                   {kRasProjected, 0},
                                   {kRasConnected, 0}}));
}

TEST_F(ScriptedDialTest, A_VPN_that_comes_up_tells_each_state_once) {
  BeginDial("tunnel");
  Play("vpn 1 0, vpn 2 0, vpn 3 0, vpn 4 0, vpn 5 1, active 2 1");
  EXPECT_TRUE(Comes(kRasConnected, 0));
  Settle();
  EXPECT_EQ(loop.changes, (Changes{{kRasOpenPort, 0},
                                   {kRasPortOpened, 0},
                                   {kRasConnectDevice, 0},
                                   {kRasAuthenticate, 0},
                                   {kRasConnected, 0}}));
}

TEST_F(ScriptedDialTest, A_wrong_secret_is_691) {
  SpeakPpp();
  BeginDial("097");
  Play("device 40 0, device 50 0, device 120 13, active 4 3, forget");
  EXPECT_TRUE(Comes(kRasConnectDevice, kRasAuthenticationFailure));
  BeginDial("tunnel");
  Play("vpn 1 0, vpn 3 0, vpn 6 10, active 4 10, forget");
  EXPECT_TRUE(Comes(kRasConnectDevice, kRasAuthenticationFailure));
  Settle();
  EXPECT_EQ(std::ranges::count_if(loop.changes, [](const auto& change) { return change.second != 0; }), 1);
}

TEST_F(ScriptedDialTest, A_line_that_nobody_answers_is_678) {
  SpeakPpp();
  BeginDial("097");
  Play("device 40 0, device 50 0, device 120 14, active 4 3, forget");
  EXPECT_TRUE(Comes(kRasConnectDevice, kRasNoAnswer));
}

TEST_F(ScriptedDialTest, The_same_failure_on_a_kernel_without_PPP_is_633) {
  BeginDial("097");
  Play("device 40 0, device 50 0, device 120 14, active 4 3, forget");
  EXPECT_TRUE(Comes(kRasConnectDevice, kRasPortNotAvailable));
}

TEST_F(ScriptedDialTest, A_manager_without_a_device_for_it_is_633) {
  StartManager("refuses");
  ASSERT_EQ(Put("097", EntryFor("pppoe")), 0U);
  EXPECT_EQ(Dial("097"), 0U);
  EXPECT_TRUE(Comes(kRasOpenPort, kRasPortNotAvailable));
  EXPECT_EQ(Dial("097", false), kRasPortNotAvailable);
}

TEST_F(ScriptedDialTest, A_line_that_drops_tells_it) {
  BeginDial("097");
  Play("device 100 0, active 2 1");
  ASSERT_TRUE(Comes(kRasConnected, 0));
  Play("device 120 13, active 4 3, forget");
  EXPECT_TRUE(Comes(kRasDisconnected, kRasPortDisconnected));
  EXPECT_EQ(Connections().size(), 0U);
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
}

TEST_F(ScriptedDialTest, A_second_client_sees_the_connection_and_ends_it) {
  BeginDial("097");
  Play("device 100 0, active 2 1");
  ASSERT_TRUE(Comes(kRasConnected, 0));
  forms::headless::PolledDesktop otherLoop;
  NetworkManagerBus otherConnection(otherLoop, otherLoop);
  ConnectionBook otherBook(otherConnection);
  LinuxDialling other(otherBook, otherConnection, otherLoop);
  Bytes record(RasConnectionRecord::kBytes);
  PutLittle32(record, 0, RasConnectionRecord::kBytes);
  std::uint32_t bytes = RasConnectionRecord::kBytes, count = 0;
  ASSERT_EQ(other.RasEnumConnectionsA(record, bytes, count), 0U);
  ASSERT_EQ(count, 1U);
  EXPECT_EQ(TextAt(record, RasConnectionRecord::kEntryName), "097");
  EXPECT_EQ(TextAt(record, RasConnectionRecord::kDeviceType), "pppoe");

  EXPECT_EQ(other.RasHangUpA(RasConnection(Little32(record, RasConnectionRecord::kHandle))), 0U);

  EXPECT_TRUE(Comes(kRasDisconnected, kRasUserDisconnection));
  EXPECT_EQ(Connections().size(), 0U);
}

TEST_F(ScriptedDialTest, A_device_that_ends_another_connection_does_not_end_this_one) {
  BeginDial("097");
  Play("device 110 60, device 30 60, device 40 0, device 50 0");
  EXPECT_TRUE(Comes(kRasConnectDevice, 0));
  Play("active 4 2");
  EXPECT_TRUE(Comes(kRasConnectDevice, kRasUserDisconnection));
}

TEST_F(ScriptedDialTest, A_line_that_is_hung_up_while_it_is_dialled_tells_nothing_more) {
  BeginDial("097");
  Play("device 40 0");
  ASSERT_TRUE(Comes(kRasPortOpened, 0));
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  EXPECT_TRUE(WasAsked("DeactivateConnection 097"));
  Settle();
  EXPECT_EQ(loop.changes.back(), std::pair(std::uint32_t{kRasPortOpened}, 0U));
}

TEST_F(ScriptedDialTest, A_line_that_is_hung_up_at_once_ends_as_soon_as_it_is_known) {
  ASSERT_EQ(Dial("097"), 0U);
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  EXPECT_TRUE(WasAsked("DeactivateConnection 097"));
  EXPECT_EQ(loop.changes, (Changes{{kRasOpenPort, 0}}));
}

TEST_F(ScriptedDialTest, A_handle_may_be_hung_up_again_also_when_its_line_has_ended) {
  BeginDial("097");
  Play("device 120 13, active 4 3, forget");
  ASSERT_TRUE(loop.WaitFor([&] { return loop.changes.back().second != 0; }, 20'000));
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
}

TEST_F(ScriptedDialTest, A_dial_without_a_window_returns_when_the_line_stands) {
  Child later({"/bin/sh", "-c",
               "while ! grep -q Activate " + (bus.folder / "asked") + "; do sleep 0.05; done; " +
                   PlayCommand("device 40 0, device 100 0, active 2 1")});
  EXPECT_EQ(Dial("097", false), 0U);
  EXPECT_NE(handle, kNoRasConnection);
  ASSERT_EQ(Connections().size(), 1U);
  EXPECT_EQ(Connections().front(), std::pair(std::string("097"), handle));
  EXPECT_TRUE(loop.changes.empty());
}

TEST_F(ScriptedDialTest, A_dial_without_a_window_gives_the_failure) {
  Child later({"/bin/sh", "-c",
               "while ! grep -q Activate " + (bus.folder / "asked") + "; do sleep 0.05; done; " +
                   PlayCommand("device 40 0, device 120 13, active 4 3, forget")});
  EXPECT_EQ(Dial("097", false), kRasAuthenticationFailure);
  EXPECT_EQ(handle, kNoRasConnection);
}

TEST_F(ScriptedDialTest, A_manager_that_goes_ends_a_dial_with_and_without_a_window) {
  BeginDial("097");
  manager->End();
  EXPECT_TRUE(Comes(kRasOpenPort, kRasManagerCannotStart));
  StartManager("accepts");
  ASSERT_EQ(Put("097", EntryFor("pppoe")), 0U);
  Child later({"/bin/sh", "-c",
               "while ! grep -q Activate " + (bus.folder / "asked") + "; do sleep 0.05; done; kill -9 " +
                   std::to_string(manager->Id())});
  EXPECT_EQ(Dial("097", false), kRasManagerCannotStart);
}

TEST_F(ScriptedDialTest, A_manager_that_never_answers_does_not_hold_up_a_window) {
  StartManager("silent");
  ASSERT_EQ(Put("097", EntryFor("pppoe")), 0U);
  const auto start = std::chrono::steady_clock::now();
  EXPECT_EQ(Dial("097"), 0U);
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(1));
  EXPECT_EQ(Names(), std::vector<std::string>{"097"});
}

TEST_F(ScriptedDialTest, User_name_and_password_of_a_dial_are_kept) {
  const Dialling::Notifier window{kRasNotifierIsWindow, DialLoop::kWindow};
  ASSERT_EQ(Save("097", "dan", "old"), 0U);
  EXPECT_EQ(dialling.RasDialA({}, nullptr, DialParamsFor("097", {}, "new"), window, handle), 0U);
  EXPECT_EQ(TextAt(Saved("097"), kUserNameAt), "dan");
  EXPECT_EQ(TextAt(Saved("097"), kPasswordAt), "new");
  EXPECT_EQ(Asked().find("new"), std::string::npos);
}

TEST_F(ScriptedDialTest, A_dial_of_no_entry_of_a_wrong_size_or_with_a_wrong_extension_fails) {
  EXPECT_EQ(Dial("nobody"), kRasCannotFindPhonebookEntry);
  Bytes params = DialParamsFor("097");
  params[0] = 1;
  EXPECT_EQ(dialling.RasDialA({}, nullptr, params, {}, handle), kRasInvalidSize);
  EXPECT_EQ(dialling.RasDialA({}, nullptr, Bytes(3), {}, handle), kRasBufferInvalid);
  EXPECT_EQ(dialling.RasDialA(Bytes(15), nullptr, DialParamsFor("097"), {}, handle), kRasInvalidSize);
}

TEST_F(ScriptedDialTest, Signals_that_make_no_sense_change_nothing) {
  BeginDial("097");
  Settle();
  Play("device 4000000000 4000000000, active 77 5, vpn 6 10, vpn 5 1");
  Settle();
  EXPECT_EQ(loop.changes, (Changes{{kRasOpenPort, 0}}));
}

} // namespace quendra::platform::linux_
