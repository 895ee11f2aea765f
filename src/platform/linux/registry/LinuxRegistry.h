#pragma once

#include "platform/linux/registry/SqliteRegistryStore.h"
#include "platform/registry/StoredRegistry.h"

namespace quendra::platform::linux_ {

/// A registry of the user's own, in one file of a folder.
class LinuxRegistry : private SqliteRegistryStore, public StoredRegistry {
 public:
  explicit LinuxRegistry(std::string folder, std::function<void(const std::string&)> tell = TellUser)
      : SqliteRegistryStore(std::move(folder), std::move(tell)),
        StoredRegistry(static_cast<SqliteRegistryStore&>(*this)) {}

 private:
  static void TellUser(const std::string& message);
};

} // namespace quendra::platform::linux_
