#pragma once

#include "platform/registry/RegistryNumbers.h"

#include <span>
#include <string>

namespace quendra::platform {

/// The registry: keys in a tree under the roots, with named values. Paths and names are bytes of the code
/// page, end at their first NUL and are compared without regard to the case of Latin letters; a key and a
/// value keep the case of the call that made them. Data keeps its type and its bytes. Each operation gives an
/// error number, 0 for success.
class Registry {
 public:
  virtual ~Registry() = default;

  /// Opens the key at `path` below `parent` for everything, and makes it and what lies above it where it is
  /// missing. The access that `parent` was opened with doesn't matter. An empty path opens `parent` once
  /// more.
  virtual std::uint32_t RegCreateKeyA(RegistryKey parent, const std::string& path, RegistryKey& key) = 0;
  /// `key` stays as it was on failure.
  virtual std::uint32_t RegOpenKeyExA(RegistryKey parent, const std::string& path, std::uint32_t access,
                                      RegistryKey& key) = 0;
  virtual std::uint32_t RegSetValueExA(RegistryKey key, const std::string& name, std::uint32_t type,
                                       std::span<const std::uint8_t> data) = 0;
  /// Puts the value's size in `size`. Without a buffer that is all; a buffer with less room gives
  /// kMoreValueData and stays as it was.
  virtual std::uint32_t RegQueryValueExA(RegistryKey key, const std::string& name, std::uint32_t& type,
                                         std::span<std::uint8_t> buffer, std::uint32_t& size) = 0;
  /// A root can be closed, which changes nothing.
  virtual std::uint32_t RegCloseKey(RegistryKey key) = 0;
  /// Deletes a key with its values. One that has keys of its own stays, with kRegistryAccessDenied.
  virtual std::uint32_t RegDeleteKeyA(RegistryKey parent, const std::string& path) = 0;
  virtual std::uint32_t RegDeleteValueA(RegistryKey key, const std::string& name) = 0;
  /// The name of the key's own key number `index`, from 0; kNoMoreKeys behind the last.
  virtual std::uint32_t RegEnumKeyExA(RegistryKey key, std::uint32_t index, std::string& name) = 0;
};

} // namespace quendra::platform
