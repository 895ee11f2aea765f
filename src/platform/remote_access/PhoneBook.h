#pragma once

#include "platform/remote_access/RemoteAccessNumbers.h"

#include <cstdint>
#include <span>

namespace quendra::platform {

/// Entries by which the machine dials, and the devices that it can dial with.
///
/// Texts are bytes of the code page that end at a NUL; nullptr and an empty phone book are the user's own.
/// Records are byte images (RemoteAccessNumbers.h) whose first word holds the record's size. Where a call
/// fills a buffer, `bytes` is what the caller says that it holds, and afterwards what is needed; the buffer
/// itself may be empty. Each gives an error number, 0 for success.
class PhoneBook {
 public:
  virtual ~PhoneBook() = default;

  /// Fills records of RasEntryName and counts them. Less room than all need gives kRasBufferTooSmall.
  virtual std::uint32_t RasEnumEntriesA(const char* phoneBook, std::span<std::uint8_t> names,
                                        std::uint32_t& bytes, std::uint32_t& count) = 0;
  virtual std::uint32_t RasDeleteEntryA(const char* phoneBook, const char* entryName) = 0;
  /// Fills a RasEntry. With no entry name it tells the size of the record alone, with kRasBufferTooSmall.
  virtual std::uint32_t RasGetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                               std::span<std::uint8_t> entry, std::uint32_t& bytes) = 0;
  /// Makes the entry or writes over it.
  virtual std::uint32_t RasSetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                               std::span<const std::uint8_t> entry) = 0;
  /// Fills the rest of a RasDialParams whose size and entry name are given. kRasInvalidSize for a size that
  /// this system hasn't, kRasCannotFindPhonebookEntry for a name that it hasn't.
  virtual std::uint32_t RasGetEntryDialParamsA(const char* phoneBook, std::span<std::uint8_t> params,
                                               bool& hasPassword) = 0;
  virtual std::uint32_t RasSetEntryDialParamsA(const char* phoneBook, std::span<const std::uint8_t> params,
                                               bool removePassword) = 0;
  /// Fills records of RasDeviceInfo and counts them, as RasEnumEntriesA does.
  virtual std::uint32_t RasEnumDevicesA(std::span<std::uint8_t> devices, std::uint32_t& bytes,
                                        std::uint32_t& count) = 0;
};

} // namespace quendra::platform
