#pragma once

#include "app/windows/TestFolder.h"
#include "platform/net/Ipv4Address.h"

#include <string>
#include <vector>

namespace quendra::app::windows {

/// A frame of TCP over loopback.
struct LoopbackFrame {
  platform::Ipv4Address source;
  unsigned sourcePort = 0;
  unsigned targetPort = 0;
  std::uint32_t sequence = 0; ///< the number of the first byte that it carries
  std::uint32_t bytes = 0;    ///< the total length in its IP header
  std::uint32_t payload = 0;
};

/// What programs say to each other over loopback between some ends, as the system below Wine sees it pass: a
/// program of that system writes the file of a capture, and this reads it by code of its own.
class LoopbackRecording {
 public:
  LoopbackRecording() = default;
  ~LoopbackRecording() { End(); }
  LoopbackRecording(const LoopbackRecording&) = delete;

  /// Where it is to be.
  const Text& File() const { return file_; }
  /// Each end is ADDRESS:PORT. False when nothing can be recorded.
  bool Begin(const std::vector<std::string>& ends);
  /// From now on the file stays as it is, with everything that had passed. False when it can't.
  bool End();

  std::vector<LoopbackFrame> Frames() const;

 private:
  TestFolder folder_;
  const Text file_ = folder_.Path() + u"\\loopback.pcap";
  bool runs_ = false;
};

} // namespace quendra::app::windows
