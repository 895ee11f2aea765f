#pragma once

#include "platform/linux/LinuxFixture.h"
#include "platform/linux/registry/LinuxRegistry.h"
#include "platform/linux/system/Files.h"

#include <gtest/gtest.h>

namespace quendra::platform::linux_ {

/// A registry in a folder of the test, and what was told of it.
struct LinuxRegistryTest : testing::Test {
  using Bytes = std::vector<std::uint8_t>;

  TemporaryFolder folder;
  std::vector<std::string> told; ///< under which path a damaged file is kept
  const std::string file = folder / "quendra/registry.sqlite";

  LinuxRegistry Registry() {
    return LinuxRegistry(folder / "quendra", [this](const std::string& keptAs) { told.push_back(keptAs); });
  }
  std::string Content(const std::string& path) const { return ReadFile(path, 100'000'000).value_or("none"); }
  static std::uint32_t Write(LinuxRegistry& registry, const std::string& path, std::uint8_t value) {
    RegistryKey key;
    if (const auto error = registry.RegCreateKeyA(kCurrentUser, path, key)) return error;
    const auto error = registry.RegSetValueExA(key, "v", kRegBinary, Bytes{value});
    registry.RegCloseKey(key);
    return error;
  }
  /// The value's one byte, or 1000 and the error.
  static std::uint32_t Read(LinuxRegistry& registry, const std::string& path) {
    RegistryKey key;
    if (const auto error = registry.RegOpenKeyExA(kCurrentUser, path, kKeyRead, key)) return 1000 + error;
    std::uint32_t type = 0;
    std::uint32_t size = 0;
    Bytes data(1);
    const auto error = registry.RegQueryValueExA(key, "v", type, data, size);
    registry.RegCloseKey(key);
    return error == kRegistrySuccess ? data[0] : 1000 + error;
  }
};

} // namespace quendra::platform::linux_
