#include "platform/linux/capture/LinuxCapture.h"

#include "platform/linux/capture/LinuxCaptureControl.h"
#include "platform/linux/capture/LinuxCaptureCore.h"
#include "runtime/Text.h"

namespace quendra::platform::linux_ {

namespace {

void CopyPadded(const std::string& text, std::array<char, 255>& field) {
  field.fill('\0');
  text.copy(field.data(), field.size() - 1);
}

} // namespace

LinuxCapture::LinuxCapture(EventLoop& loop, DescriptorWatch& descriptors, PcapLibrary library)
    : core_(std::make_shared<LinuxCaptureCore>(loop, descriptors, std::move(library))) {
  core_->OnAdapterChanged = [this] {
    if (const auto handler = AdapterChanged) handler();
  };
}

LinuxCapture::~LinuxCapture() { core_->End(); }

std::int32_t LinuxCapture::VBPcapInit() {
  core_->CountAdapters();
  return core_->Indexes() - 1;
}

void LinuxCapture::VBPcapTerminate() { core_->End(); }

void LinuxCapture::vpGetAdapterInfo(std::int16_t adapter, AdapterInfo& info) {
  if (adapter == 0) core_->ListAdaptersAfresh();
  const CaptureAdapter* found = core_->AdapterAt(adapter);
  if (found == nullptr) return;
  CopyPadded(found->name, info.AdapterName);
  CopyPadded(ToCodePage(FromUtf8(found->description)), info.AdapterDescription);
}

void LinuxCapture::vpSetCurrentAdapter(std::int16_t adapter) { core_->SelectAdapter(adapter); }

void LinuxCapture::vpBegin(std::int32_t) { core_->Begin(); }

std::int32_t LinuxCapture::vpCapture(FrameBytes& frame, CaptureHeader& header) {
  return core_->Capture(frame, header);
}

void LinuxCapture::vpEnd() { core_->End(); }

// Snapshot and buffer are chosen for the whole session; what a caller could set here makes no difference to
// what it sees.
void LinuxCapture::vpSetParam(std::int32_t, std::int32_t) {}

CaptureLibrary::Availability LinuxCapture::availability() const { return core_->Availability(); }

std::unique_ptr<CaptureControl> LinuxCapture::Create() {
  return std::make_unique<LinuxCaptureControl>(core_);
}

CaptureCounters LinuxCapture::Counters() const { return core_->Counters(); }

} // namespace quendra::platform::linux_
