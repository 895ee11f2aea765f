#pragma once

#include "platform/registry/Registry.h"
#include "platform/windows/system/LazyLibrary.h"

namespace quendra::platform::windows {

/// The system's registry. It keeps names and the texts among values in 16-bit characters; here they are in
/// our code page, a byte a character, so that a value has as many bytes as were written. Paths that other
/// systems refuse are refused before the system is asked, which is more lenient with some.
class WindowsRegistry : public Registry {
 public:
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

 private:
  /// Calls the library's function of that name; kRegistryCallNotImplemented where there is none.
  template <typename Function, typename... Arguments>
  std::uint32_t Call(const char* name, Arguments... arguments);
  /// Makes and opens what a path of the system's characters names, as deep as one call can.
  std::uint32_t Make(RegistryKey parent, const Text& path, RegistryKey& key);
  /// The whole value as the system keeps it.
  std::uint32_t Read(RegistryKey key, const Text& name, std::uint32_t& type, std::vector<std::uint8_t>& data);

  LazyLibrary advapi32_{L"advapi32.dll"};
};

} // namespace quendra::platform::windows
