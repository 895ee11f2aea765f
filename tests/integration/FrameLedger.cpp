#include "integration/FrameLedger.h"

#include "runtime/ByteFields.h"

#include <arpa/inet.h>
#include <pcap/pcap.h>
#include <span>
#include <stdexcept>

namespace quendra::integration {

namespace {

pcap_t* OpenCapture(const std::string& link) {
  char error[PCAP_ERRBUF_SIZE];
  pcap_t* capture = pcap_create(link.c_str(), error);
  if (capture == nullptr) throw std::runtime_error(error);
  pcap_set_snaplen(capture, 64);
  pcap_set_timeout(capture, 20);
  pcap_set_buffer_size(capture, 64 << 20);
  bpf_program everything{};
  if (pcap_activate(capture) < 0 || pcap_compile(capture, &everything, "", 1, PCAP_NETMASK_UNKNOWN) != 0 ||
      pcap_setfilter(capture, &everything) != 0)
    throw std::runtime_error("no second capture on " + link);
  pcap_freecode(&everything);
  return capture;
}

} // namespace

FrameLedger::FrameLedger(const std::string& link, const std::string& localAddress)
    : capture_(OpenCapture(link)) {
  inet_pton(AF_INET, localAddress.c_str(), &local_);
  thread_ = std::thread(
      [this] { pcap_loop(capture_, -1, &FrameLedger::Take, reinterpret_cast<unsigned char*>(this)); });
}

FrameLedger::~FrameLedger() {
  pcap_breakloop(capture_);
  thread_.join();
  pcap_close(capture_);
}

void FrameLedger::Take(unsigned char* ledger, const pcap_pkthdr* header, const unsigned char* frame) {
  reinterpret_cast<FrameLedger*>(ledger)->Enter(*header, frame);
}

void FrameLedger::Enter(const pcap_pkthdr& header, const unsigned char* frame) {
  const std::lock_guard guard(lock_);
  ++frames_;
  const std::span bytes(frame, header.caplen);
  if (header.caplen < 38 || Big16(bytes, 12) != 0x0800) return;
  udpFrames_ += frame[23] == 17;
  icmpFrames_ += frame[23] == 1;
  if (frame[23] != 6) return;
  ++tcpFrames_;
  if (Little32(bytes, 26) == local_)
    (*byPort_)[Big16(bytes, 34)].upload += Big16(bytes, 16);
  else
    EnterDownload(header, Big16(bytes, 36), Big16(bytes, 16));
}

void FrameLedger::EnterDownload(const pcap_pkthdr& header, unsigned port, unsigned bytes) {
  (*byPort_)[port].download += bytes;
  if (port == watchedPort_) watched_.push_back({header.ts.tv_sec * 1'000'000LL + header.ts.tv_usec, bytes});
}

FrameLedger::Page FrameLedger::Read() const {
  const std::lock_guard guard(lock_);
  Page page{frames_, tcpFrames_, udpFrames_, icmpFrames_, {}};
  for (unsigned port = 0; port < byPort_->size(); ++port)
    if ((*byPort_)[port] != Totals{}) page.byPort[static_cast<std::uint16_t>(port)] = (*byPort_)[port];
  return page;
}

void FrameLedger::Watch(std::uint16_t port) {
  const std::lock_guard guard(lock_);
  watchedPort_ = port;
}

std::vector<FrameLedger::Arrival> FrameLedger::Watched() const {
  const std::lock_guard guard(lock_);
  return watched_;
}

std::uint64_t FrameLedger::TcpFrames() const {
  const std::lock_guard guard(lock_);
  return tcpFrames_;
}

std::uint64_t FrameLedger::Drops() const {
  pcap_stat counted{};
  pcap_stats(capture_, &counted);
  return counted.ps_drop;
}

} // namespace quendra::integration
