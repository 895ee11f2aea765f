#pragma once

#include "platform/linux/capture/PcapFrameShaper.h"
#include "platform/linux/capture/PcapLibrary.h"

#include <memory>
#include <string>

namespace quendra::platform::linux_ {

/// A live capture on one interface, non-blocking. The library outlives it.
class PcapSession {
 public:
  /// The most packets that one call to Fill takes from the kernel: few enough to stay in the nearest caches
  /// until they are read.
  static constexpr int kBatch = 256;
  /// The room that a call to Fill may need.
  static constexpr std::uint32_t kRoomOfBatch = kBatch * PcapFrameShaper::kMostPieces;

  struct Statistics {
    std::uint64_t received = 0; ///< packets taken from the kernel
    std::uint64_t dropped = 0;  ///< packets that the kernel had no room for
  };

  /// nullptr when the interface can't be opened; `error`, when given, then says why.
  static std::unique_ptr<PcapSession> Open(const PcapLibrary& library, const std::string& adapter,
                                           PcapFrameQueue& queue, std::string* error = nullptr);
  ~PcapSession();

  int Descriptor() const { return descriptor_; }
  /// Moves what waits in the kernel to the queue, at most kBatch packets, without waiting. The number of
  /// packets, or -1 when the capture has failed, now or before.
  int Fill();
  bool Failed() const { return failed_; }
  Statistics GetStatistics() const;

 private:
  PcapSession(const PcapLibrary& library, pcap* handle, PcapFrameQueue& queue);
  bool Prepare(std::string& error);
  static void Take(unsigned char* session, const pcap_pkthdr* header, const unsigned char* bytes);

  const PcapLibrary& library_;
  pcap* handle_;
  int descriptor_ = -1;
  bool failed_ = false;
  std::uint64_t received_ = 0;
  PcapFrameShaper shaper_;
};

} // namespace quendra::platform::linux_
