#include "platform/linux/capture/PcapSession.h"

namespace quendra::platform::linux_ {

namespace {

static_assert(link_type::kFamily == DLT_NULL && link_type::kBigFamily == DLT_LOOP);
static_assert(link_type::kEthernet == DLT_EN10MB);
static_assert(link_type::kPpp == DLT_PPP && link_type::kSerialPpp == DLT_PPP_SERIAL);
static_assert(link_type::kRawIp == DLT_RAW && link_type::kRawIpv4 == DLT_IPV4 &&
              link_type::kRawIpv6 == DLT_IPV6);
static_assert(link_type::kLinuxCooked == DLT_LINUX_SLL && link_type::kLinuxCooked2 == DLT_LINUX_SLL2);

// The kernel hands over a block of frames when it is full or this old, so that a wake-up brings many frames.
constexpr int kBlockMilliseconds = 16;
// Half a second of 300,000 frames a second.
constexpr int kRingBytes = 32 << 20;
// Frames lie one after the other in a block, some 192 bytes each: what comes four frames later is fetched
// into the caches meanwhile. Saves a quarter of the time that a frame takes from the kernel to the queue.
constexpr int kFetchAhead = 768;
constexpr int kFrameBytes = 192;
constexpr int kCacheLine = 64;

void FetchAhead(const unsigned char* frame) {
  for (int line = 0; line < kFrameBytes; line += kCacheLine) __builtin_prefetch(frame + kFetchAhead + line);
}

} // namespace

PcapSession::PcapSession(const PcapLibrary& library, DescriptorWatch& descriptors, pcap* handle,
                         FrameShaper& shaper)
    : library_(library), descriptors_(descriptors), handle_(handle), shaper_(shaper) {}

PcapSession::~PcapSession() { library_.close(handle_); }

std::unique_ptr<PcapSession> PcapSession::Open(const PcapLibrary& library, DescriptorWatch& descriptors,
                                               const std::string& interface, FrameShaper& shaper) {
  char error[PCAP_ERRBUF_SIZE] = "";
  pcap_t* handle = library.create(interface.c_str(), error);
  if (handle == nullptr) return nullptr;
  std::unique_ptr<PcapSession> session(new PcapSession(library, descriptors, handle, shaper));
  return session->Prepare() ? std::move(session) : nullptr;
}

bool PcapSession::Prepare() {
  library_.set_snaplen(handle_, FrameShaper::kMostBytes);
  library_.set_promisc(handle_, 0);
  library_.set_timeout(handle_, kBlockMilliseconds);
  library_.set_buffer_size(handle_, kRingBytes);
  if (library_.activate(handle_) < 0) return false;
  const auto form = LinkFormOf(library_.datalink(handle_));
  if (!form) return false;
  shaper_.SetForm(*form);
  char error[PCAP_ERRBUF_SIZE] = "";
  return SetFilter(*form) && library_.setnonblock(handle_, 1, error) == 0 &&
         library_.get_selectable_fd(handle_) >= 0;
}

/// Only with a filter, be it an empty one, does the kernel cut the frames before it copies them.
bool PcapSession::SetFilter(LinkForm form) {
  bpf_program filter{};
  const bool set = library_.compile(handle_, &filter, CaptureFilterOf(form), 1, PCAP_NETMASK_UNKNOWN) == 0 &&
                   library_.setfilter(handle_, &filter) == 0;
  library_.freecode(&filter);
  return set;
}

int PcapSession::Fill() {
  return library_.dispatch(handle_, kBatch, &PcapSession::Take, reinterpret_cast<unsigned char*>(this));
}

void PcapSession::Take(unsigned char* session, const pcap_pkthdr* header, const unsigned char* bytes) {
  FetchAhead(bytes);
  reinterpret_cast<PcapSession*>(session)->shaper_.Deliver(
      {static_cast<std::uint32_t>(header->ts.tv_sec), static_cast<std::uint32_t>(header->ts.tv_usec)},
      {bytes, header->caplen}, header->len);
}

std::uint64_t PcapSession::Dropped() const {
  pcap_stat counted{};
  return library_.stats(handle_, &counted) == 0 ? counted.ps_drop : 0;
}

std::unique_ptr<EventLoop::Subscription> PcapSession::Watch(std::function<void()> ready) {
  return descriptors_.WatchDescriptor(library_.get_selectable_fd(handle_), std::move(ready));
}

} // namespace quendra::platform::linux_
