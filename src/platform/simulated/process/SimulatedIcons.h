#pragma once

#include "platform/process/Icons.h"

#include <map>

namespace quendra::platform::simulated {

class SimulatedIcons : public Icons {
 public:
  /// The image of the file's first icon.
  void Set(const std::string& path, std::vector<std::uint8_t> image) { images_[path] = std::move(image); }
  int Extracted = 0;
  int Destroyed = 0;
  /// Extracted and not destroyed.
  int Live() const { return static_cast<int>(live_.size()); }

  Handle ExtractIconExA(const std::string& path, int index) override;
  const std::vector<std::uint8_t>& ImageOf(Handle icon) override;
  bool DestroyIcon(Handle icon) override;

 private:
  std::map<std::string, std::vector<std::uint8_t>> images_;
  std::map<Handle, std::vector<std::uint8_t>> live_;
};

} // namespace quendra::platform::simulated
