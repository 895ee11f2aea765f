#pragma once

#include <cstdint>

namespace quendra::platform {

/// The system's error numbers that GetLastError gives, as far as the program or a backend names them.
enum SystemErrorNumber : std::uint32_t {
  kNoError = 0,
  kAccessDenied = 5,
  kErrorInvalidHandle = 6,
  kNoMoreFiles = 18,
  kInvalidParameter = 87,
  kCallNotImplemented = 120,
  kModuleNotFound = 126,
  kPartialCopy = 299,
  kNotAllAssigned = 1300,
  kNoSuchPrivilege = 1313,
};

} // namespace quendra::platform
