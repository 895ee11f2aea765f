#include "mail/ExpressAccount.h"

#include "platform/simulated/registry/SimulatedRegistry.h"
#include "runtime/Settings.h"

#include <gtest/gtest.h>

namespace quendra::mail {
namespace {

using platform::RegistryValue;

constexpr const char* kAccounts =
    "HKEY_CURRENT_USER\\Software\\Microsoft\\Internet Account Manager\\Accounts";
constexpr const char* kOpenAccounts =
    "RegOpenKeyExA HKEY_CURRENT_USER\\Software\\Microsoft\\Internet Account Manager\\Accounts";
constexpr const char* kMakeAccounts =
    "RegCreateKeyA HKEY_CURRENT_USER\\Software\\Microsoft\\Internet Account Manager\\Accounts";

/// The provider's domain as the account's key is named.
std::string KeyName() {
  std::string name = ToCodePage(settings::IspMailDomain);
  name[0] = static_cast<char>(std::toupper(name[0]));
  return name;
}
std::string Account() { return std::string(kAccounts) + "\\" + KeyName(); }

RegistryValue NumberValue(std::uint8_t low) { return {4, {low, 0, 0, 0}}; }
RegistryValue TextValue(const std::string& bytes) {
  RegistryValue value{1, {bytes.begin(), bytes.end()}};
  value.data.push_back(0);
  return value;
}

/// Keeps with which access keys are opened, and refuses as often as it is told.
struct WatchedRegistry : platform::simulated::SimulatedRegistry {
  std::vector<std::uint32_t> access;
  std::vector<std::uint32_t> openErrors; ///< of the next calls
  std::uint32_t createError = 0;         ///< of keys below the accounts
  bool refuseValues = false;

  std::uint32_t RegOpenKeyExA(platform::RegistryKey parent, const std::string& path, std::uint32_t asked,
                              platform::RegistryKey& key) override {
    access.push_back(asked);
    if (openErrors.empty()) return SimulatedRegistry::RegOpenKeyExA(parent, path, asked, key);
    const auto told = openErrors.front();
    openErrors.erase(openErrors.begin());
    return told;
  }
  std::uint32_t RegCreateKeyA(platform::RegistryKey parent, const std::string& path,
                              platform::RegistryKey& key) override {
    if (createError != 0 && parent != platform::kCurrentUser) return createError;
    return SimulatedRegistry::RegCreateKeyA(parent, path, key);
  }
  std::uint32_t RegSetValueExA(platform::RegistryKey key, const std::string& name, std::uint32_t type,
                               std::span<const std::uint8_t> data) override {
    const auto error = SimulatedRegistry::RegSetValueExA(key, name, type, data);
    return refuseValues ? 5 : error;
  }
};

struct ExpressAccountTest : testing::Test {
  std::optional<RegistryValue> Value(const std::string& name) { return registry.Value(Account(), name); }
  std::int32_t Create() { return express.CreateExpressAccount(u"dana", u"דנה כהן"); }

