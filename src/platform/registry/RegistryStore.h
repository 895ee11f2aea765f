#pragma once

#include "platform/registry/RegistryNumbers.h"

#include <cstdint>
#include <string>
#include <vector>

namespace quendra::platform {

struct RegistryValue {
  std::uint32_t type = 0;
  std::vector<std::uint8_t> data{};
  friend bool operator==(const RegistryValue&, const RegistryValue&) = default;
};

/// Where a registry keeps its keys: single steps of the tree, by the number of a key. Numbers are never given
/// again. A root's number is that of its handle; it needs no making. Names are compared without regard to the
/// case of Latin letters. Each step gives an error number.
class RegistryStore {
 public:
  using KeyNumber = std::int64_t;

  virtual ~RegistryStore() = default;

  /// kKeyNotFound for a name that isn't there.
  virtual std::uint32_t Find(KeyNumber parent, const std::string& name, KeyNumber& key) = 0;
  /// Whether a key that was found earlier still stands: kKeyMarkedDeleted when not.
  virtual std::uint32_t Check(KeyNumber key) = 0;
  /// Makes every key of the path that is missing, or none of them.
  virtual std::uint32_t Make(KeyNumber parent, const std::vector<std::string>& path, KeyNumber& key) = 0;
  /// kRegistryAccessDenied for a key that has keys.
  virtual std::uint32_t Remove(KeyNumber key) = 0;
  virtual std::uint32_t NameAt(KeyNumber parent, std::uint32_t index, std::string& name) = 0;

  virtual std::uint32_t Read(KeyNumber key, const std::string& name, RegistryValue& value) = 0;
  virtual std::uint32_t Write(KeyNumber key, const std::string& name, const RegistryValue& value) = 0;
  virtual std::uint32_t Erase(KeyNumber key, const std::string& name) = 0;
};

} // namespace quendra::platform
