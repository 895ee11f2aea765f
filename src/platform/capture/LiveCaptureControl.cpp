#include "platform/capture/LiveCaptureControl.h"

#include "platform/capture/CaptureRecordHeader.h"
#include "runtime/Text.h"

#include <algorithm>

namespace quendra::platform {

namespace {

std::string AdapterNameOf(const std::string& name) { return std::string(CutAtNul(std::string_view(name))); }

CaptureRecordHeader HeaderOf(const FrameRecord* record) {
  if (record == nullptr) return {};
  return {record->seconds, record->microseconds, record->captured, record->wire};
}

} // namespace

void LiveCaptureControl::BindAdapter(const std::string& adapterName, std::int32_t& result) {
  adapter_ = AdapterNameOf(adapterName);
  result = core_->Adapters().Lists(adapter_) ? 0 : -1;
}

void LiveCaptureControl::OpenChannel(std::int32_t& result) {
  channelOpen_ = !adapter_.empty();
  result = channelOpen_ ? 0 : -1;
}

void LiveCaptureControl::SetChannelSize(std::int32_t, std::int32_t& result) {
  result = channelOpen_ ? 0 : -1;
}

void LiveCaptureControl::ReleaseChannel(std::int32_t& result) { result = channelOpen_ ? 0 : -1; }

void LiveCaptureControl::CloseChannel(std::int32_t& result) {
  core_->StopListening(*this);
  result = channelOpen_ ? 0 : -1;
  channelOpen_ = false;
}

void LiveCaptureControl::AdapterAddress(const std::string& adapterName, Ipv4Address& address,
                                        std::uint32_t& second) {
  address = core_->AddressOf(AdapterNameOf(adapterName));
  second = 0;
}

void LiveCaptureControl::StartEvents(std::int32_t& result) {
  result = channelOpen_ ? 0 : -1;
  if (channelOpen_) core_->Listen(*this, adapter_);
}

void LiveCaptureControl::StopEvents(std::int32_t& result) {
  result = 0;
  core_->StopListening(*this);
}

void LiveCaptureControl::ReadBuffer(std::span<std::uint8_t> bytes) {
  const FrameRecord* record = core_->Newest();
  const auto header = HeaderOf(record).Bytes();
  const std::size_t headerRoom = std::min<std::size_t>(header.size(), bytes.size());
  std::copy_n(header.begin(), headerRoom, bytes.begin());
  if (record == nullptr || bytes.size() <= header.size()) return;
  const auto rest = bytes.subspan(header.size());
  std::copy_n(record->bytes.begin(), std::min<std::size_t>(record->captured, rest.size()), rest.begin());
}

} // namespace quendra::platform
