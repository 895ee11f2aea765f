#pragma once

#include "platform/process/Icons.h"

namespace quendra::platform::unavailable {

/// A system whose files have no icons.
class UnavailableIcons : public Icons {
 public:
  Handle ExtractIconExA(const std::string&, int) override { return kNoHandle; }
  const std::vector<std::uint8_t>& ImageOf(Handle) override { return none_; }
  bool DestroyIcon(Handle) override { return false; }

 private:
  const std::vector<std::uint8_t> none_{};
};

} // namespace quendra::platform::unavailable
