#pragma once

#include "capture/HostAddresses.h"
#include "forms/Desktop.h"

namespace quendra::shell {

/// The box that tells a support agent the machine's addresses.
class IpPanel {
 public:
  IpPanel(forms::Desktop& desktop, const capture::HostAddresses& addresses)
      : desktop_(desktop), addresses_(addresses) {}

  /// Ctrl alone with the key that bears I, in either layout.
  static bool IsItsKey(int keyCode, int shift);
  void Show() const;

 private:
  forms::Desktop& desktop_;
  const capture::HostAddresses& addresses_;
};

} // namespace quendra::shell
