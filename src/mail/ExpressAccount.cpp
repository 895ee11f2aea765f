#include "mail/ExpressAccount.h"

#include "foundation/RegEdit.h"
#include "platform/registry/Registry.h"
#include "runtime/ByteFields.h"
#include "runtime/Settings.h"

#include <array>
#include <vector>

namespace quendra::mail {

namespace {

using platform::Registry;
using platform::RegistryKey;

constexpr const char* kAccounts = "Software\\Microsoft\\Internet Account Manager\\Accounts";

struct Number {
  const char* name;
  std::uint32_t data;
};

constexpr std::array kNumbers{
    Number{"DCEmail", 2},
    Number{"POP3 Port", 110},
    Number{"SMTP Port", 25},
    Number{"Connection Type", 3},
    Number{"POP3 Timeout", 180},
    Number{"SMTP Timeout", 180},
    Number{"Leave Mail On Server", 0},
    Number{"POP3 Prompt for Password", 0},
    Number{"POP3 Skip Account", 0},
};

/// An open key, closed with the object.
class OpenKey {
 public:
  explicit OpenKey(Registry& registry) : registry_(registry) {}
  ~OpenKey() {
    if (key != platform::kNoRegistryKey) registry_.RegCloseKey(key);
  }
  OpenKey(const OpenKey&) = delete;
  OpenKey& operator=(const OpenKey&) = delete;

  RegistryKey key;

 private:
  Registry& registry_;
};

std::uint32_t OpenAccounts(Registry& registry, OpenKey& accounts) {
  const RegistryKey root = foundation::RegEdit::HiveFromName(u"HKEY_CURRENT_USER");
  if (registry.RegOpenKeyExA(root, kAccounts, platform::kSetValue, accounts.key) ==
      platform::kRegistrySuccess)
    return platform::kRegistrySuccess;
  OpenKey made(registry);
  const std::uint32_t error = registry.RegCreateKeyA(root, kAccounts, made.key);
  if (error != platform::kRegistrySuccess) return error;
  // Once: a key that still can't be opened can't be opened at all.
  return registry.RegOpenKeyExA(root, kAccounts, platform::kSetValue, accounts.key);
}

void WriteNumber(Registry& registry, RegistryKey key, const Number& number) {
  std::array<std::uint8_t, 4> bytes{};
  PutLittle32(bytes, 0, number.data);
  registry.RegSetValueExA(key, number.name, platform::kRegDword, bytes);
}

void WriteText(Registry& registry, RegistryKey key, const char* name, const Text& text) {
  std::string bytes = ToCodePage(text);
  bytes.push_back('\0');
  registry.RegSetValueExA(key, name, platform::kRegText,
                          std::vector<std::uint8_t>(bytes.begin(), bytes.end()));
}

// What the registry answers to a value isn't examined: an account with a value less still works.
void WriteValues(Registry& registry, RegistryKey key, const Text& userName, const Text& fullName) {
  for (const Number& number : kNumbers) WriteNumber(registry, key, number);
  WriteText(registry, key, "POP3 Server", settings::IspMailHost);
  WriteText(registry, key, "SMTP Server", settings::IspMailHost);
  WriteText(registry, key, "SMTP Display Name", fullName);
  WriteText(registry, key, "SMTP Email Address", userName + u"@" + settings::IspMailDomain);
  WriteText(registry, key, "POP3 User Name", userName);
  WriteText(registry, key, "Account Name", u"זלמר בינלאומי");
}

} // namespace

Text AccountKeyOf(Text domain) {
  if (!domain.empty() && domain[0] >= u'a' && domain[0] <= u'z')
    domain[0] = static_cast<char16_t>(domain[0] - u'a' + u'A');
  return domain;
}

std::int32_t ExpressAccount::CreateExpressAccount(const Text& userName, const Text& fullName) {
  OpenKey accounts(registry_);
  if (const auto error = OpenAccounts(registry_, accounts)) return static_cast<std::int32_t>(error);
  OpenKey account(registry_);
  if (const auto error = registry_.RegCreateKeyA(
          accounts.key, ToCodePage(AccountKeyOf(settings::IspMailDomain)), account.key))
    return static_cast<std::int32_t>(error);
  WriteValues(registry_, account.key, userName, fullName);
  return 0;
}

} // namespace quendra::mail
