#pragma once

#include "runtime/Text.h"

#include <cstdint>

namespace quendra::platform {
class Registry;
}

namespace quendra::mail {

/// Makes accounts of Outlook Express, which keeps them in the registry.
class ExpressAccount {
 public:
  explicit ExpressAccount(platform::Registry& registry) : registry_(registry) {}

  /// Writes the provider's account over one that is there. 0 for success, else the registry's error number.
  /// No password is written: the mail program asks for it.
  std::int32_t CreateExpressAccount(const Text& userName, const Text& fullName);

 private:
  platform::Registry& registry_;
};

/// What the account's key is named: the domain with its first letter in upper case.
Text AccountKeyOf(Text domain);

} // namespace quendra::mail
