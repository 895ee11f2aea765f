#pragma once

#include "platform/process/Handles.h"
#include "platform/process/Processes.h"
#include "runtime/Text.h"

#include <optional>
#include <vector>

namespace quendra::monitor {

/// Owners of a local port; 0 stands for unknown.
struct PortOwner {
  std::int32_t tcpOwner = 0;
  std::int32_t udpOwner = 0;
};

/// Finds the owners of ports by asking the transport driver about every handle of the system that may be a
/// socket.
class SocketHandleScan {
 public:
  SocketHandleScan(platform::Processes& processes, platform::Handles& handles)
      : processes_(processes), handles_(handles) {}

  /// Writes the owners found over those in `owners`, 65536 records by port.
  void Run(std::vector<PortOwner>& owners);
  /// The local port of an own handle, 0 when unknown.
  std::int32_t QueryHandlePort(platform::Handle handle);

 private:
  struct HandleEntry {
    std::uint32_t processId = 0;
    std::uint16_t handle = 0;
  };

  std::vector<HandleEntry> AllHandles();
  void Examine(const HandleEntry& entry, std::vector<PortOwner>& owners);
  /// The object's name in capitals; nothing for names of a length that no socket's device has.
  std::optional<Text> DeviceName(platform::Handle handle);

  platform::Processes& processes_;
  platform::Handles& handles_;
};

} // namespace quendra::monitor
