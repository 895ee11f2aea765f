#pragma once

#include "platform/windows/capture/WpcapTypes.h"
#include "winapi/SystemLibrary.h"

#include <optional>
#include <span>
#include <vector>

namespace quendra::platform::windows {

/// The capture library, looked up at run time, so that the program also starts on a machine that lacks it.
/// Each function stands under its name without the prefix; none may be called unless the library is there,
/// and those that say so only where they aren't nullptr.
class WpcapLibrary {
 public:
  /// Where installers put it: the system's folder, or one of its own below that.
  static std::vector<Text> UsualPaths();

  /// The first of these that can be loaded and has every function.
  explicit WpcapLibrary(std::span<const Text> paths = UsualPaths());

  bool IsThere() const { return library_.has_value(); }

  void (*close)(PcapHandle*) = nullptr;
  int (*compile)(PcapHandle*, PcapProgram*, const char* text, int optimize, unsigned mask) = nullptr;
  int (*datalink)(PcapHandle*) = nullptr;
  int (*dispatch)(PcapHandle*, int most, PcapCallback*, unsigned char* user) = nullptr;
  int (*findalldevs)(PcapDevice** devices, char* error) = nullptr;
  void (*freealldevs)(PcapDevice*) = nullptr;
  void (*freecode)(PcapProgram*) = nullptr;
  PcapHandle* (*open_live)(const char* name, int snapshot, int promiscuous, int milliseconds,
                           char* error) = nullptr;
  int (*setfilter)(PcapHandle*, PcapProgram*) = nullptr;
  int (*setnonblock)(PcapHandle*, int, char* error) = nullptr;
  int (*stats)(PcapHandle*, PcapStatistics*) = nullptr;
  /// nullptr in libraries that have no such buffer.
  int (*setbuff)(PcapHandle*, int bytes) = nullptr;

 private:
  bool FindFunctions(const winapi::SystemLibrary& library);

  std::optional<winapi::SystemLibrary> library_;
};

} // namespace quendra::platform::windows
