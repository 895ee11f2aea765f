#pragma once

#include "platform/remote_access/PhoneBook.h"
#include "platform/windows/remote_access/RasCalls.h"

#include <vector>

namespace quendra::platform::windows {

/// The phone book of the system's remote access, which answers itself. A machine without it answers as one
/// on which it can't start.
class WindowsPhoneBook : public PhoneBook {
 public:
  explicit WindowsPhoneBook(RasCalls& ras) : ras_(ras) {}

  std::uint32_t RasEnumEntriesA(const char* phoneBook, std::span<std::uint8_t> names, std::uint32_t& bytes,
                                std::uint32_t& count) override;
  std::uint32_t RasDeleteEntryA(const char* phoneBook, const char* entryName) override;
  std::uint32_t RasGetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                       std::span<std::uint8_t> entry, std::uint32_t& bytes) override;
  std::uint32_t RasSetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                       std::span<const std::uint8_t> entry) override;
  std::uint32_t RasGetEntryDialParamsA(const char* phoneBook, std::span<std::uint8_t> params,
                                       bool& hasPassword) override;
  std::uint32_t RasSetEntryDialParamsA(const char* phoneBook, std::span<const std::uint8_t> params,
                                       bool removePassword) override;
  std::uint32_t RasEnumDevicesA(std::span<std::uint8_t> devices, std::uint32_t& bytes,
                                std::uint32_t& count) override;

 private:
  std::uint32_t TellEntryBytes(const wchar_t* phoneBook, std::uint32_t& bytes);
  /// An entry in the system's form, in a record of so many bytes.
  std::uint32_t ReadEntry(const wchar_t* phoneBook, const wchar_t* entryName, std::uint32_t recordBytes,
                          std::vector<std::uint8_t>& entry);

  RasCalls& ras_;
};

} // namespace quendra::platform::windows
