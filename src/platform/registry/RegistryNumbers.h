#pragma once

#include "runtime/OpaqueHandle.h"

#include <cstdint>

namespace quendra::platform {

/// An open key. 0 is none.
using RegistryKey = OpaqueHandle<struct RegistryKeyKind>;
inline constexpr RegistryKey kNoRegistryKey;

// The roots, which are always open.
inline constexpr RegistryKey kClassesRoot(0x80000000);
inline constexpr RegistryKey kCurrentUser(0x80000001);
inline constexpr RegistryKey kLocalMachine(0x80000002);
inline constexpr RegistryKey kUsers(0x80000003);
inline constexpr RegistryKey kPerformanceData(0x80000004);
inline constexpr RegistryKey kCurrentConfig(0x80000005);
inline constexpr RegistryKey kDynData(0x80000006);

/// What a key is opened for.
enum RegistryAccess : std::uint32_t {
  kQueryValue = 0x1,
  kSetValue = 0x2,
  kEnumerateSubKeys = 0x8,
  kKeyRead = 0x20019,
  kKeyWrite = 0x20006,
  kKeyAllAccess = 0xF003F,
};

/// How the bytes of a value are meant.
enum RegistryValueType : std::uint32_t {
  kRegText = 1,
  kRegBinary = 3,
  kRegDword = 4,
};

/// The system's error numbers that the registry's operations give.
enum RegistryError : std::uint32_t {
  kRegistrySuccess = 0,
  kKeyNotFound = 2,
  kRegistryAccessDenied = 5,
  kInvalidRegistryKey = 6,
  kRegistryOutOfMemory = 14,
  kRegistryInvalidParameter = 87,
  kRegistryDiskFull = 112,
  kRegistryCallNotImplemented = 120,
  kBadKeyPath = 161,
  kRegistryBusy = 170,
  kMoreValueData = 234,
  kNoMoreKeys = 259,
  kRegistryBroken = 1009,
  kRegistryInputOutput = 1016,
  kKeyMarkedDeleted = 1018,
};

} // namespace quendra::platform
