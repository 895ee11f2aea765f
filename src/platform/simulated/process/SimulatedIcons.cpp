#include "platform/simulated/process/SimulatedIcons.h"

#include "platform/simulated/SimulatedCore.h"

namespace quendra::platform::simulated {

Handle SimulatedIcons::ExtractIconExA(const std::string& path, int index) {
  const auto found = images_.find(CutText(path));
  if (found == images_.end() || index != 0) return kNoHandle;
  const auto icon = Handle(static_cast<std::uint32_t>(++Extracted));
  live_[icon] = found->second;
  return icon;
}

const std::vector<std::uint8_t>& SimulatedIcons::ImageOf(Handle icon) {
  static const std::vector<std::uint8_t> kNone;
  const auto found = live_.find(icon);
  return found == live_.end() ? kNone : found->second;
}

bool SimulatedIcons::DestroyIcon(Handle icon) {
  if (live_.erase(icon) == 0) return false;
  ++Destroyed;
  return true;
}

} // namespace quendra::platform::simulated
