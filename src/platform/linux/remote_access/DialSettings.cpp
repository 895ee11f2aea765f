#include "platform/linux/remote_access/DialSettings.h"

#include "platform/linux/remote_access/EntryFields.h"
#include "platform/linux/system/Files.h"
#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"
#include "runtime/Text.h"

#include <array>

namespace quendra::platform::linux_ {

namespace {

using Params = RasDialParams;

constexpr std::size_t kPhoneNumber = Params::kEntryName + Params::kEntryNameBytes;
constexpr std::size_t kCallbackNumber = kPhoneNumber + Params::kPhoneNumberBytes;
constexpr std::size_t kUserName = kCallbackNumber + Params::kCallbackNumberBytes;
constexpr std::size_t kPassword = kUserName + Params::kUserNameBytes;
constexpr std::size_t kDomain = kPassword + Params::kPasswordBytes;

struct DialText {
  const char* key;
  std::size_t at;
  std::size_t bytes;
};
struct DialNumber {
  const char* key;
  std::size_t at;
};

/// What is kept in a connection's user data.
constexpr std::array kTexts{
    DialText{"quendra.dial.phone-number", kPhoneNumber, Params::kPhoneNumberBytes},
    DialText{"quendra.dial.callback-number", kCallbackNumber, Params::kCallbackNumberBytes},
    DialText{"quendra.dial.domain", kDomain, Params::kDomainBytes}};
constexpr std::array kNumbers{DialNumber{"quendra.dial.sub-entry", Params::kSubEntry},
                              DialNumber{"quendra.dial.callback-id", Params::kCallbackId}};

std::string At(const TextMap& texts, const char* key) {
  const auto found = texts.find(key);
  return found == texts.end() ? std::string() : found->second;
}

std::string UserNameIn(const NetworkSettings& settings, LineKind kind) {
  if (kind == LineKind::Vpn) return At(TextsIn(settings, "vpn", "data"), "user");
  const std::string name = TextIn(settings, "pppoe", "username");
  return name == kNoUserName ? std::string() : name;
}

void PutUserName(NetworkSettings& settings, LineKind kind, const std::string& name) {
  if (kind == LineKind::Pppoe)
    return PutText(settings, "pppoe", "username", name.empty() ? kNoUserName : name);
  TextMap data = TextsIn(settings, "vpn", "data");
  PutTextIn(data, "user", name);
  PutTexts(settings, "vpn", "data", data);
}

} // namespace

void ShowDialParams(const NetworkSettings& settings, LineKind kind, std::span<std::uint8_t> params) {
  const TextMap data = TextsIn(settings, "user", "data");
  for (const DialText& text : kTexts)
    PutFieldText(params, text.at, text.bytes, Shown(At(data, text.key), text.bytes));
  for (const DialNumber& number : kNumbers)
    PutLittle32(params, number.at, WholeNumber(At(data, number.key)).value_or(0));
  PutFieldText(params, kUserName, Params::kUserNameBytes,
               Shown(UserNameIn(settings, kind), Params::kUserNameBytes));
  PutFieldText(params, kPassword, Params::kPasswordBytes, {});
}

void PutDialParams(NetworkSettings& settings, LineKind kind, std::span<const std::uint8_t> params) {
  TextMap data = TextsIn(settings, "user", "data");
  for (const DialText& text : kTexts)
    PutTextIn(data, text.key,
              Kept(At(data, text.key), std::string(FieldText(params, text.at, text.bytes)), text.bytes));
  for (const DialNumber& number : kNumbers) {
    const std::uint32_t value = Little32(params, number.at);
    PutTextIn(data, number.key, value == 0 ? std::string() : std::to_string(value));
  }
  if (!data.empty() || settings.contains("user")) PutTexts(settings, "user", "data", data);
  const std::string name(FieldText(params, kUserName, Params::kUserNameBytes));
  PutUserName(settings, kind, Kept(UserNameIn(settings, kind), name, Params::kUserNameBytes));
}

const char* SecretSettingOf(LineKind kind) { return DeviceTypeOf(kind); }

std::string PasswordIn(const NetworkSettings& secrets, LineKind kind) {
  return kind == LineKind::Pppoe ? TextIn(secrets, "pppoe", "password")
                                 : At(TextsIn(secrets, "vpn", "secrets"), "password");
}

bool PutOtherSecrets(NetworkSettings& settings, LineKind kind, const NetworkSettings& secrets) {
  NetworkSettings others = secrets;
  if (kind == LineKind::Pppoe) {
    others["pppoe"].erase("password");
  } else {
    TextMap held = TextsIn(secrets, "vpn", "secrets");
    held.erase("password");
    PutTexts(others, "vpn", "secrets", held);
  }
  bool hasAny = false;
  for (const auto& [setting, values] : others)
    for (const auto& [key, value] : values) settings[setting][key] = value, hasAny = true;
  return hasAny;
}

void PutPassword(NetworkSettings& settings, LineKind kind, const NetworkSettings& secrets,
                 const std::string& password) {
  PutOtherSecrets(settings, kind, secrets);
  if (password.empty()) return;
  if (kind == LineKind::Pppoe) {
    PutText(settings, "pppoe", "password", password);
    settings["pppoe"].erase("password-flags");
    return;
  }
  TextMap held = TextsIn(settings, "vpn", "secrets");
  held["password"] = password;
  PutTexts(settings, "vpn", "secrets", held);
  TextMap data = TextsIn(settings, "vpn", "data");
  data["password-flags"] = "0";
  PutTexts(settings, "vpn", "data", data);
}

bool HasUserOrPassword(std::span<const std::uint8_t> params) {
  return params[kUserName] != 0 || params[kPassword] != 0;
}

void PutUserAndPassword(std::span<std::uint8_t> params, std::span<const std::uint8_t> given) {
  if (given[kUserName] != 0)
    PutFieldText(params, kUserName, Params::kUserNameBytes,
                 FieldText(given, kUserName, Params::kUserNameBytes));
  if (given[kPassword] != 0)
    PutFieldText(params, kPassword, Params::kPasswordBytes,
                 FieldText(given, kPassword, Params::kPasswordBytes));
}

std::string_view PasswordField(std::span<const std::uint8_t> params) {
  return FieldText(params, kPassword, Params::kPasswordBytes);
}

void PutPasswordField(std::span<std::uint8_t> params, const std::string& password) {
  PutFieldText(params, kPassword, Params::kPasswordBytes, Shown(password, Params::kPasswordBytes));
}

} // namespace quendra::platform::linux_
