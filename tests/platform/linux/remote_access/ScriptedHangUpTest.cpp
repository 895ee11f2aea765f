#include "platform/linux/network_manager/NewConnection.h"
#include "platform/linux/remote_access/EntrySettings.h"
#include "platform/linux/remote_access/ScriptedManagerFixture.h"

#include <signal.h>

#include <array>

namespace quendra::platform::linux_ {

namespace {

using Changes = DialLoop::Changes;

struct ScriptedHangUpTest : ScriptedManagerTest {
  void ConnectTo(const char* name) {
    BeginDial(name);
    Play("device 100 0, active 2 1");
    ASSERT_TRUE(Comes(kRasConnected, 0));
  }
  static std::string ActivateCommand(const std::string& connection) {
    return "dbus-send --system --print-reply --dest=org.freedesktop.NetworkManager "
           "/org/freedesktop/NetworkManager org.freedesktop.NetworkManager.ActivateConnection objpath:" +
           connection + " objpath:/ objpath:/";
  }
};

struct OtherProgram {
  forms::headless::PolledDesktop loop{};
  NetworkManagerBus connection{loop, loop};
  ConnectionBook book{connection};
  LinuxDialling dialling{book, connection, loop};
};

} // namespace

TEST_F(ScriptedHangUpTest, A_line_that_is_hung_up_while_it_is_dialled_tells_nothing_more) {
  BeginDial("097");
  Play("device 40 0");
  ASSERT_TRUE(Comes(kRasPortOpened, 0));
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  EXPECT_TRUE(WasAsked("DeactivateConnection 097"));
  Settle();
  EXPECT_EQ(loop.changes.back(), std::pair(std::uint32_t{kRasPortOpened}, 0U));
}

TEST_F(ScriptedHangUpTest, A_line_that_is_hung_up_at_once_ends_as_soon_as_it_is_known) {
  ASSERT_EQ(Dial("097"), 0U);
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  EXPECT_TRUE(WasAsked("DeactivateConnection 097"));
  EXPECT_EQ(loop.changes, (DialLoop::Changes{{kRasOpenPort, 0}}));
}

TEST_F(ScriptedHangUpTest, A_handle_may_be_hung_up_again_also_when_its_line_has_ended) {
  BeginDial("097");
  Play("device 120 13, active 4 3, forget");
  ASSERT_TRUE(loop.WaitFor([&] { return loop.changes.back().second != 0; }, 20'000));
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
}

TEST_F(ScriptedHangUpTest, A_second_client_sees_the_connection_and_ends_it) {
  ConnectTo("097");
  OtherProgram other;
  Bytes record(RasConnectionRecord::kBytes);
  PutLittle32(record, 0, RasConnectionRecord::kBytes);
  std::uint32_t bytes = RasConnectionRecord::kBytes, count = 0;
  ASSERT_EQ(other.dialling.RasEnumConnectionsA(record, bytes, count), 0U);
  ASSERT_EQ(count, 1U);
  EXPECT_EQ(TextAt(record, RasConnectionRecord::kEntryName), "097");
  EXPECT_EQ(TextAt(record, RasConnectionRecord::kDeviceType), "pppoe");

  EXPECT_EQ(other.dialling.RasHangUpA(RasConnection(Little32(record, RasConnectionRecord::kHandle))), 0U);

  EXPECT_TRUE(Comes(kRasDisconnected, kRasUserDisconnection));
  EXPECT_EQ(Connections().size(), 0U);
}

TEST_F(ScriptedHangUpTest, A_hang_up_that_is_not_permitted_keeps_the_handle) {
  BeginDial("097");
  Play("device 40 0");
  ASSERT_TRUE(Comes(kRasPortOpened, 0));
  Play("refuse DeactivateConnection org.freedesktop.NetworkManager.PermissionDenied");
  EXPECT_EQ(dialling.RasHangUpA(handle), kAccessDenied);
  EXPECT_EQ(dialling.RasHangUpA(handle), kAccessDenied) << "also when it is tried again";

  Play("device 100 0, active 2 1");
  EXPECT_TRUE(Comes(kRasConnected, 0)) << "the window hears of the line as before";
  ASSERT_EQ(Connections().size(), 1U);
  EXPECT_EQ(Connections().front().second, handle);
  Play("allow DeactivateConnection");
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  EXPECT_TRUE(WasAsked("DeactivateConnection 097"));
  EXPECT_EQ(Connections().size(), 0U);
}

TEST_F(ScriptedHangUpTest, A_line_of_another_program_that_may_not_be_hung_up_keeps_its_handle) {
  BeginDial("097");
  Play("device 100 0, active 2 1, refuse DeactivateConnection "
       "org.freedesktop.NetworkManager.PermissionDenied");
  OtherProgram other;
  const auto theirs = ConnectionsOf(other.dialling);
  ASSERT_EQ(theirs.size(), 1U);
  EXPECT_EQ(other.dialling.RasHangUpA(theirs.front().second), kAccessDenied);
  EXPECT_EQ(other.dialling.RasHangUpA(theirs.front().second), kAccessDenied);
}

TEST_F(ScriptedHangUpTest, A_line_whose_manager_has_gone_can_be_hung_up) {
  BeginDial("097");
  manager->End();
  ASSERT_TRUE(Comes(kRasOpenPort, kRasManagerCannotStart));
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
}

TEST_F(ScriptedHangUpTest, A_manager_that_stands_still_keeps_the_handle_until_it_goes_on) {
  BeginDial("097");
  Play("device 40 0");
  ASSERT_TRUE(Comes(kRasPortOpened, 0));
  ::kill(manager->Id(), SIGSTOP);
  EXPECT_EQ(dialling.RasHangUpA(handle), kRasManagerCannotStart);
  ::kill(manager->Id(), SIGCONT);
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  EXPECT_TRUE(WasAsked("DeactivateConnection 097"));
}

TEST_F(ScriptedHangUpTest, A_line_that_is_listed_before_its_answer_has_one_handle) {
  Play("hold ActivateConnection");
  BeginDial("097");
  ASSERT_EQ(Connections().size(), 1U);
  EXPECT_EQ(Connections().front().second, handle);

  Play("release, device 100 0, active 2 1");
  EXPECT_TRUE(Comes(kRasConnected, 0));
  ASSERT_EQ(Connections().size(), 1U);
  EXPECT_EQ(Connections().front().second, handle);
}

TEST_F(ScriptedHangUpTest, A_line_that_stands_when_the_way_to_its_manager_breaks_is_listed_and_ended) {
  ConnectTo("097");
  BreakConnections();
  ASSERT_TRUE(Comes(kRasDisconnected, kRasManagerCannotStart));
  const auto standing = Connections();
  ASSERT_EQ(standing.size(), 1U);
  EXPECT_EQ(standing.front().first, "097");
  EXPECT_EQ(dialling.RasHangUpA(standing.front().second), 0U);
  EXPECT_TRUE(WasAsked("DeactivateConnection 097"));
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U) << "the former handle is let go, too";
  EXPECT_TRUE(Connections().empty());
}

TEST_F(ScriptedHangUpTest, A_handle_ends_its_line_also_after_the_way_to_its_manager_broke) {
  ConnectTo("097");
  BreakConnections();
  ASSERT_TRUE(Comes(kRasDisconnected, kRasManagerCannotStart));
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  EXPECT_TRUE(WasAsked("DeactivateConnection 097"));
  EXPECT_TRUE(Connections().empty());
}

TEST_F(ScriptedHangUpTest, A_line_lost_sight_of_is_let_go_where_nobody_answers_any_more) {
  ConnectTo("097");
  BreakConnections();
  ASSERT_TRUE(Comes(kRasDisconnected, kRasManagerCannotStart));
  ::kill(manager->Id(), SIGSTOP);
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
}

TEST_F(ScriptedHangUpTest, A_handle_of_a_former_manager_ends_nothing_of_the_next_one) {
  ConnectTo("097");
  manager->End();
  ASSERT_TRUE(Comes(kRasDisconnected, kRasManagerCannotStart));
  StartManager();
  ASSERT_EQ(Put("other", EntryFor("pppoe")), 0U);
  ASSERT_EQ(Put("097", EntryFor("pppoe")), 0U);
  ASSERT_TRUE(RunShell(ActivateCommand("/org/freedesktop/NetworkManager/Settings/1"))) << "of the same path";
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  ASSERT_EQ(Connections().size(), 1U);
  EXPECT_EQ(Connections().front().first, "other");
}

TEST_F(ScriptedHangUpTest, A_line_is_ended_also_where_another_entry_has_its_name) {
  NetworkSettings second = NewConnection("097");
  ASSERT_TRUE(PutEntryImage(second, EntryFor("pppoe")));
  ASSERT_EQ(book.Add(second), 0U);
  EXPECT_EQ(Names(), (std::vector<std::string>{"097", "tunnel"}));
  for (const char* path :
       {"/org/freedesktop/NetworkManager/Settings/1", "/org/freedesktop/NetworkManager/Settings/3"}) {
    ASSERT_TRUE(RunShell(ActivateCommand(path)));
    const auto standing = Connections();
    ASSERT_EQ(standing.size(), 1U) << path;
    EXPECT_EQ(standing.front().first, "097");
    EXPECT_EQ(dialling.RasHangUpA(standing.front().second), 0U);
    EXPECT_TRUE(Connections().empty()) << path;
  }
}

TEST_F(ScriptedHangUpTest, Lines_that_nobody_answers_for_are_no_missing_lines) {
  ConnectTo("097");
  OtherProgram other;
  const auto before = ConnectionsOf(other.dialling);
  ASSERT_EQ(before.size(), 1U);
  Play("refuse GetAll org.freedesktop.DBus.Error.NoReply");
  std::uint32_t bytes = 0, count = 0;
  EXPECT_EQ(other.dialling.RasEnumConnectionsA({}, bytes, count), kRasManagerCannotStart);
  Play("allow GetAll");
  EXPECT_EQ(ConnectionsOf(other.dialling), before) << "each has kept its handle";
}

TEST_F(ScriptedHangUpTest, A_line_that_ends_while_the_manager_is_asked_for_is_not_ended_again) {
  ConnectTo("097");
  Play("hold Get, refuse DeactivateConnection org.freedesktop.NetworkManager.PermissionDenied");
  Child later(Once("held Get", PlayCommand("device 120 13, active 4 3, forget, release")));
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
  EXPECT_TRUE(Comes(kRasDisconnected, kRasPortDisconnected));
}

TEST_F(ScriptedHangUpTest, The_text_that_there_is_no_manager_needs_none) {
  manager->End();
  std::array<char, 512> text{};
  EXPECT_EQ(dialling.RasGetErrorStringA(kRasManagerCannotStart, text), 0U);
  EXPECT_EQ(std::string_view(text.data()), "The Remote Access Service Manager could not start.");
}

} // namespace quendra::platform::linux_
