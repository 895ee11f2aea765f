#pragma once

#include <array>
#include <cstdint>
#include <map>
#include <memory>
#include <mutex>
#include <ostream>
#include <string>
#include <sys/types.h>
#include <thread>
#include <vector>

struct pcap;
struct pcap_pkthdr;

namespace quendra::integration {

/// Bytes of a process, sent and received.
struct Totals {
  std::uint64_t upload = 0;
  std::uint64_t download = 0;

  friend std::ostream& operator<<(std::ostream& out, const Totals& totals) {
    return out << totals.upload << " up, " << totals.download << " down";
  }
  friend bool operator==(const Totals&, const Totals&) = default;
  friend Totals operator-(const Totals& a, const Totals& b) {
    return {a.upload - b.upload, a.download - b.download};
  }
};

/// A second capture of the same link, with code of its own: adds up the IP total lengths of TCP frames by the
/// local port, the source port of what the local address sent and the destination port of everything else.
class FrameLedger {
 public:
  struct Page {
    std::uint64_t frames = 0;
    std::uint64_t tcpFrames = 0;
    std::uint64_t udpFrames = 0;
    std::uint64_t icmpFrames = 0;
    std::map<std::uint16_t, Totals> byPort;
  };

  /// A frame of TCP, by the clock of the link.
  struct Arrival {
    std::int64_t microseconds = 0; ///< since 1970
    std::uint32_t bytes = 0;       ///< IP total length
  };

  FrameLedger(const std::string& link, const std::string& localAddress);
  ~FrameLedger();

  Page Read() const;
  std::uint64_t TcpFrames() const;
  /// From now on every frame that comes for this local port is kept.
  void Watch(std::uint16_t port);
  std::vector<Arrival> Watched() const;
  /// Frames that this capture missed.
  std::uint64_t Drops() const;

 private:
  static void Take(unsigned char* ledger, const pcap_pkthdr* header, const unsigned char* frame);
  void Enter(const pcap_pkthdr& header, const unsigned char* frame);
  void EnterDownload(const pcap_pkthdr& header, unsigned port, unsigned bytes);

  pcap* capture_;
  std::uint32_t local_ = 0;
  mutable std::mutex lock_;
  std::uint64_t frames_ = 0;
  std::uint64_t tcpFrames_ = 0;
  std::uint64_t udpFrames_ = 0;
  std::uint64_t icmpFrames_ = 0;
  std::uint16_t watchedPort_ = 0;
  std::vector<Arrival> watched_;
  std::unique_ptr<std::array<Totals, 65536>> byPort_ = std::make_unique<std::array<Totals, 65536>>();
  std::thread thread_;
};

/// What the processes of a port map come to.
inline std::map<pid_t, Totals> ByProcess(const FrameLedger::Page& page,
                                         const std::map<std::uint16_t, pid_t>& owners) {
  std::map<pid_t, Totals> result;
  for (const auto& [port, process] : owners) {
    Totals& totals = result[process];
    const auto entry = page.byPort.find(port);
    if (entry == page.byPort.end()) continue;
    totals.upload += entry->second.upload;
    totals.download += entry->second.download;
  }
  return result;
}

} // namespace quendra::integration
