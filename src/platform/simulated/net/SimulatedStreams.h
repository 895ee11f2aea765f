#pragma once

#include "platform/simulated/net/SocketFailures.h"
#include "platform/simulated/net/SocketMessages.h"
#include "platform/simulated/net/SocketTable.h"

namespace quendra::platform::simulated {

/// The data of connections, from both of their ends.
class SimulatedStreams {
 public:
  using End = SocketTable::End;

  SimulatedStreams(const SocketTable& table, SocketMessages& messages, SocketFailures& failures)
      : table_(table), messages_(messages), failures_(failures) {}

  // What the program does.

  std::int32_t Send(const End& end, std::span<const std::uint8_t> bytes);
  /// The socket is full until the loop's next round, when it can be sent to again.
  void Refill(const End& end);
  /// How many bytes were read, as recv gives it.
  std::int32_t Receive(SocketEnd& end, std::span<std::uint8_t> buffer, bool peeks);
  /// Tells the far ends, those of connections that nobody has accepted among them.
  void Close(const SocketEnd& end);

  // What the far ends do.

  void Arrive(SocketEnd& end, const std::string& bytes);
  void EndOf(SocketEnd& end, std::int32_t error);
  void Later(std::function<void()> work) { messages_.Later(std::move(work)); }

 private:
  const SocketTable& table_;
  SocketMessages& messages_;
  SocketFailures& failures_;
};

} // namespace quendra::platform::simulated
