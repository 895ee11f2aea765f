#pragma once

#include "runtime/ByteFields.h"

#include <array>
#include <cstdint>

namespace quendra::platform {

/// The published 32-byte image of the machine's memory: percentage in use, then total and available bytes.
struct MemoryStatus {
  static constexpr std::uint32_t kBytes = 32;

  enum Field : std::size_t {
    kLength = 0,
    kMemoryLoad = 4,
    kTotalPhys = 8,
    kAvailPhys = 12,
    kTotalPageFile = 16,
    kAvailPageFile = 20,
    kTotalVirtual = 24,
    kAvailVirtual = 28,
  };

  std::uint32_t Get(Field field) const { return Little32(bytes, field); }
  void Set(Field field, std::uint32_t value) { PutLittle32(bytes, field, value); }

  std::array<std::uint8_t, kBytes> bytes{};
};

} // namespace quendra::platform
