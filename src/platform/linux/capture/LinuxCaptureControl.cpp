#include "platform/linux/capture/LinuxCaptureControl.h"

#include "platform/capture/CaptureRecordHeader.h"
#include "runtime/Text.h"

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

std::string AdapterNameOf(const std::string& name) { return std::string(CutAtNul(std::string_view(name))); }

CaptureRecordHeader HeaderOf(const PcapRecord* record) {
  if (record == nullptr) return {};
  return {record->seconds, record->microseconds, record->captured, record->wire};
}

} // namespace

void LinuxCaptureControl::BindAdapter(const std::string& adapterName, std::int32_t& result) {
  adapter_ = AdapterNameOf(adapterName);
  const auto& adapters = core_->Adapters();
  const bool known = std::any_of(adapters.begin(), adapters.end(),
                                 [this](const CaptureAdapter& adapter) { return adapter.name == adapter_; });
  result = known ? 0 : -1;
}

void LinuxCaptureControl::OpenChannel(std::int32_t& result) {
  channelOpen_ = !adapter_.empty();
  result = channelOpen_ ? 0 : -1;
}

void LinuxCaptureControl::SetChannelSize(std::int32_t, std::int32_t& result) {
  result = channelOpen_ ? 0 : -1;
}

void LinuxCaptureControl::ReleaseChannel(std::int32_t& result) { result = channelOpen_ ? 0 : -1; }

void LinuxCaptureControl::CloseChannel(std::int32_t& result) {
  core_->StopListening(*this);
  result = channelOpen_ ? 0 : -1;
  channelOpen_ = false;
}

void LinuxCaptureControl::AdapterAddress(const std::string& adapterName, Ipv4Address& address,
                                         std::uint32_t& second) {
  address = AddressOfAdapter(AdapterNameOf(adapterName));
  second = 0;
}

void LinuxCaptureControl::StartEvents(std::int32_t& result) {
  result = channelOpen_ ? 0 : -1;
  if (channelOpen_) core_->Listen(*this, adapter_);
}

void LinuxCaptureControl::StopEvents(std::int32_t& result) {
  result = 0;
  core_->StopListening(*this);
}

void LinuxCaptureControl::ReadBuffer(std::span<std::uint8_t> bytes) {
  const PcapRecord* record = core_->Newest();
  const auto header = HeaderOf(record).Bytes();
  const std::size_t headerRoom = std::min<std::size_t>(header.size(), bytes.size());
  std::copy_n(header.begin(), headerRoom, bytes.begin());
  if (record == nullptr || bytes.size() <= header.size()) return;
  const auto rest = bytes.subspan(header.size());
  std::copy_n(record->bytes.begin(), std::min<std::size_t>(record->captured, rest.size()), rest.begin());
}

} // namespace quendra::platform::linux_
