#pragma once

#include "runtime/Text.h"

namespace quendra::platform {
class InstalledProducts;
}

namespace quendra::mail {

/// Which mail programs the machine has.
class MailClients {
 public:
  explicit MailClients(platform::InstalledProducts& products) : products_(products) {}

  /// Their tokens, a "|" behind each, as in "OE|MSO XP|". Outlook Express is taken to be there; a family of
  /// which several products are installed stands several times.
  Text DetectMailClients();

 private:
  platform::InstalledProducts& products_;
};

} // namespace quendra::mail
