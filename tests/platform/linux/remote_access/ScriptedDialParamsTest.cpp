#include "platform/linux/remote_access/ScriptedManagerFixture.h"

namespace quendra::platform::linux_ {

namespace {

struct ScriptedDialParamsTest : ScriptedManagerTest {
  std::uint32_t DialAs(std::string_view user, std::string_view password) {
    return dialling.RasDialA({}, nullptr, DialParamsFor("097", user, password),
                             {kRasNotifierIsWindow, DialLoop::kWindow}, handle);
  }
  /// Another program changes the connection's setting while the manager puts that question to the user.
  std::unique_ptr<Child> ChangedDuring(const std::string& question, const std::string& change) {
    Play("hold " + question);
    return std::make_unique<Child>(
        Once("held " + question, PlayCommand("change 1 pppoe " + change + ", release")));
  }
};

} // namespace

TEST_F(ScriptedDialParamsTest, A_dial_without_a_password_asks_for_no_secrets) {
  ASSERT_EQ(Save("097", "dan", "old"), 0U);
  Play("refuse GetSecrets org.freedesktop.DBus.Error.NoReply");
  EXPECT_EQ(DialAs("dan", ""), 0U);
  EXPECT_EQ(DialAs("dana", ""), 0U);
  Play("allow GetSecrets");
  EXPECT_EQ(TextAt(Saved("097"), kUserNameAt), "dana");
  EXPECT_EQ(TextAt(Saved("097"), kPasswordAt), "old");
}

TEST_F(ScriptedDialParamsTest, A_dial_that_changes_nothing_is_no_change_of_the_entry) {
  ASSERT_EQ(Save("097", "dan", "old"), 0U);
  const auto updates = CountAsked("Update 097");
  EXPECT_EQ(DialAs("dan", ""), 0U);
  EXPECT_EQ(DialAs("dan", "old"), 0U);
  EXPECT_EQ(CountAsked("Update 097"), updates);
}

TEST_F(ScriptedDialParamsTest, A_dial_with_a_password_asks_for_the_secrets_once) {
  ASSERT_EQ(Save("097", "dan", "old"), 0U);
  ASSERT_EQ(CountAsked("GetSecrets 097"), 1U);
  EXPECT_EQ(DialAs("dan", "new"), 0U);
  EXPECT_EQ(CountAsked("GetSecrets 097"), 2U);
  EXPECT_EQ(TextAt(Saved("097"), kPasswordAt), "new");
}

TEST_F(ScriptedDialParamsTest, What_changes_while_the_user_is_asked_for_secrets_is_kept) {
  const auto other = ChangedDuring("GetSecrets", "service isp");
  EXPECT_EQ(Save("097", "dan", "new"), 0U);
  EXPECT_EQ(TextAt(Entry("097"), RasEntry::kLocalPhoneNumber), "isp");
  EXPECT_EQ(TextAt(Saved("097"), kPasswordAt), "new");
}

TEST_F(ScriptedDialParamsTest, What_changes_while_a_dial_asks_for_secrets_is_kept) {
  ASSERT_EQ(Save("097", "dan", "old"), 0U);
  const auto other = ChangedDuring("GetSecrets", "username dana");
  EXPECT_EQ(DialAs("", "new"), 0U);
  EXPECT_EQ(TextAt(Saved("097"), kUserNameAt), "dana");
  EXPECT_EQ(TextAt(Saved("097"), kPasswordAt), "new");
}

TEST_F(ScriptedDialParamsTest, What_changes_while_the_user_is_asked_to_let_secrets_go_is_kept) {
  ASSERT_EQ(Save("097", "dan", "old"), 0U);
  const auto other = ChangedDuring("ClearSecrets", "service isp");
  EXPECT_EQ(phoneBook.RasSetEntryDialParamsA(nullptr, DialParamsFor("097", "dana"), true), 0U);
  EXPECT_EQ(TextAt(Entry("097"), RasEntry::kLocalPhoneNumber), "isp");
  EXPECT_EQ(TextAt(Saved("097"), kUserNameAt), "dana");
  EXPECT_EQ(TextAt(Saved("097"), kPasswordAt), "");
}

} // namespace quendra::platform::linux_
