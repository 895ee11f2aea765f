#pragma once

#include "platform/linux/icmp/EchoSocket.h"

namespace quendra::platform::linux_ {

/// Gets the replies to its own echoes alone; the messages of routers come by its error queue.
class PingEchoSocket : public EchoSocket {
 public:
  explicit PingEchoSocket(Descriptor socket);

  /// The system's choice, which it also writes into what is sent.
  std::uint16_t Id() const override { return id_; }
  Reading Read(const SentEcho& echo, EchoReply& answer) override;

 protected:
  /// A late error of an earlier echo would fail the next one.
  void Prepare() override;

 private:
  Reading ReadError(const SentEcho& echo, EchoReply& answer);
  Reading ReadReply(const SentEcho& echo, EchoReply& answer);

  std::uint16_t id_ = 0;
};

} // namespace quendra::platform::linux_
