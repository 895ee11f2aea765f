#pragma once

#include "platform/EventLoop.h"
#include "platform/remote_access/Dialling.h"
#include "platform/windows/remote_access/DialRelay.h"
#include "platform/windows/remote_access/RasCalls.h"

#include <map>
#include <memory>
#include <set>

namespace quendra::platform::windows {

/// The system's dials. What it tells of one comes to a relay of this dial, which lives until the dial or its
/// connection is hung up, and goes on through the loop.
class WindowsDialling : public Dialling {
 public:
  WindowsDialling(RasCalls& ras, EventLoop& loop) : ras_(ras), loop_(loop) {}
  /// Waits a while for the end of what was hung up: a line whose program goes before may stay unusable.
  ~WindowsDialling() override;

  std::uint32_t RasDialA(std::span<const std::uint8_t> extensions, const char* phoneBook,
                         std::span<const std::uint8_t> params, const Notifier& notifier,
                         RasConnection& connection) override;
  std::uint32_t RasHangUpA(RasConnection connection) override;
  std::uint32_t RasEnumConnectionsA(std::span<std::uint8_t> connections, std::uint32_t& bytes,
                                    std::uint32_t& count) override;
  std::uint32_t RasGetErrorStringA(std::uint32_t error, std::span<char> text) override;

 private:
  bool HasHandle(RasConnection connection);
  /// nullptr for a notifier that is nobody.
  std::unique_ptr<DialRelay> RelayTo(const Notifier& notifier);
  void Keep(RasConnection made, std::unique_ptr<DialRelay> relay, std::uint32_t error,
            RasConnection& connection);

  RasCalls& ras_;
  EventLoop& loop_;
  std::map<RasConnection, std::unique_ptr<DialRelay>> relays_;
  std::set<RasConnection> hungUp_; ///< by this program
};

} // namespace quendra::platform::windows