  WatchedRegistry registry;
  ExpressAccount express{registry};
};

TEST_F(ExpressAccountTest, Every_number_is_written) {
  EXPECT_EQ(Create(), 0);

  EXPECT_EQ(Value("DCEmail"), NumberValue(2));
  EXPECT_EQ(Value("POP3 Port"), NumberValue(110));
  EXPECT_EQ(Value("SMTP Port"), NumberValue(25));
  EXPECT_EQ(Value("Connection Type"), NumberValue(3));
  EXPECT_EQ(Value("POP3 Timeout"), NumberValue(180));
  EXPECT_EQ(Value("SMTP Timeout"), NumberValue(180));
  EXPECT_EQ(Value("Leave Mail On Server"), NumberValue(0));
  EXPECT_EQ(Value("POP3 Prompt for Password"), NumberValue(0));
  EXPECT_EQ(Value("POP3 Skip Account"), NumberValue(0));
}

TEST_F(ExpressAccountTest, Every_text_is_written_with_its_NUL) {
  EXPECT_EQ(Create(), 0);

  const std::string host = ToCodePage(settings::IspMailHost);
  EXPECT_EQ(Value("POP3 Server"), TextValue(host));
  EXPECT_EQ(Value("SMTP Server"), TextValue(host));
  EXPECT_EQ(Value("SMTP Display Name"), TextValue("\xE3\xF0\xE4 \xEB\xE4\xEF"));
  EXPECT_EQ(Value("SMTP Email Address"), TextValue("dana@" + ToCodePage(settings::IspMailDomain)));
  EXPECT_EQ(Value("POP3 User Name"), TextValue("dana"));
  EXPECT_EQ(Value("Account Name"), TextValue("\xE6\xEC\xEE\xF8 \xE1\xE9\xF0\xEC\xE0\xE5\xEE\xE9"));
}

TEST_F(ExpressAccountTest, An_empty_name_is_a_text_of_its_NUL_alone) {
  EXPECT_EQ(express.CreateExpressAccount(u"", u""), 0);

  EXPECT_EQ(Value("SMTP Display Name"), (RegistryValue{1, {0}}));
  EXPECT_EQ(Value("POP3 User Name"), (RegistryValue{1, {0}}));
}

TEST_F(ExpressAccountTest, Where_there_is_no_account_yet_the_key_is_made_and_opened_again_for_writing) {
  EXPECT_EQ(Create(), 0);

  ASSERT_GE(registry.Calls.size(), 4u);
  EXPECT_EQ(registry.Calls[0], kOpenAccounts);
  EXPECT_EQ(registry.Calls[1], kMakeAccounts);
  EXPECT_EQ(std::count(registry.Calls.begin(), registry.Calls.end(), kOpenAccounts), 2);
  EXPECT_EQ(registry.access, (std::vector<std::uint32_t>{2, 2}));
  EXPECT_EQ(registry.OpenCount(), 0u);
}

TEST_F(ExpressAccountTest, Where_accounts_are_the_calls_are_one_opening_one_key_the_values_and_two_closings) {
  registry.AddKey(kAccounts);

  EXPECT_EQ(Create(), 0);

  std::vector<std::string> calls = registry.Calls;
  ASSERT_EQ(calls.size(), 19u);
  EXPECT_EQ(calls[0], kOpenAccounts);
  EXPECT_TRUE(calls[1].starts_with("RegCreateKeyA ") && calls[1].ends_with("\\" + KeyName())) << calls[1];
  calls.erase(calls.begin(), calls.begin() + 2);
  EXPECT_EQ(
      calls,
      (std::vector<std::string>{
          "RegSetValueExA DCEmail", "RegSetValueExA POP3 Port", "RegSetValueExA SMTP Port",
          "RegSetValueExA Connection Type", "RegSetValueExA POP3 Timeout", "RegSetValueExA SMTP Timeout",
          "RegSetValueExA Leave Mail On Server", "RegSetValueExA POP3 Prompt for Password",
          "RegSetValueExA POP3 Skip Account", "RegSetValueExA POP3 Server", "RegSetValueExA SMTP Server",
          "RegSetValueExA SMTP Display Name", "RegSetValueExA SMTP Email Address",
          "RegSetValueExA POP3 User Name", "RegSetValueExA Account Name", "RegCloseKey", "RegCloseKey"}));
  EXPECT_EQ(registry.OpenCount(), 0u);
}

TEST(AccountKeyOfTest, The_first_letter_of_the_domain_is_raised_and_nothing_else_changes) {
  EXPECT_EQ(AccountKeyOf(u"example.net"), u"Example.net");
  EXPECT_EQ(AccountKeyOf(u"a.aa"), u"A.aa");
  EXPECT_EQ(AccountKeyOf(u"z"), u"Z");
  for (const char16_t* domain : {u"", u"Example.net", u"1and.one", u"`x", u"{x", u"דואר.net"})
    EXPECT_EQ(AccountKeyOf(domain), domain) << ToUtf8(domain);
}

TEST_F(ExpressAccountTest, The_account_s_key_is_the_domain_with_its_first_letter_in_upper_case) {
  Create();

  const auto made = std::find_if(registry.Calls.begin(), registry.Calls.end(), [](const std::string& call) {
    return call.starts_with("RegCreateKeyA ") && call.find("Accounts") == std::string::npos;
  });
  ASSERT_NE(made, registry.Calls.end());
  EXPECT_EQ(made->substr(made->rfind('\\') + 1), KeyName());
}

TEST_F(ExpressAccountTest, An_account_of_the_same_name_is_overwritten_value_by_value_and_keeps_others) {
  registry.SetValue(Account(), "POP3 User Name", TextValue("former"));
  registry.SetValue(Account(), "SMTP Port", {1, {7}});
  registry.SetValue(Account(), "Signature", TextValue("kept"));

  EXPECT_EQ(Create(), 0);

  EXPECT_EQ(Value("POP3 User Name"), TextValue("dana"));
  EXPECT_EQ(Value("SMTP Port"), NumberValue(25));
  EXPECT_EQ(Value("Signature"), TextValue("kept"));
}

TEST_F(ExpressAccountTest, A_second_run_writes_the_same_values_again) {
  EXPECT_EQ(Create(), 0);
  EXPECT_EQ(Create(), 0);

  EXPECT_EQ(std::count(registry.Calls.begin(), registry.Calls.end(), "RegSetValueExA Account Name"), 2);
  EXPECT_EQ(Value("POP3 User Name"), TextValue("dana"));
}

TEST_F(ExpressAccountTest, No_value_holds_a_password) {
  Create();

  for (const std::string& call : registry.Calls)
    EXPECT_TRUE(call.find("Password") == std::string::npos ||
                call == "RegSetValueExA POP3 Prompt for Password")
        << call;
}

TEST_F(ExpressAccountTest, A_key_that_cannot_be_made_gives_its_error) {
  registry.RefuseAll(1009);

  EXPECT_EQ(Create(), 1009);

  EXPECT_EQ(registry.OpenCount(), 0u);
}

TEST_F(ExpressAccountTest, A_key_that_stays_closed_after_it_was_made_gives_that_error_and_no_endless_loop) {
  registry.openErrors = {2, 5};

  EXPECT_EQ(Create(), 5);

  EXPECT_EQ(registry.access.size(), 2u);
  EXPECT_EQ(registry.OpenCount(), 0u);
}

TEST_F(ExpressAccountTest, Any_failure_to_open_makes_the_key_and_tries_once_more) {
  registry.AddKey(kAccounts);
  registry.openErrors = {5};

  EXPECT_EQ(Create(), 0);

  EXPECT_EQ(Value("POP3 User Name"), TextValue("dana"));
  EXPECT_EQ(registry.OpenCount(), 0u);
}

TEST_F(ExpressAccountTest, An_account_whose_key_cannot_be_made_gives_its_error_and_leaves_nothing_open) {
  registry.createError = 112;

  EXPECT_EQ(Create(), 112);

  EXPECT_EQ(registry.OpenCount(), 0u);
  EXPECT_FALSE(registry.HasKey(Account()));
}

TEST_F(ExpressAccountTest, What_is_answered_to_a_value_is_not_examined) {
  registry.refuseValues = true;

  EXPECT_EQ(Create(), 0);

  EXPECT_EQ(std::count_if(registry.Calls.begin(), registry.Calls.end(),
                          [](const std::string& call) { return call.starts_with("RegSetValueExA"); }),
            15);
}

} // namespace
} // namespace quendra::mail
