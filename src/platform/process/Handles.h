#pragma once

#include "platform/process/Processes.h"

namespace quendra::platform {

/// The native interface to the handles of all processes and to the transport driver. Statuses are 0 on
/// success.
class Handles {
 public:
  virtual ~Handles() = default;

  static constexpr std::uint32_t kStatusNotImplemented = 0xC0000002;
  static constexpr std::uint32_t kStatusInvalidInfoClass = 0xC0000003;
  static constexpr std::uint32_t kStatusInfoLengthMismatch = 0xC0000004;
  static constexpr std::uint32_t kStatusInvalidHandle = 0xC0000008;
  static constexpr std::uint32_t kStatusInvalidParameter = 0xC000000D;

  /// The information class of the table of all handles: a 32-bit count and records of so many bytes.
  static constexpr std::uint32_t kHandleTable = 16;
  static constexpr std::size_t kCountBytes = 4;
  static constexpr std::size_t kRecordBytes = 16;
  /// Where a record holds the process id (32 bits), the object's type (8 bits) and the handle (16 bits).
  static constexpr std::size_t kProcessIdOffset = 0;
  static constexpr std::size_t kTypeOffset = 4;
  static constexpr std::size_t kHandleOffset = 6;

  /// The information class of an object's name: its length in bytes (16 bits), its room (16 bits), a 32-bit
  /// address that stands for kNameOffset, and from there the name in 16-bit characters with a NUL.
  static constexpr std::uint32_t kObjectName = 1;
  static constexpr std::size_t kNameOffset = 8;

  /// The transport driver's control code, what it takes and what it gives: the kind of information that is
  /// asked for, and the address whose port, in network order, stands at kPortOffset.
  static constexpr std::uint32_t kQueryInformation = 0x210012;
  static constexpr std::size_t kQueryBytes = 24;
  static constexpr std::size_t kQueryTypeOffset = 16;
  static constexpr std::uint8_t kQueryAddressInfo = 3;
  static constexpr std::size_t kAnswerBytes = 52;
  static constexpr std::size_t kPortOffset = 12;

  /// Class kHandleTable fills `buffer` with the table. With a buffer too small the status is
  /// kStatusInfoLengthMismatch and the count stands in the first four bytes.
  virtual std::uint32_t NtQuerySystemInformation(std::uint32_t informationClass,
                                                 std::span<std::uint8_t> buffer,
                                                 std::uint32_t& returnedLength) = 0;
  virtual bool DuplicateHandle(Handle sourceProcess, Handle handle, Handle targetProcess, Handle& duplicate,
                               std::uint32_t access, bool inherit, std::uint32_t options) = 0;
  /// Class kObjectName. A buffer too small gives a status other than 0.
  virtual std::uint32_t NtQueryObject(Handle handle, std::uint32_t informationClass,
                                      std::span<std::uint8_t> buffer, std::uint32_t& returnedLength) = 0;
  virtual Handle CreateEventW(bool manualReset, bool initialState, const std::u16string& name) = 0;
  virtual std::uint32_t NtDeviceIoControlFile(Handle handle, Handle event, std::uint32_t controlCode,
                                              std::span<const std::uint8_t> input,
                                              std::span<std::uint8_t> output) = 0;
};

} // namespace quendra::platform
