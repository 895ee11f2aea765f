#pragma once

#include "platform/net/Ipv4Address.h"
#include "runtime/Text.h"

#include <optional>

namespace quendra::capture {

/// Answers whether a decoded address reads as one of the machine's own addresses. Own addresses are texts;
/// comparing numbers gives the same answer, as a decoded address reads as its canonical text only.
class LocalAddress {
 public:
  /// `address` counts without the blanks at its ends.
  bool Equals(const Text& address, platform::Ipv4Address decoded) {
    if (address != text_) Read(address);
    return number_ == decoded;
  }

 private:
  void Read(const Text& address) {
    text_ = address;
    number_ = platform::Ipv4Address::FromText(Trimmed(address));
  }

  Text text_;
  std::optional<platform::Ipv4Address> number_; ///< nothing for a text that no decoded address reads as
};

} // namespace quendra::capture
