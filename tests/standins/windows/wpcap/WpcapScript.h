#pragma once

#include <cstdint>
#include <deque>
#include <string>
#include <vector>

namespace quendra::standins {

/// What the capture library of the tests has and does, as a test says.
struct WpcapScript {
  struct Device {
    std::string name;
    std::string description;
    int linkType = 1;
    bool canBeOpened = true;
    bool fails = false; ///< each dispatch does
    std::string file{}; ///< what stands in it is delivered, too, as it grows (RecordedFrames.h)
    long taken = 0;     ///< bytes of the file
    unsigned dropped = 0;
    std::deque<std::vector<std::uint8_t>> waiting{};
    // What became of it.
    int open = 0; ///< how many captures are
    bool isNonBlocking = false;
    int snapshot = 0;
    int promiscuous = -1;
    int bufferBytes = 0;
    std::string filter{};
  };
  std::vector<Device> devices{};
  bool canList = true;
};

/// Its one export besides the library's calls.
using WpcapScriptOf = WpcapScript*();
inline constexpr const char* kWpcapScriptOf = "StandInScript";

} // namespace quendra::standins
