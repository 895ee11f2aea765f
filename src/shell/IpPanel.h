#pragma once

#include "capture/HostAddresses.h"
#include "forms/MessageLoop.h"

namespace quendra::shell {

/// The box that tells a support agent the machine's addresses.
class IpPanel {
 public:
  IpPanel(forms::MessageLoop& loop, const capture::HostAddresses& addresses)
      : loop_(loop), addresses_(addresses) {}

  /// Ctrl alone with the key that bears I, in either layout.
  static bool IsItsKey(int keyCode, int shift);
  void Show() const;

 private:
  forms::MessageLoop& loop_;
  const capture::HostAddresses& addresses_;
};

} // namespace quendra::shell
