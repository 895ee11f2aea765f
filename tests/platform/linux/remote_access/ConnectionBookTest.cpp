#include "platform/linux/remote_access/ScriptedManagerFixture.h"

namespace quendra::platform::linux_ {

namespace {

using ConnectionBookTest = ScriptedManagerTest;

constexpr const char* kNobodyAnswers = "org.freedesktop.DBus.Error.NoReply";

} // namespace

TEST_F(ConnectionBookTest, Connections_that_nobody_answers_for_are_no_missing_entries) {
  Play(std::string("refuse GetSettings ") + kNobodyAnswers);
  std::uint32_t bytes = 0, count = 0;
  EXPECT_EQ(phoneBook.RasEnumEntriesA(nullptr, {}, bytes, count), kRasManagerCannotStart);
  EXPECT_EQ(phoneBook.RasDeleteEntryA(nullptr, "097"), kRasManagerCannotStart);
  EXPECT_EQ(Put("097", EntryFor("pppoe")), kRasManagerCannotStart);

  Play("allow GetSettings");
  EXPECT_EQ(Names(), (std::vector<std::string>{"097", "tunnel"}));
  EXPECT_EQ(OutputOf("grep -c 'AddConnection 097' " + (bus.folder / "asked")), "1\n")
      << "there is no second one";
}

TEST_F(ConnectionBookTest, Connections_that_are_private_to_another_user_are_no_entries) {
  Play("refuse GetSettings org.freedesktop.NetworkManager.Settings.PermissionDenied");
  ConnectionBook fresh(connection);
  std::vector<Line> lines;
  EXPECT_EQ(fresh.ReadLines(lines), 0U);
  EXPECT_TRUE(lines.empty());
}

TEST_F(ConnectionBookTest, A_change_that_is_put_to_the_user_first_may_take_longer_than_a_question) {
  Play("hold AddConnection");
  Child user({"/bin/sh", "-c", "sleep 6; " + PlayCommand("release")});
  EXPECT_EQ(Put("other", EntryFor("pppoe")), 0U);
  EXPECT_EQ(Names(), (std::vector<std::string>{"097", "other", "tunnel"}));
}

TEST_F(ConnectionBookTest, A_password_is_neither_saved_nor_removed_while_nobody_tells_the_secrets) {
  for (const char* name : {"097", "tunnel"}) {
    ASSERT_EQ(Save(name, "dan", "old"), 0U);
    Play(std::string("refuse GetSecrets ") + kNobodyAnswers);
    Bytes params = DialParamsFor(name);
    bool hasPassword = true;
    EXPECT_EQ(phoneBook.RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasManagerCannotStart);
    EXPECT_EQ(Save(name, "dan", "new"), kRasManagerCannotStart);
    EXPECT_EQ(phoneBook.RasSetEntryDialParamsA(nullptr, DialParamsFor(name, "dan"), true),
              kRasManagerCannotStart);
    Play("allow GetSecrets");
    EXPECT_EQ(TextAt(Saved(name), kPasswordAt), "old");
  }
}

TEST_F(ConnectionBookTest, A_password_that_may_not_be_known_is_not_shown_and_not_told_as_removed) {
  ASSERT_EQ(Save("097", "dan", "old"), 0U);
  Play("refuse GetSecrets org.freedesktop.NetworkManager.Settings.PermissionDenied");
  EXPECT_EQ(TextAt(Saved("097"), kUserNameAt), "dan");
  EXPECT_EQ(TextAt(Saved("097"), kPasswordAt), "");
  EXPECT_EQ(phoneBook.RasSetEntryDialParamsA(nullptr, DialParamsFor("097", "dan"), true), kAccessDenied);
  EXPECT_EQ(dialling.RasDialA({}, nullptr, DialParamsFor("097", "dan"),
                              {kRasNotifierIsWindow, DialLoop::kWindow}, handle),
            0U)
      << "the line can be dialled as it is";
}

TEST_F(ConnectionBookTest, A_password_goes_alone_and_the_last_secret_goes_too) {
  ASSERT_EQ(Save("097", "dan", "old"), 0U);
  ASSERT_EQ(Save("tunnel", "dan", "old"), 0U);
  for (const char* name : {"097", "tunnel"}) {
    ASSERT_EQ(phoneBook.RasSetEntryDialParamsA(nullptr, DialParamsFor(name, "dan", "x"), true), 0U);
    EXPECT_EQ(TextAt(Saved(name), kUserNameAt), "dan");
    EXPECT_EQ(TextAt(Saved(name), kPasswordAt), "");
  }
}

TEST(BusAnswer, A_refusal_is_for_want_of_a_right_or_for_another_reason) {
  for (const char* name :
       {"org.freedesktop.NetworkManager.PermissionDenied",
        "org.freedesktop.NetworkManager.Settings.PermissionDenied",
        "org.freedesktop.NetworkManager.Device.NotAuthorized", "org.freedesktop.DBus.Error.AccessDenied"})
    EXPECT_TRUE((BusAnswer{BusAnswer::Kind::Refused, {}, name}.IsForbidden())) << name;
  for (const char* name : {"", "org.freedesktop.NetworkManager.UnknownDevice", "NotAuthorized.Not"})
    EXPECT_FALSE((BusAnswer{BusAnswer::Kind::Refused, {}, name}.IsForbidden())) << name;
  EXPECT_FALSE((BusAnswer{BusAnswer::Kind::NobodyThere, {}, "x.AccessDenied"}.IsForbidden()));
}

} // namespace quendra::platform::linux_
