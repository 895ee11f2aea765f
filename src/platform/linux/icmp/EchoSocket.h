#pragma once

#include "platform/icmp/Icmp.h"
#include "platform/linux/icmp/EchoMessage.h"
#include "platform/linux/system/Descriptor.h"

#include <memory>
#include <optional>

namespace quendra::platform::linux_ {

/// A socket that carries echoes, non-blocking.
class EchoSocket {
 public:
  virtual ~EchoSocket() = default;

  /// By which the answers to this socket's echoes are known.
  virtual std::uint16_t Id() const = 0;

  /// Sends with the options, an image of the published record or nothing for the system's own; gives 0 or
  /// the system's error.
  int Send(const SentEcho& echo, std::span<const std::uint8_t> options);
  /// Reads what waits, one message, which is nobody's if it isn't the echo's.
  enum class Reading { Nothing, Foreign, Answer };
  virtual Reading Read(const SentEcho& echo, EchoReply& answer) = 0;

  int Number() const { return socket_.Number(); }

 protected:
  explicit EchoSocket(Descriptor socket) : socket_(std::move(socket)) {}
  /// Takes away what an earlier echo left.
  virtual void Prepare() {}

 private:
  Descriptor socket_;
};

/// What opening a socket gave: the socket, or why there is none.
struct OpenedEchoSocket {
  std::unique_ptr<EchoSocket> socket;
  bool lacksRight = false;
};
/// A raw socket, which needs the capability for raw sockets; else a ping socket, which needs a group
/// that the system lets ping.
OpenedEchoSocket OpenEchoSocket();

} // namespace quendra::platform::linux_
