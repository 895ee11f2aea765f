#pragma once

#include "platform/net/Ipv4Address.h"
#include "platform/process/Processes.h"
#include "runtime/ByteFields.h"

#include <map>
#include <span>
#include <string>
#include <vector>

namespace quendra::platform::simulated {

/// What the families of one simulated machine share: the open handles, the last error and the record of
/// calls.
struct Core {
  enum class Kind { Snapshot, Process, Token, Event, Duplicate };
  struct Opened {
    Kind kind;
    /// Process id, or the index that the family gave.
    std::uint32_t number = 0;
  };

  Handle Open(Kind kind, std::uint32_t number = 0) {
    lastHandle += 4;
    opened[Handle(lastHandle)] = {kind, number};
    return Handle(lastHandle);
  }
  const Opened* Find(Handle handle, Kind kind) const {
    const auto found = opened.find(handle);
    return found == opened.end() || found->second.kind != kind ? nullptr : &found->second;
  }

  std::map<Handle, Opened> opened;
  std::uint32_t lastHandle = 0x100;
  std::uint32_t lastError = 0;
  std::uint32_t tickCount = 0x00100000;
  std::vector<std::string> calls;
};

/// A text as the system takes it: it ends at the first NUL.
inline std::string CutText(const std::string& text) { return text.substr(0, text.find('\0')); }

/// Bytes as a test reads them.
inline std::string TextOf(std::span<const std::uint8_t> bytes) { return {bytes.begin(), bytes.end()}; }

/// The address of a dotted text; 0.0.0.0 for a text that is none.
inline Ipv4Address AddressOf(const std::string& dotted) {
  return Ipv4Address::FromText(dotted).value_or(Ipv4Address());
}

} // namespace quendra::platform::simulated
