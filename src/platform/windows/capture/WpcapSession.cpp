#include "platform/windows/capture/WpcapSession.h"

namespace quendra::platform::windows {

namespace {

// How long a call may wait until the capture is told not to wait at all.
constexpr int kBlockMilliseconds = 16;
// A tenth of a second of 300,000 frames a second, twice what comes between two looks; it is memory that the
// system can't page out.
constexpr int kBufferBytes = 4 << 20;

} // namespace

WpcapSession::WpcapSession(const WpcapLibrary& library, EventLoop& loop, PcapHandle* handle,
                           FrameShaper& shaper)
    : library_(library), loop_(loop), handle_(handle), shaper_(shaper) {}

WpcapSession::~WpcapSession() { library_.close(handle_); }

std::unique_ptr<WpcapSession> WpcapSession::Open(const WpcapLibrary& library, EventLoop& loop,
                                                 const std::string& adapter, FrameShaper& shaper) {
  char error[kPcapErrorBytes] = "";
  PcapHandle* handle =
      library.open_live(adapter.c_str(), FrameShaper::kMostBytes, 0, kBlockMilliseconds, error);
  if (handle == nullptr) return nullptr;
  std::unique_ptr<WpcapSession> session(new WpcapSession(library, loop, handle, shaper));
  return session->Prepare() ? std::move(session) : nullptr;
}

bool WpcapSession::Prepare() {
  const auto form = LinkFormOf(library_.datalink(handle_));
  if (!form) return false;
  shaper_.SetForm(*form);
  // With its usual buffer, which is smaller, it captures too.
  if (library_.setbuff != nullptr) library_.setbuff(handle_, kBufferBytes);
  char error[kPcapErrorBytes] = "";
  return SetFilter(*form) && library_.setnonblock(handle_, 1, error) == 0;
}

/// Only with a filter, be it an empty one, are the frames cut before they are copied.
bool WpcapSession::SetFilter(LinkForm form) {
  PcapProgram filter{};
  if (library_.compile(handle_, &filter, CaptureFilterOf(form), 1, kPcapNoMask) != 0) return false;
  const bool set = library_.setfilter(handle_, &filter) == 0;
  library_.freecode(&filter);
  return set;
}

int WpcapSession::Fill() {
  return library_.dispatch(handle_, kBatch, &WpcapSession::Take, reinterpret_cast<unsigned char*>(this));
}

/// What it calls throws nothing.
void WpcapSession::Take(unsigned char* session, const PcapHeader* header,
                        const unsigned char* bytes) noexcept {
  reinterpret_cast<WpcapSession*>(session)->shaper_.Deliver(
      {static_cast<std::uint32_t>(header->seconds), static_cast<std::uint32_t>(header->microseconds)},
      {bytes, header->captured}, header->wire);
}

std::uint64_t WpcapSession::Dropped() const {
  PcapStatistics counted{};
  return library_.stats(handle_, &counted) == 0 ? counted.dropped : 0;
}

std::unique_ptr<EventLoop::Subscription> WpcapSession::Watch(std::function<void()> ready) {
  return loop_.StartTimer(kWatchMilliseconds, std::move(ready));
}

} // namespace quendra::platform::windows
