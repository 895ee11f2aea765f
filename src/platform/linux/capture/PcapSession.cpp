#include "platform/linux/capture/PcapSession.h"

namespace quendra::platform::linux_ {

namespace {

// What a frame has room for, also on the link with the longest header of its own.
constexpr int kSnapLength = PcapRecord::kRoom + PcapFrameShaper::kMostHeaderLost;
// The kernel hands over a block of frames when it is full or this old, so that a wake-up brings many frames.
constexpr int kBlockMilliseconds = 16;
// Half a second of 300,000 frames a second.
constexpr int kRingBytes = 32 << 20;
// Frames lie one behind the other in a block, some 192 bytes each: what comes four frames later is fetched
// into the caches meanwhile. Saves a quarter of the time that a frame takes from the kernel to the queue.
constexpr int kFetchAhead = 768;
constexpr int kFrameBytes = 192;
constexpr int kCacheLine = 64;

/// Only what an event can charge or pass over: IPv4 with TCP, fragments too, or with a tunnel. Anything else
/// would end a drain, or keep it from beginning when it came last, so that the table starved beside the
/// datagrams of a call or a game.
const char* FilterOf(LinkForm form) {
  switch (form) {
  // The kernel looks behind the tag of a virtual network, which is put back before the frame is seen here.
  case LinkForm::Ethernet: return "(ip proto 6 or ip proto 47) and not vlan";
  // Its headers are of more kinds than filters know.
  case LinkForm::Ppp: return "";
  default: return "ip proto 6 or ip proto 47";
  }
}

void FetchAhead(const unsigned char* frame) {
  for (int line = 0; line < kFrameBytes; line += kCacheLine) __builtin_prefetch(frame + kFetchAhead + line);
}

} // namespace

PcapSession::PcapSession(const PcapLibrary& library, pcap* handle, PcapFrameQueue& queue)
    : library_(library), handle_(handle), shaper_(queue) {}

PcapSession::~PcapSession() { library_.close(handle_); }

std::unique_ptr<PcapSession> PcapSession::Open(const PcapLibrary& library, const std::string& adapter,
                                               PcapFrameQueue& queue, std::string* error) {
  char buffer[PCAP_ERRBUF_SIZE] = "";
  pcap_t* handle = library.create(adapter.c_str(), buffer);
  std::string reason = buffer;
  if (handle != nullptr) {
    std::unique_ptr<PcapSession> session(new PcapSession(library, handle, queue));
    if (session->Prepare(reason)) return session;
  }
  if (error != nullptr) *error = adapter + ": " + reason;
  return nullptr;
}

bool PcapSession::Prepare(std::string& error) {
  library_.set_snaplen(handle_, kSnapLength);
  library_.set_promisc(handle_, 0);
  library_.set_timeout(handle_, kBlockMilliseconds);
  library_.set_buffer_size(handle_, kRingBytes);
  if (const int status = library_.activate(handle_); status < 0) {
    error = library_.statustostr(status);
    return false;
  }
  const auto form = LinkFormOf(library_.datalink(handle_));
  if (!form) {
    error = "a link of an unknown kind";
    return false;
  }
  shaper_.SetForm(*form);

  // Only with a filter, be it an empty one, does the kernel cut the frames before it copies them.
  bpf_program filter{};
  char buffer[PCAP_ERRBUF_SIZE] = "";
  const bool ready = library_.compile(handle_, &filter, FilterOf(*form), 1, PCAP_NETMASK_UNKNOWN) == 0 &&
                     library_.setfilter(handle_, &filter) == 0 &&
                     library_.setnonblock(handle_, 1, buffer) == 0;
  library_.freecode(&filter);
  descriptor_ = library_.get_selectable_fd(handle_);
  if (!ready) error = library_.geterr(handle_);
  return ready && descriptor_ >= 0;
}

int PcapSession::Fill() {
  if (failed_) return -1;
  const int count =
      library_.dispatch(handle_, kBatch, &PcapSession::Take, reinterpret_cast<unsigned char*>(this));
  if (count < 0) {
    failed_ = true;
    return -1;
  }
  received_ += static_cast<std::uint64_t>(count);
  return count;
}

void PcapSession::Take(unsigned char* session, const pcap_pkthdr* header, const unsigned char* bytes) {
  FetchAhead(bytes);
  reinterpret_cast<PcapSession*>(session)->shaper_.Deliver(
      {static_cast<std::uint32_t>(header->ts.tv_sec), static_cast<std::uint32_t>(header->ts.tv_usec)},
      {bytes, header->caplen}, header->len);
}

PcapSession::Statistics PcapSession::GetStatistics() const {
  Statistics result{received_, 0};
  pcap_stat counted{};
  if (library_.stats(handle_, &counted) == 0) result.dropped = counted.ps_drop;
  return result;
}

} // namespace quendra::platform::linux_
