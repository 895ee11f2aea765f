#pragma once

#include "platform/remote_access/RemoteAccessNumbers.h"

#include <cstdint>
#include <span>

namespace quendra::platform {

/// Making and ending connections by entries of the phone book. Conventions as in PhoneBook.h.
class Dialling {
 public:
  virtual ~Dialling() = default;

  /// Whom a dial tells of its way: a window gets kRasDialEvent's message at each change. Without one the call
  /// returns when the connection stands or has failed.
  struct Notifier {
    std::uint32_t type = 0; ///< kRasNotifierIsWindow, or 0 for nobody
    WindowHandle window{};
  };

  /// Dials by a RasDialParams. `extensions` is a RasDialExtensions or empty. `connection` is the new one's
  /// handle, which a failed dial with a notifier leaves to be hung up.
  virtual std::uint32_t RasDialA(std::span<const std::uint8_t> extensions, const char* phoneBook,
                                 std::span<const std::uint8_t> params, const Notifier& notifier,
                                 RasConnection& connection) = 0;
  /// Ends a connection or a dial. Its end takes the system a while, in which it may be hung up again: what
  /// this program has hung up before gives success. kErrorInvalidHandle for what another has ended.
  virtual std::uint32_t RasHangUpA(RasConnection connection) = 0;
  /// Fills records of RasConnectionRecord, in the size that the first word of the buffer tells, and counts
  /// them. kRasInvalidSize for a size that this system hasn't.
  virtual std::uint32_t RasEnumConnectionsA(std::span<std::uint8_t> connections, std::uint32_t& bytes,
                                            std::uint32_t& count) = 0;
  /// The text of one of remote access's own numbers, with its NUL. kInvalidParameter for another number.
  virtual std::uint32_t RasGetErrorStringA(std::uint32_t error, std::span<char> text) = 0;
};

} // namespace quendra::platform
