#pragma once

#include "platform/registry/Registry.h"
#include "platform/registry/RegistryStore.h"

#include <map>
#include <optional>

namespace quendra::platform {

/// The registry's rules over any store: which paths are well formed, what a handle may do, when a buffer is
/// too small.
class StoredRegistry : public Registry {
 public:
  explicit StoredRegistry(RegistryStore& store) : store_(store) {}

  std::uint32_t RegCreateKeyA(RegistryKey parent, const std::string& path, RegistryKey& key) override;
  std::uint32_t RegOpenKeyExA(RegistryKey parent, const std::string& path, std::uint32_t access,
                              RegistryKey& key) override;
  std::uint32_t RegSetValueExA(RegistryKey key, const std::string& name, std::uint32_t type,
                               std::span<const std::uint8_t> data) override;
  std::uint32_t RegQueryValueExA(RegistryKey key, const std::string& name, std::uint32_t& type,
                                 std::span<std::uint8_t> buffer, std::uint32_t& size) override;
  std::uint32_t RegCloseKey(RegistryKey key) override;
  std::uint32_t RegDeleteKeyA(RegistryKey parent, const std::string& path) override;
  std::uint32_t RegDeleteValueA(RegistryKey key, const std::string& name) override;
  std::uint32_t RegEnumKeyExA(RegistryKey key, std::uint32_t index, std::string& name) override;

  /// Keys that are open beside the roots.
  std::size_t OpenCount() const { return open_.size(); }

 private:
  using KeyNumber = RegistryStore::KeyNumber;
  struct OpenKey {
    KeyNumber number = 0;
    std::uint32_t access = 0;
  };

  std::optional<OpenKey> Opened(RegistryKey key) const;
  /// The key's number when it is open, stands and was opened for `access`.
  std::uint32_t Use(RegistryKey key, std::uint32_t access, KeyNumber& number);
  std::uint32_t FindPath(RegistryKey parent, const std::string& path, KeyNumber& number);
  RegistryKey Open(KeyNumber number, std::uint32_t access);

  RegistryStore& store_;
  std::map<RegistryKey, OpenKey> open_;
  std::uint32_t lastKey_ = 0;
};

} // namespace quendra::platform
