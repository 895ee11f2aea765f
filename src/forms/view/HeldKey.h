#pragma once

#include <cstdint>

namespace quendra::forms {

/// Tells the presses that a held key gives from presses of its own, where the display server tells them as
/// releases and presses of one moment.
class HeldKey {
 public:
  void Released(int key, std::uint64_t moment) {
    key_ = key;
    moment_ = moment;
  }
  /// A press without a moment, 0, is one of its own.
  bool IsRepeatedBy(int key, std::uint64_t moment) const {
    return moment != 0 && moment == moment_ && key == key_;
  }

 private:
  int key_ = 0;
  std::uint64_t moment_ = 0;
};

} // namespace quendra::forms
