#pragma once

#include "platform/net/Ipv4Address.h"

#include <cstdint>
#include <functional>
#include <span>
#include <string>

namespace quendra::platform {

/// The capture control: signals new traffic on the adapter it is bound to.
class CaptureControl {
 public:
  virtual ~CaptureControl() = default;

  virtual void BindAdapter(const std::string& adapterName, std::int32_t& result) = 0;
  virtual void OpenChannel(std::int32_t& result) = 0;
  virtual void SetChannelSize(std::int32_t size, std::int32_t& result) = 0;
  virtual void ReleaseChannel(std::int32_t& result) = 0;
  virtual void CloseChannel(std::int32_t& result) = 0;
  /// The adapter's address, 0.0.0.0 for none.
  virtual void AdapterAddress(const std::string& adapterName, Ipv4Address& address,
                              std::uint32_t& second) = 0;
  virtual void StartEvents(std::int32_t& result) = 0;
  virtual void StopEvents(std::int32_t& result) = 0;
  /// Writes the newest capture record over the start of `bytes`: its header (CaptureRecordHeader), padding up
  /// to the header length, the frame. Before the first record it is a header with zero lengths of the frame.
  virtual void ReadBuffer(std::span<std::uint8_t> bytes) = 0;
  virtual void SetValueA(std::int32_t value) = 0;
  virtual void SetValueB(std::int32_t value) = 0;
  virtual void SetValueC(std::int32_t value) = 0;

  /// Raised when frames have arrived, and once more through the queue after an event that took frames and
  /// left some; not inside itself, save while a box or a modal form stands that was opened in it.
  std::function<void()> PacketReceived;
};

} // namespace quendra::platform
