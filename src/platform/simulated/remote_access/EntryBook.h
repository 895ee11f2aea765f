#pragma once

#include "platform/simulated/remote_access/SimulatedEntry.h"

#include <deque>

namespace quendra::platform::simulated {

/// The entries of the phone book, in the order in which they were made. Latin case makes no other name.
class EntryBook {
 public:
  /// nullptr for a name that it hasn't.
  SimulatedEntry* Find(const std::string& name);
  /// The entry of that name, made if need be, with properties of that size.
  SimulatedEntry& Made(const std::string& name, std::uint32_t entryBytes);
  bool Remove(const std::string& name);
  const std::deque<SimulatedEntry>& All() const { return entries_; }

 private:
  std::deque<SimulatedEntry> entries_; // which moves none of the others when it grows
};

/// Properties as a RasEntry with what follows it, and back. `entry` of the image is `properties.size()`
/// bytes.
std::vector<std::uint8_t> PropertiesImage(const SimulatedEntry& entry);
void TakeProperties(SimulatedEntry& entry, std::span<const std::uint8_t> image);

} // namespace quendra::platform::simulated
