#pragma once

#include "platform/linux/icmp/EchoSocket.h"

namespace quendra::platform::linux_ {

/// Hears every ICMP message that comes to this machine and looks for its own among them.
class RawEchoSocket : public EchoSocket {
 public:
  explicit RawEchoSocket(Descriptor socket);

  std::uint16_t Id() const override { return id_; }
  Reading Read(const SentEcho& echo, EchoReply& answer) override;

 private:
  std::uint16_t id_;
};

} // namespace quendra::platform::linux_
