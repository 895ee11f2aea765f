#include "platform/simulated/capture/SimulatedCapture.h"

#include "platform/capture/CaptureRecordHeader.h"
#include "runtime/Text.h"

#include <algorithm>

namespace quendra::platform::simulated {

/// The last control made is the live one. When a control goes, that stands in the record of calls.
class SimulatedCapture::Control : public CaptureControl {
 public:
  explicit Control(SimulatedCapture& capture) : capture_(&capture) {}
  ~Control() override {
    if (!capture_) return;
    capture_->Record("drop control");
    std::erase(capture_->controls_, this);
  }

  void BindAdapter(const std::string& adapterName, std::int32_t& result) override {
    Step("BindAdapter " + std::string(CutAtNul(adapterName)), result);
  }
  void OpenChannel(std::int32_t& result) override { Step("OpenChannel", result); }
  void SetChannelSize(std::int32_t size, std::int32_t& result) override {
    Step("SetChannelSize " + std::to_string(size), result);
  }
  void ReleaseChannel(std::int32_t& result) override { Step("ReleaseChannel", result); }
  void CloseChannel(std::int32_t& result) override { Step("CloseChannel", result); }
  void AdapterAddress(const std::string& adapterName, Ipv4Address& address, std::uint32_t& second) override;
  void StartEvents(std::int32_t& result) override {
    Step("StartEvents", result);
    started = true;
  }
  void StopEvents(std::int32_t& result) override {
    Step("StopEvents", result);
    started = false;
  }
  void ReadBuffer(std::span<std::uint8_t> bytes) override;
  void SetValueA(std::int32_t value) override { Say("SetValueA " + std::to_string(value)); }
  void SetValueB(std::int32_t value) override { Say("SetValueB " + std::to_string(value)); }
  void SetValueC(std::int32_t value) override { Say("SetValueC " + std::to_string(value)); }

  void Orphan() { capture_ = nullptr; }

  bool started = false;

 private:
  void Say(std::string call) {
    if (capture_) capture_->Record(std::move(call));
  }
  void Step(std::string call, std::int32_t& result) {
    Say(std::move(call));
    result = 0;
  }

