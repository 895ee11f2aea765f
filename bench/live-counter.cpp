// The least that a packet capture can do: counts frames and bytes until it is told to end. The measure that
// others are compared with.
//
//   live-counter LINK

#include <csignal>
#include <cstdint>
#include <cstdio>
#include <pcap/pcap.h>

namespace {

struct Sums {
  std::uint64_t frames = 0;
  std::uint64_t bytes = 0;
};

pcap_t* capture = nullptr;

void Count(unsigned char* user, const pcap_pkthdr* header, const unsigned char*) {
  auto& sums = *reinterpret_cast<Sums*>(user);
  ++sums.frames;
  sums.bytes += header->len;
}

bool Open(const char* link) {
  char error[PCAP_ERRBUF_SIZE];
  capture = pcap_create(link, error);
  if (capture == nullptr) return false;
  pcap_set_snaplen(capture, 128);
  pcap_set_timeout(capture, 16);
  pcap_set_buffer_size(capture, 32 << 20);
  bpf_program everything{};
  return pcap_activate(capture) >= 0 &&
         pcap_compile(capture, &everything, "", 1, PCAP_NETMASK_UNKNOWN) == 0 &&
         pcap_setfilter(capture, &everything) == 0;
}

} // namespace

int main(int argc, char** argv) {
  if (argc != 2 || !Open(argv[1])) {
    std::fprintf(stderr, "usage: live-counter LINK (needs the right to capture)\n");
    return 1;
  }
  std::signal(SIGTERM, [](int) { pcap_breakloop(capture); });
  Sums sums;
  pcap_loop(capture, -1, Count, reinterpret_cast<unsigned char*>(&sums));
  std::printf("%llu frames %llu bytes\n", static_cast<unsigned long long>(sums.frames),
              static_cast<unsigned long long>(sums.bytes));
  pcap_close(capture);
  return 0;
}
