#pragma once

/// The records of the capture library, as far as this program reads them, in their published layout.
namespace quendra::platform::windows {

struct PcapHandle;

struct PcapDevice {
  PcapDevice* next;
  char* name;
  char* description; ///< nullptr for none
  void* addresses;
  unsigned flags;
};
inline constexpr unsigned kPcapLoopback = 1;

struct PcapHeader {
  long seconds;
  long microseconds;
  unsigned captured;
  unsigned wire;
};

struct PcapProgram {
  unsigned length;
  void* instructions;
};

struct PcapStatistics {
  unsigned received;
  unsigned dropped;
  unsigned droppedByInterface;
  unsigned room[13]; ///< for what later libraries add
};

inline constexpr int kPcapErrorBytes = 256;
inline constexpr unsigned kPcapNoMask = 0xFFFFFFFF;

using PcapCallback = void(unsigned char* user, const PcapHeader* header, const unsigned char* bytes);

} // namespace quendra::platform::windows
