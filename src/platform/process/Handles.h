#pragma once

#include "platform/process/Processes.h"

namespace quendra::platform {

/// The native interface to the handles of all processes and to the transport driver. Statuses are 0 on
/// success.
class Handles {
 public:
  virtual ~Handles() = default;

  static constexpr std::uint32_t kStatusInfoLengthMismatch = 0xC0000004;
  static constexpr std::uint32_t kStatusNotImplemented = 0xC0000002;

  /// Class 16 fills `buffer` with a 32-bit count and 16 bytes a handle. With a buffer too small the status is
  /// kStatusInfoLengthMismatch and the count stands in the first four bytes.
  virtual std::uint32_t NtQuerySystemInformation(std::uint32_t informationClass,
                                                 std::span<std::uint8_t> buffer,
                                                 std::uint32_t& returnedLength) = 0;
  virtual bool DuplicateHandle(Handle sourceProcess, Handle handle, Handle targetProcess, Handle& duplicate,
                               std::uint32_t access, bool inherit, std::uint32_t options) = 0;
  /// Class 1: the name's length in bytes (16 bits), its room (16 bits), a 32-bit address that stands for
  /// offset 8, and from there the name in 16-bit characters with a NUL. A buffer too small gives a status
  /// other than 0.
  virtual std::uint32_t NtQueryObject(Handle handle, std::uint32_t informationClass,
                                      std::span<std::uint8_t> buffer, std::uint32_t& returnedLength) = 0;
  virtual Handle CreateEventW(bool manualReset, bool initialState, const std::u16string& name) = 0;
  virtual std::uint32_t NtDeviceIoControlFile(Handle handle, Handle event, std::uint32_t controlCode,
                                              std::span<const std::uint8_t> input,
                                              std::span<std::uint8_t> output) = 0;
};

} // namespace quendra::platform
