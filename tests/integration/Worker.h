#pragma once

#include "integration/NetworkNamespace.h"

#include <cstdint>
#include <functional>
#include <string>
#include <sys/types.h>
#include <vector>

namespace quendra::integration {

/// What a worker is told.
struct Order {
  enum class Kind : std::int32_t { Connect, Exchange, ShortConnections, Datagrams };
  Kind kind = Kind::Connect;
  std::int32_t count = 0;   ///< connections, exchanges on each connection, or datagrams
  std::int32_t request = 0; ///< bytes that each exchange sends
  std::int32_t reply = 0;   ///< bytes that each exchange gets back
  std::int32_t pause = 0;   ///< microseconds from one exchange or datagram to the next, 0 for no wait
};

/// What a worker answers when it has done as told.
struct Answer {
  bool done = false;
  std::vector<std::uint16_t> localPorts; ///< of connections made by an order to connect
};

/// A process of its own that makes traffic: a client that obeys orders or a server. It ends with its channel
/// to the test, and with the test.
class Worker {
 public:
  /// A server for exchanges over TCP and for datagrams that come back, on one port.
  static Worker Server(const NetworkNamespace& space, const std::string& address, std::uint16_t port);
  static Worker Client(const NetworkNamespace& space, const std::string& serverAddress, std::uint16_t port);
  ~Worker();
  Worker(Worker&& other) noexcept;
  Worker(const Worker&) = delete;

  pid_t Process() const { return process_; }
  void Tell(const Order& order);
  /// Without waiting: whether the answer has come. Throws when the worker has failed.
  bool HasAnswered(Answer& answer);

 private:
  Worker(const NetworkNamespace& space, const std::function<void(int channel)>& work);

  pid_t process_ = -1;
  int channel_ = -1;
};

} // namespace quendra::integration
