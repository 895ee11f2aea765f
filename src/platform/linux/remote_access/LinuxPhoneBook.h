#pragma once

#include "platform/linux/remote_access/ConnectionBook.h"
#include "platform/remote_access/PhoneBook.h"

namespace quendra::platform::linux_ {

/// The phone book: NetworkManager's PPPoE and VPN (PPTP) connections. Without NetworkManager there is no
/// remote access.
class LinuxPhoneBook : public PhoneBook {
 public:
  /// The folder is that of the files that tell of VPN plugins.
  LinuxPhoneBook(ConnectionBook& book, NetworkManagerBus& bus,
                 std::string pluginFolder = "/usr/lib/NetworkManager/VPN");

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
  ConnectionBook& book_;
  NetworkManagerBus& bus_;
  const std::string pluginFolder_;
};

} // namespace quendra::platform::linux_
