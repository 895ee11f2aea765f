#pragma once

#include "platform/simulated/net/SimulatedHostNames.h"
#include "platform/simulated/net/SocketMessages.h"

#include <set>

namespace quendra::platform::simulated {

/// Look-ups of names that are under way. Each ends with the loop's next round, save those that a test keeps
/// from ending.
class SimulatedLookUps {
 public:
  SimulatedLookUps(SimulatedHostNames& hostNames, SocketMessages& messages)
      : hostNames_(hostNames), messages_(messages) {}

  void FailName(const std::string& name, std::int32_t error) { failingNames_[name] = error; }
  void NeverAnswer(const std::string& name) { silentNames_.insert(name); }
  int CountUnderWay() const { return static_cast<int>(underWay_.size()); }

  LookUpHandle Start(WindowHandle window, std::uint32_t message, const std::string& name,
                     std::span<std::uint8_t> buffer);
  /// False when it isn't under way.
  bool Cancel(LookUpHandle lookUp) { return underWay_.erase(lookUp) > 0; }
  void Clear() { underWay_.clear(); }

 private:
  struct LookUp {
    WindowHandle window;
    std::uint32_t message;
    std::string name;
    std::span<std::uint8_t> buffer;
  };
  void Resolve(LookUpHandle lookUp);
  /// Writes the addresses into the buffer; gives 0, or the number of the reason why it didn't.
  std::int32_t Answer(const LookUp& asked);

  SimulatedHostNames& hostNames_;
  SocketMessages& messages_;
  std::map<std::string, std::int32_t> failingNames_;
  std::set<std::string> silentNames_;
  std::map<LookUpHandle, LookUp> underWay_;
  std::uint32_t lastLookUp_ = 0x9000;
};

} // namespace quendra::platform::simulated
