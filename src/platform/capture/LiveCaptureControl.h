#pragma once

#include "platform/capture/CaptureCore.h"

namespace quendra::platform {

/// The capture control: rings for the session of the adapter it is bound to. Results are 0 on success, -1
/// otherwise.
class LiveCaptureControl : public CaptureControl {
 public:
  explicit LiveCaptureControl(std::shared_ptr<CaptureCore> core) : core_(std::move(core)) {}
  ~LiveCaptureControl() override { core_->StopListening(*this); }

  void BindAdapter(const std::string& adapterName, std::int32_t& result) override;
  void OpenChannel(std::int32_t& result) override;
  void SetChannelSize(std::int32_t size, std::int32_t& result) override;
  void ReleaseChannel(std::int32_t& result) override;
  void CloseChannel(std::int32_t& result) override;
  void AdapterAddress(const std::string& adapterName, Ipv4Address& address, std::uint32_t& second) override;
  void StartEvents(std::int32_t& result) override;
  void StopEvents(std::int32_t& result) override;
  void ReadBuffer(std::span<std::uint8_t> bytes) override;
  void SetValueA(std::int32_t) override {}
  void SetValueB(std::int32_t) override {}
  void SetValueC(std::int32_t) override {}

 private:
  std::shared_ptr<CaptureCore> core_;
  std::string adapter_;
  bool channelOpen_ = false;
};

} // namespace quendra::platform
