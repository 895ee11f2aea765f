#include "platform/capture/LiveCapture.h"

#include "platform/capture/CaptureCore.h"
#include "platform/capture/LiveCaptureControl.h"
#include "runtime/Text.h"

namespace quendra::platform {

namespace {

void CopyPadded(const std::string& text, std::array<char, 255>& field) {
  field.fill('\0');
  text.copy(field.data(), field.size() - 1);
}

} // namespace

LiveCapture::LiveCapture(EventLoop& loop, std::unique_ptr<CaptureAdapters> adapters,
                         std::uint32_t queueCapacity)
    : core_(std::make_shared<CaptureCore>(loop, std::move(adapters), queueCapacity)) {
  core_->OnAdapterChanged = [this] {
    if (const auto handler = AdapterChanged) handler();
  };
}

LiveCapture::~LiveCapture() { core_->End(); }

std::int32_t LiveCapture::VBPcapInit() {
  core_->CountAdapters();
  return core_->Adapters().Count() - 1;
}

void LiveCapture::VBPcapTerminate() { core_->End(); }

void LiveCapture::vpGetAdapterInfo(std::int16_t adapter, AdapterInfo& info) {
  if (adapter == 0) core_->ListAdaptersAfresh();
  const LiveAdapter* found = core_->Adapters().At(adapter);
  if (found == nullptr) return;
  CopyPadded(found->name, info.AdapterName);
  CopyPadded(ToCodePage(FromUtf8(found->description)), info.AdapterDescription);
}

void LiveCapture::vpSetCurrentAdapter(std::int16_t adapter) { core_->SelectAdapter(adapter); }

void LiveCapture::vpBegin(std::int32_t) { core_->Begin(); }

std::int32_t LiveCapture::vpCapture(FrameBytes& frame, CaptureHeader& header) {
  return core_->Capture(frame, header);
}

void LiveCapture::vpEnd() { core_->End(); }

// Snapshot and buffer are chosen for the whole session; what a caller could set here makes no difference to
// what it sees.
void LiveCapture::vpSetParam(std::int32_t, std::int32_t) {}

CaptureLibrary::Availability LiveCapture::availability() const { return core_->Availability(); }

std::unique_ptr<CaptureControl> LiveCapture::Create() { return std::make_unique<LiveCaptureControl>(core_); }

CaptureCounters LiveCapture::Counters() const { return core_->Counters(); }

} // namespace quendra::platform
