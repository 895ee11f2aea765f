#pragma once

#include "platform/registry/Registry.h"

namespace quendra::platform::unavailable {

/// A system without a registry.
class UnavailableRegistry : public Registry {
 public:
  std::uint32_t RegCreateKeyA(RegistryKey, const std::string&, RegistryKey&) override { return kNone; }
  std::uint32_t RegOpenKeyExA(RegistryKey, const std::string&, std::uint32_t, RegistryKey&) override {
    return kNone;
  }
  std::uint32_t RegSetValueExA(RegistryKey, const std::string&, std::uint32_t,
                               std::span<const std::uint8_t>) override {
    return kNone;
  }
  std::uint32_t RegQueryValueExA(RegistryKey, const std::string&, std::uint32_t&, std::span<std::uint8_t>,
                                 std::uint32_t&) override {
    return kNone;
  }
  std::uint32_t RegCloseKey(RegistryKey) override { return kNone; }
  std::uint32_t RegDeleteKeyA(RegistryKey, const std::string&) override { return kNone; }
  std::uint32_t RegDeleteValueA(RegistryKey, const std::string&) override { return kNone; }
  std::uint32_t RegEnumKeyExA(RegistryKey, std::uint32_t, std::string&) override { return kNone; }

 private:
  static constexpr std::uint32_t kNone = kRegistryCallNotImplemented;
};

} // namespace quendra::platform::unavailable
