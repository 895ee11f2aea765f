#include "provisioning/remote_access/MdlDunFixture.h"

namespace quendra::provisioning {
namespace {

using platform::kNoRasConnection;
using platform::kRasNotifierIsWindow;

struct MdlDunDials : MdlDunFixture {
  MdlDunDials() {
    ras.AddEntry("Home");
    ras.AddEntry("Other");
  }
  std::int32_t DialAlone(Text& name) { return dun.DialEntry(kFalse16, name, phone, user, password); }
  std::int32_t DialWith(std::optional<WindowHandle> target) {
    return dun.DialEntry(kTrue16, home, phone, user, password, target);
  }
  RasDialParamsRecord Dialled() {
    RasDialParamsRecord dialled;
    dun.DialParamsFromBytes(ras.Dials.back().params, dialled);
    return dialled;
  }

  const WindowHandle window = desktop.Windows.Create();
  Text phone;
  Text user;
  Text password;
};

const Box kAlreadyOpen =
    ExclamationBox(u"  Connection Already Opened", u"There is currently already a connection open.");

TEST_F(MdlDunDials, A_dial_hands_over_the_four_texts_in_the_longest_record) {
  ras.Refuse("RasGetEntryDialParamsA", 632);
  phone = u"10.0.0.138";
  user = u"user";
  password = u"secret";

  EXPECT_EQ(DialAlone(home), 0);

  ASSERT_EQ(ras.Dials.size(), 1U);
  EXPECT_EQ(Dialled(), (RasDialParamsRecord{.size = 1060,
                                            .entryName = u"Home",
                                            .phoneNumber = u"10.0.0.138",
                                            .userName = u"user",
                                            .password = u"secret"}));
  EXPECT_EQ(ras.PhoneBookOf["RasDialA"], std::nullopt);
  EXPECT_EQ(ras.PhoneBookOf["RasGetEntryDialParamsA"], std::nullopt);
}

TEST_F(MdlDunDials, Each_text_that_is_not_empty_gets_a_NUL) {
  phone = u"1";
  user = Text(u"user\0", 5);

  DialAlone(home);

  EXPECT_EQ(home, Text(u"Home\0", 5));
  EXPECT_EQ(phone, Text(u"1\0", 2));
  EXPECT_EQ(user, Text(u"user\0", 5));
  EXPECT_EQ(password, u"");
}

TEST_F(MdlDunDials, An_empty_name_becomes_a_NUL_and_is_dialled) {
  Text noName;

  EXPECT_EQ(DialAlone(noName), 0);

  EXPECT_EQ(noName, Text(1, u'\0'));
  EXPECT_EQ(ras.Dials.size(), 1U);
  EXPECT_EQ(dun.ActiveRasConn, kNoRasConnection);
}

TEST_F(MdlDunDials, A_saved_user_name_and_password_win_over_those_that_are_handed_in) {
  ras.Entry("Home")->SetLogin("saved", "kept");
  user = u"user";
  password = u"secret";

  DialAlone(home);

  EXPECT_EQ(Dialled().userName, u"saved");
  EXPECT_EQ(Dialled().password, u"kept");
}

TEST_F(MdlDunDials, A_dial_without_a_window_tells_nobody) {
  EXPECT_EQ(DialAlone(home), 0);

  EXPECT_EQ(ras.Dials[0].notifier.type, 0U);
  EXPECT_EQ(ras.Dials[0].notifier.window, kNoWindow);
  EXPECT_EQ(dun.ActiveRasConn, ras.Connections().front().handle);
}

TEST_F(MdlDunDials, Extensions_hold_nothing_but_their_size) {
  DialAlone(home);

  Bytes extensions(16);
  extensions[0] = 16;
  EXPECT_EQ(ras.Dials[0].extensions, extensions);
}

TEST_F(MdlDunDials, An_asynchronous_dial_tells_its_window) {
  EXPECT_EQ(DialWith(window), 0);

  EXPECT_EQ(ras.Dials[0].notifier.type, kRasNotifierIsWindow);
  EXPECT_EQ(ras.Dials[0].notifier.window, window);
  EXPECT_EQ(dun.ActiveRasConn, ras.Connections().front().handle);
}

TEST_F(MdlDunDials, A_window_is_told_only_with_the_flag_at_minus_1) {
  for (const std::int16_t flag : {0, 1, -2}) {
    dun.DialEntry(flag, home, phone, user, password, window);
    EXPECT_EQ(ras.Dials.back().notifier.type, 0U) << flag;
    dun.HangUpActive(kFalse16);
  }
  DialWith({});
  EXPECT_EQ(ras.Dials.back().notifier.type, 0U);
}

TEST_F(MdlDunDials, The_window_0_goes_to_the_system_as_any_other_and_makes_the_dial_wait) {
  ras.Dial("Home").Then(5).ThenError(691);

  EXPECT_EQ(DialWith(kNoWindow), 0);

  EXPECT_EQ(ras.Dials[0].notifier.type, kRasNotifierIsWindow);
  EXPECT_EQ(ras.Dials[0].notifier.window, kNoWindow);
  EXPECT_EQ(dun.ActiveRasConn, kNoRasConnection);
  EXPECT_EQ(dun.PreviousWndProc, nullptr);
}

TEST_F(MdlDunDials, What_the_dial_gives_is_not_looked_at) {
  ras.Refuse("RasDialA", 633);

  EXPECT_EQ(DialWith(window), 0);

  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_EQ(dun.ActiveRasConn, kNoRasConnection);
}

TEST_F(MdlDunDials, An_open_connection_is_told_and_nothing_is_dialled) {
  DialAlone(home);
  Text other = u"Other";

  EXPECT_EQ(DialAlone(other), 0);

  ExpectOneBox(kAlreadyOpen);
  EXPECT_EQ(ras.Dials.size(), 1U);
  EXPECT_EQ(other, u"Other");
}

TEST_F(MdlDunDials, A_failed_dial_whose_handle_is_still_set_counts_as_open) {
  ras.Dial("Home").ThenError(678);
  DialWith(window);
  desktop.RunUntilIdle();

  DialWith(window);

  ExpectOneBox(kAlreadyOpen);
  EXPECT_EQ(ras.Dials.size(), 1U);
}

// Hanging up.

TEST_F(MdlDunDials, A_hang_up_forgets_the_connection) {
  DialAlone(home);

  EXPECT_EQ(dun.HangUpActive(kTrue16), kTrue16);

  EXPECT_EQ(dun.ActiveRasConn, kNoRasConnection);
  EXPECT_TRUE(ras.Connections().empty());
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(MdlDunDials, A_hang_up_without_a_connection_is_told_and_succeeds) {
  EXPECT_EQ(dun.HangUpActive(kTrue16), kTrue16);

  ExpectOneBox(
      ExclamationBox(u"  No Connection Open To Close", u"There is currently no connection open to close."));
  EXPECT_EQ(ras.Count("RasHangUpA"), 0);
}

TEST_F(MdlDunDials, A_silent_hang_up_without_a_connection_succeeds) {
  EXPECT_EQ(dun.HangUpActive(kFalse16), kTrue16);

  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(MdlDunDials, A_hang_up_that_fails_keeps_the_connection_and_is_told) {
  DialAlone(home);
  const auto connection = dun.ActiveRasConn;
  ras.Refuse("RasHangUpA", 5);

  EXPECT_EQ(dun.HangUpActive(kTrue16), kFalse16);
  EXPECT_EQ(dun.HangUpActive(kFalse16), kFalse16);

  EXPECT_EQ(dun.ActiveRasConn, connection);
  ExpectOneBox(RasErrorBox(u"RasHangUp", u"5", u"Access is denied.\r\n"));
}

TEST_F(MdlDunDials, A_connection_that_another_program_hung_up_stays_set) {
  machine.system.MessageTexts[6] = "The handle is invalid.";
  DialAlone(home);
  ras.Disconnect("Home");

  EXPECT_EQ(dun.HangUpActive(kTrue16), kFalse16);

  EXPECT_NE(dun.ActiveRasConn, kNoRasConnection);
  ExpectOneBox(RasErrorBox(u"RasHangUp", u"6", u"The handle is invalid."));
}

TEST_F(MdlDunDials, Without_connections_none_is_hung_up_and_it_succeeds) {
  EXPECT_EQ(dun.HangUpAllConnections(), kTrue16);

  EXPECT_EQ(ras.Count("RasEnumConnectionsA"), 1);
  EXPECT_EQ(ras.Count("RasHangUpA"), 0);
}

struct ConnectionsBySize : MdlDunDials, testing::WithParamInterface<std::uint32_t> {};

TEST_P(ConnectionsBySize, Are_all_hung_up_in_order) {
  ras.ConnectionSizes = {GetParam()};
  ras.Connect("Home");
  ras.Connect("Other");

  EXPECT_EQ(dun.HangUpAllConnections(), kTrue16);

  EXPECT_EQ(machine.Calls, (Lines{"RasHangUpA Home", "RasHangUpA Other"}));
  EXPECT_TRUE(ras.Connections().empty());
}

INSTANTIATE_TEST_SUITE_P(Published, ConnectionsBySize, testing::Values(692, 676, 412, 32),
                         [](const auto& tested) { return std::to_string(tested.param); });

TEST_F(MdlDunDials, A_size_that_the_buffer_is_not_good_for_is_passed_over_as_one_that_the_system_lacks) {
  ras.Connect("Home");
  ras.Refuse("RasEnumConnectionsA", 610);

  EXPECT_EQ(dun.HangUpAllConnections(), kTrue16);

  EXPECT_EQ(ras.Count("RasEnumConnectionsA"), 4);
  EXPECT_EQ(ras.Connections().size(), 1U);
}

TEST_F(MdlDunDials, Any_other_failure_ends_the_search_for_the_size) {
  ras.IsThere = false;

  EXPECT_EQ(dun.HangUpAllConnections(), kTrue16);

  EXPECT_EQ(ras.Count("RasEnumConnectionsA"), 1);
}

TEST_F(MdlDunDials, Hanging_up_all_gives_what_the_last_one_gave) {
  ras.Connect("Home");
  ras.Connect("Other");
  ras.Refuse("RasHangUpA", 5, 1);
  EXPECT_EQ(dun.HangUpAllConnections(), kFalse16);

  ras.Allow("RasHangUpA");
  EXPECT_EQ(dun.HangUpAllConnections(), kTrue16);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(MdlDunDials, Connections_that_cannot_be_told_are_not_hung_up) {
  ras.Connect("Home");
  ras.Refuse("RasEnumConnectionsA", 711, 1);

  EXPECT_EQ(dun.HangUpAllConnections(), kFalse16);

  EXPECT_EQ(ras.Count("RasHangUpA"), 0);
}

TEST_F(MdlDunDials, Hanging_up_all_leaves_the_own_handle_set) {
  DialAlone(home);

  dun.HangUpAllConnections();

  EXPECT_NE(dun.ActiveRasConn, kNoRasConnection);
}

} // namespace
} // namespace quendra::provisioning
