#pragma once

#include "platform/registry/StoredRegistry.h"
#include "platform/simulated/registry/RegistryTree.h"

#include <optional>

namespace quendra::platform::simulated {

/// The registry of a fresh system. Tests name a key by its whole path, root first, as in
/// "HKEY_CURRENT_USER\Software".
class SimulatedRegistry : public StoredRegistry {
 public:
  SimulatedRegistry();

  void AddKey(const std::string& path);
  /// With all below it.
  void RemoveKey(const std::string& path);
  /// Makes the key, too.
  void SetValue(const std::string& path, const std::string& name, const RegistryValue& value);
  bool HasKey(const std::string& path) const;
  std::optional<RegistryValue> Value(const std::string& path, const std::string& name);
  /// Whatever is tried on the key gives the error. The key is made if it isn't there.
  void Refuse(const std::string& path, std::uint32_t error);
  /// As Refuse, for the whole registry; 0 ends it.
  void RefuseAll(std::uint32_t error);

  /// Writing calls in their order: "RegCreateKeyA HKEY_CURRENT_USER\Software", "RegSetValueExA Name",
  /// "RegCloseKey".
  std::vector<std::string> Calls;

  std::uint32_t RegCreateKeyA(RegistryKey parent, const std::string& path, RegistryKey& key) override;
  std::uint32_t RegOpenKeyExA(RegistryKey parent, const std::string& path, std::uint32_t access,
                              RegistryKey& key) override;
  std::uint32_t RegSetValueExA(RegistryKey key, const std::string& name, std::uint32_t type,
                               std::span<const std::uint8_t> data) override;
  std::uint32_t RegCloseKey(RegistryKey key) override;

 private:
  /// 0 for a key that isn't there.
  RegistryStore::KeyNumber NumberOf(const std::string& path) const;
  RegistryStore::KeyNumber Made(const std::string& path);

  RegistryTree tree_;
};

} // namespace quendra::platform::simulated
