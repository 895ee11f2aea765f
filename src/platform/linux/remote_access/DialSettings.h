#pragma once

#include "platform/linux/remote_access/LineSettings.h"

namespace quendra::platform::linux_ {

/// Fills a RasDialParams behind its entry name, but for the password.
void ShowDialParams(const NetworkSettings& settings, LineKind kind, std::span<std::uint8_t> params);
/// Puts all but the password into a connection's settings; what doesn't change stays as it is.
void PutDialParams(NetworkSettings& settings, LineKind kind, std::span<const std::uint8_t> params);

/// The setting that holds the password of such a connection.
const char* SecretSettingOf(LineKind kind);
/// As NetworkManager tells secrets; empty where there is none. UTF-8.
std::string PasswordIn(const NetworkSettings& secrets, LineKind kind);
/// Puts the password among the secrets that the connection has, to be kept by NetworkManager itself. An empty
/// one leaves the others.
void PutPassword(NetworkSettings& settings, LineKind kind, const NetworkSettings& secrets,
                 const std::string& password);
/// Puts the secrets without the password. False where there are no others.
bool PutOtherSecrets(NetworkSettings& settings, LineKind kind, const NetworkSettings& secrets);

/// Of RasDialParams::kBytes, as the operations below.
bool HasUserOrPassword(std::span<const std::uint8_t> params);
/// Takes user name and password of `given` where it has any.
void PutUserAndPassword(std::span<std::uint8_t> params, std::span<const std::uint8_t> given);
std::string_view PasswordField(std::span<const std::uint8_t> params);
void PutPasswordField(std::span<std::uint8_t> params, const std::string& password);

} // namespace quendra::platform::linux_
