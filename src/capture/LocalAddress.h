#pragma once

#include "runtime/Text.h"

#include <optional>

namespace quendra::capture {

/// Answers whether a decoded address reads as one of the machine's own addresses. Own addresses are texts;
/// comparing numbers gives the same answer, as a decoded address reads as its canonical text only.
class LocalAddress {
 public:
  /// `address` counts without the blanks at its ends; `decoded` is as it lies in memory.
  bool Equals(const Text& address, std::uint32_t decoded) {
    if (address != text_) Read(address);
    return number_ == decoded;
  }

 private:
  void Read(const Text& address);

  Text text_;
  std::optional<std::uint32_t> number_; ///< nothing for a text that no decoded address reads as
};

} // namespace quendra::capture
