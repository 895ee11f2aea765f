#pragma once

#include "platform/linux/registry/SqliteRegistryStore.h"
#include "platform/registry/StoredRegistry.h"

namespace quendra::platform::linux_ {

/// A registry of the user's own, in one file of a folder.
class LinuxRegistry : private SqliteRegistryStore, public StoredRegistry {
 public:
  /// `tellOfDamage` hears under which path a damaged file is kept. It may ask nothing of the registry.
  explicit LinuxRegistry(std::string folder, std::function<void(const std::string& keptAs)> tellOfDamage = {})
      : SqliteRegistryStore(std::move(folder), std::move(tellOfDamage)),
        StoredRegistry(static_cast<SqliteRegistryStore&>(*this)) {}
};

} // namespace quendra::platform::linux_
