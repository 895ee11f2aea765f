#pragma once

#include "platform/linux/remote_access/ConnectionBook.h"

#include <cstdint>
#include <span>

namespace quendra::platform::linux_ {

// Dial parameters of an entry as NetworkManager keeps them: the password where root alone can read it. Each
// gives an error number.

/// Fills an image of RasDialParams::kBytes behind its entry name.
std::uint32_t ReadDialParams(ConnectionBook& book, const Line& line, std::span<std::uint8_t> full);
/// Takes an image of any size. Without a password a former one goes.
std::uint32_t SaveDialParams(ConnectionBook& book, const Line& line, std::span<const std::uint8_t> params,
                             bool removePassword);
/// Keeps user name and password, as far as there are any, and leaves the rest as it is.
std::uint32_t SaveUserAndPassword(ConnectionBook& book, const Line& line,
                                  std::span<const std::uint8_t> params);

} // namespace quendra::platform::linux_
