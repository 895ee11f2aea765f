#pragma once

#include "platform/capture/CaptureControl.h"
#include "platform/capture/CaptureRecordHeader.h"

#include <algorithm>

namespace quendra::platform::unavailable {

/// A capture control that has no adapter: its steps fail and it never rings.
class UnavailableCaptureControl : public CaptureControl {
 public:
  void BindAdapter(const std::string&, std::int32_t& result) override { result = kFailed; }
  void OpenChannel(std::int32_t& result) override { result = kFailed; }
  void SetChannelSize(std::int32_t, std::int32_t& result) override { result = kFailed; }
  void ReleaseChannel(std::int32_t& result) override { result = kFailed; }
  void CloseChannel(std::int32_t& result) override { result = kFailed; }
  void AdapterAddress(const std::string&, Ipv4Address& address, std::uint32_t& second) override {
    address = {};
    second = 0;
  }
  void StartEvents(std::int32_t& result) override { result = kFailed; }
  void StopEvents(std::int32_t& result) override { result = kFailed; }
  void ReadBuffer(std::span<std::uint8_t> bytes) override {
    const auto header = CaptureRecordHeader().Bytes();
    std::copy_n(header.begin(), std::min(header.size(), bytes.size()), bytes.begin());
  }
  void SetValueA(std::int32_t) override {}
  void SetValueB(std::int32_t) override {}
  void SetValueC(std::int32_t) override {}

 private:
  static constexpr std::int32_t kFailed = -1;
};

} // namespace quendra::platform::unavailable