  SimulatedCapture* capture_;
};

void SimulatedCapture::Control::AdapterAddress(const std::string& adapterName, Ipv4Address& address,
                                               std::uint32_t& second) {
  const std::string name(CutAtNul(adapterName));
  Say("AdapterAddress " + name);
  address = {};
  second = 0;
  if (!capture_) return;
  const auto& adapters = capture_->Adapters;
  const auto found = std::find_if(adapters.begin(), adapters.end(),
                                  [&](const CaptureAdapter& adapter) { return adapter.name == name; });
  if (found != adapters.end()) address = AddressOf(found->address);
}

void SimulatedCapture::Control::ReadBuffer(std::span<std::uint8_t> bytes) {
  if (!capture_) return;
  ++capture_->ReadBufferCalls;
  if (capture_->RecordFrameCalls) Say("ReadBuffer");
  const Frame& newest = capture_->newest_;
  const auto headerLength = std::max<std::uint16_t>(capture_->RecordHeaderLength, capture_record::kBytes);
  const CaptureRecordHeader header{newest.tick / 1000, newest.tick % 1000 * 1000,
                                   static_cast<std::uint32_t>(newest.bytes.size()), newest.wireLength,
                                   headerLength};
  const auto told = header.Bytes();
  std::vector<std::uint8_t> record(told.begin(), told.end());
  record.resize(headerLength);
  record.insert(record.end(), newest.bytes.begin(), newest.bytes.end());
  std::copy_n(record.begin(), std::min(record.size(), bytes.size()), bytes.begin());
}

SimulatedCapture::~SimulatedCapture() {
  for (Control* control : controls_) control->Orphan();
}

void SimulatedCapture::Deliver(std::vector<std::uint8_t> frame, std::uint32_t wireLength) {
  if (IsGone()) return;
  const auto length = static_cast<std::uint32_t>(frame.size());
  newest_ = {std::move(frame), core_.tickCount, wireLength == 0 ? length : wireLength, 0};
  waiting_.push_back(newest_);
}

void SimulatedCapture::FailCapture(std::int32_t result) {
  waiting_.push_back({{}, core_.tickCount, 0, result});
}

const CaptureAdapter* SimulatedCapture::AdapterOfSession() const {
  const auto index = static_cast<std::size_t>(SelectedAdapter);
  return SessionOpen && SelectedAdapter >= 0 && index < Adapters.size() ? &Adapters[index] : nullptr;
}

bool SimulatedCapture::IsGone() const {
  const CaptureAdapter* adapter = AdapterOfSession();
  return adapter != nullptr && removed_.contains(adapter->name);
}

void SimulatedCapture::RemoveAdapter(const std::string& name) {
  if (removed_.insert(name).second) TellOfAdapter(name);
}

void SimulatedCapture::ReturnAdapter(const std::string& name) {
  if (removed_.erase(name) != 0) TellOfAdapter(name);
}

void SimulatedCapture::TellOfAdapter(const std::string& name) {
  const CaptureAdapter* adapter = AdapterOfSession();
  if (adapter == nullptr || adapter->name != name) return;
  if (const auto handler = AdapterChanged) handler();
}

bool SimulatedCapture::SignalPackets() {
  if (controls_.empty() || !controls_.back()->started || !controls_.back()->PacketReceived) return false;
  // A copy: the handler may drop the control.
  const auto handler = controls_.back()->PacketReceived;
  handler();
  return true;
}

void SimulatedCapture::SignalWhileFramesAreTaken() {
  std::size_t before = 0;
  do {
    before = waiting_.size();
  } while (SignalPackets() && waiting_.size() < before && !waiting_.empty());
}

std::int32_t SimulatedCapture::VBPcapInit() {
  Record("VBPcapInit");
  return InitResult.value_or(static_cast<std::int32_t>(Adapters.size()) - 1);
}

void SimulatedCapture::VBPcapTerminate() { Record("VBPcapTerminate"); }

void SimulatedCapture::vpGetAdapterInfo(std::int16_t adapter, AdapterInfo& info) {
  Record("vpGetAdapterInfo " + std::to_string(adapter));
  if (adapter < 0 || adapter >= static_cast<std::int16_t>(Adapters.size())) return;
  const CaptureAdapter& found = Adapters[static_cast<std::size_t>(adapter)];
  const auto fill = [](std::array<char, 255>& field, const std::string& text) {
    field.fill('\0');
    std::copy_n(text.begin(), std::min(text.size(), field.size()), field.begin());
  };
  fill(info.AdapterName, found.name);
  fill(info.AdapterDescription, found.description);
}

void SimulatedCapture::vpSetCurrentAdapter(std::int16_t adapter) {
  Record("vpSetCurrentAdapter " + std::to_string(adapter));
  SelectedAdapter = adapter;
}

void SimulatedCapture::vpBegin(std::int32_t value) {
  Record("vpBegin " + std::to_string(value));
  SessionOpen = true;
}

std::int32_t SimulatedCapture::vpCapture(FrameBytes& frame, CaptureHeader& header) {
  ++CaptureCalls;
  if (RecordFrameCalls) Record("vpCapture");
  frame = FrameBytes::Blank();
  if (waiting_.empty()) return IsGone() ? -1 : 0;
  if (waiting_.front().failure != 0) {
    const std::int32_t failure = waiting_.front().failure;
    waiting_.pop_front();
    return failure;
  }
  current_ = std::move(waiting_.front());
  waiting_.pop_front();
  const auto length = static_cast<std::int32_t>(current_.bytes.size());
  frame = FrameBytes(current_.bytes.data(), length);
  header = {current_.tick / 1000,
            current_.tick % 1000 * 1000,
            static_cast<std::uint32_t>(length),
            current_.wireLength,
            0,
            0};
  return std::max(length, 1);
}

void SimulatedCapture::vpEnd() {
  Record("vpEnd");
  SessionOpen = false;
}

void SimulatedCapture::vpSetParam(std::int32_t parameter, std::int32_t value) {
  Record("vpSetParam " + std::to_string(parameter) + " " + std::to_string(value));
}

CaptureLibrary::Availability SimulatedCapture::availability() const {
  return Available.value_or(Adapters.empty() ? Availability::NoAdapters
                            : IsGone()       ? Availability::AdapterGone
                                             : Availability::Available);
}

std::unique_ptr<CaptureControl> SimulatedCapture::Create() {
  Record("create control");
  if (CreateFault != 0) throw Fault(CreateFault);
  ++ControlsMade;
  auto control = std::make_unique<Control>(*this);
  controls_.push_back(control.get());
  return control;
}

} // namespace quendra::platform::simulated
