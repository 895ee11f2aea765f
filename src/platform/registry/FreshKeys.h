#pragma once

#include "platform/registry/RegistryNumbers.h"

#include <span>

namespace quendra::platform {

struct FreshKey {
  RegistryKey root;
  const char* path;
};

/// The keys that a machine has before anybody wrote to its registry, as far as the program asks for them: the
/// hives, what holds the services and the installed products, and the internet settings as of version 5.0.
/// The older cache settings
/// ("Internet Settings\Cache\Content") come with a browser that was there before an update, and mail accounts
/// with the first account, so neither is there.
std::span<const FreshKey> FreshKeys();

} // namespace quendra::platform
