#include "platform/linux/remote_access/ScriptedManagerFixture.h"

#include <signal.h>

#include <chrono>
#include <cstdio>

namespace quendra::platform::linux_ {

namespace {

using Changes = DialLoop::Changes;

using ScriptedDialTest = ScriptedManagerTest;

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

TEST_F(ScriptedDialTest, A_secret_that_was_asked_for_and_not_given_is_691) {
  SpeakPpp();
  BeginDial("097");
  Play("device 40 0, device 50 0, device 60 0, device 120 7, active 4 3, forget");
  EXPECT_TRUE(Comes(kRasConnectDevice, kRasAuthenticationFailure));
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

TEST_F(ScriptedDialTest, A_tunnel_that_nobody_answers_is_678_and_on_a_kernel_without_PPP_633) {
  BeginDial("tunnel");
  Play("vpn 1 0, vpn 3 0, vpn 6 0, active 4 0, forget");
  EXPECT_TRUE(Comes(kRasConnectDevice, kRasPortNotAvailable));
  SpeakPpp();
  BeginDial("tunnel");
  Play("vpn 1 0, vpn 3 0, vpn 6 0, active 4 0, forget");
  EXPECT_TRUE(Comes(kRasConnectDevice, kRasNoAnswer));
}

TEST_F(ScriptedDialTest, A_manager_without_a_device_for_it_is_633) {
  Play("refuse ActivateConnection org.freedesktop.NetworkManager.UnknownDevice");
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

TEST_F(ScriptedDialTest, A_device_that_ends_another_connection_does_not_end_this_one) {
  BeginDial("097");
  Play("device 110 60, device 30 60, device 40 0, device 50 0");
  EXPECT_TRUE(Comes(kRasConnectDevice, 0));
  Play("active 4 2");
  EXPECT_TRUE(Comes(kRasConnectDevice, kRasUserDisconnection));
}

TEST_F(ScriptedDialTest, An_entry_that_another_program_deletes_while_it_is_dialled_is_told_as_631) {
  for (const char* name : {"097", "tunnel"}) {
    BeginDial(name);
    Play(name == std::string_view("097") ? "device 40 0" : "vpn 1 0");
    ASSERT_TRUE(Comes(kRasPortOpened, 0));
    forms::headless::PolledDesktop otherLoop;
    NetworkManagerBus otherConnection(otherLoop, otherLoop);
    ConnectionBook otherBook(otherConnection);
    EXPECT_EQ(LinuxPhoneBook(otherBook, otherConnection).RasDeleteEntryA(nullptr, name), 0U);
    EXPECT_TRUE(Comes(kRasPortOpened, kRasUserDisconnection)) << name;
  }
}

TEST_F(ScriptedDialTest, A_dial_without_a_window_returns_when_the_line_stands) {
  Child later(OnceItDials(PlayCommand("device 40 0, device 100 0, active 2 1")));
  EXPECT_EQ(Dial("097", false), 0U);
  EXPECT_NE(handle, kNoRasConnection);
  ASSERT_EQ(Connections().size(), 1U);
  EXPECT_EQ(Connections().front(), std::pair(std::string("097"), handle));
  EXPECT_TRUE(loop.changes.empty());
}

TEST_F(ScriptedDialTest, A_dial_without_a_window_gives_the_failure) {
  Child later(OnceItDials(PlayCommand("device 40 0, device 120 13, active 4 3, forget")));
  EXPECT_EQ(Dial("097", false), kRasAuthenticationFailure);
  EXPECT_EQ(handle, kNoRasConnection);
}

TEST_F(ScriptedDialTest, A_manager_that_goes_ends_a_dial_with_and_without_a_window) {
  BeginDial("097");
  manager->End();
  EXPECT_TRUE(Comes(kRasOpenPort, kRasManagerCannotStart));
  StartManager();
  ASSERT_EQ(Put("097", EntryFor("pppoe")), 0U);
  Child later(OnceItDials("kill -9 " + std::to_string(manager->Id())));
  EXPECT_EQ(Dial("097", false), kRasManagerCannotStart);
}

TEST_F(ScriptedDialTest, A_dial_without_a_window_whose_end_nobody_told_comes_to_an_end) {
  SpeakPpp();
  Child later(OnceItDials("sleep 1; " + PlayCommand("forget")));
  EXPECT_EQ(Dial("097", false), kRasNoAnswer);
}

TEST_F(ScriptedDialTest, A_manager_that_stands_still_before_it_answers_ends_a_dial_without_a_window) {
  Play("hold ActivateConnection");
  Child later(OnceItDials("kill -STOP " + std::to_string(manager->Id())));
  EXPECT_EQ(Dial("097", false), kRasManagerCannotStart);
  ::kill(manager->Id(), SIGCONT);
  Play("release");
  EXPECT_TRUE(WasAsked("DeactivateConnection 097")) << "which nobody waits for any more";
}

TEST_F(ScriptedDialTest, A_manager_that_never_answers_does_not_hold_up_a_window) {
  Play("hold ActivateConnection");
  const auto start = std::chrono::steady_clock::now();
  EXPECT_EQ(Dial("097"), 0U);
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(1));
  EXPECT_EQ(Names(), (std::vector<std::string>{"097", "tunnel"}));
}

TEST_F(ScriptedDialTest, A_dial_of_thirty_seconds_with_a_window_leaves_the_program_alive) {
  using Clock = std::chrono::steady_clock;
  auto lastTick = Clock::now();
  Clock::duration longestGap{};
  const auto ticks = loop.StartTimer(20, [&] {
    longestGap = std::max(longestGap, Clock::now() - lastTick);
    lastTick = Clock::now();
  });
  const auto begun = Clock::now();
  BeginDial("097");
  Play("device 40 0, device 50 0");
  Child later({"/bin/sh", "-c", "sleep 30; " + PlayCommand("device 100 0, active 2 1")});
  EXPECT_TRUE(loop.WaitFor(
      [&] { return !loop.changes.empty() && loop.changes.back().first == kRasConnected; }, 60'000));
  EXPECT_GE(Clock::now() - begun, std::chrono::seconds(30));
  EXPECT_LT(longestGap, std::chrono::seconds(1));
  EXPECT_EQ(loop.changes,
            (Changes{{kRasOpenPort, 0}, {kRasPortOpened, 0}, {kRasConnectDevice, 0}, {kRasConnected, 0}}));
  const auto spread = std::chrono::duration<double>(longestGap).count();
  RecordProperty("longest_gap_in_seconds", std::to_string(spread));
  std::printf("longest time between two ticks of 20 ms: %.3f s\n", spread);
}

TEST_F(ScriptedDialTest, User_name_and_password_of_a_dial_are_kept) {
  const Dialling::Notifier window{kRasNotifierIsWindow, DialLoop::kWindow};
  ASSERT_EQ(Save("097", "dan", "old"), 0U);
  EXPECT_EQ(dialling.RasDialA({}, nullptr, DialParamsFor("097", {}, "new"), window, handle), 0U);
  EXPECT_EQ(TextAt(Saved("097"), kUserNameAt), "dan");
  EXPECT_EQ(TextAt(Saved("097"), kPasswordAt), "new");
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
