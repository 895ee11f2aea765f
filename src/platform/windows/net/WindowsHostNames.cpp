#include "platform/windows/net/WindowsHostNames.h"

#include "platform/net/SocketNumbers.h"
#include "platform/windows/net/AnsiText.h"
#include "platform/windows/net/HostEntry.h"

#include <array>

namespace quendra::platform::windows {

WindowsHostNames::~WindowsHostNames() {
  if (started_) library_.WSACleanup();
}

bool WindowsHostNames::Start() {
  if (started_) return true;
  WSADATA data{};
  lastError_ = library_.IsThere() ? library_.WSAStartup(MAKEWORD(1, 1), &data) : kSubsystemUnavailable;
  started_ = lastError_ == 0;
  return started_;
}

std::optional<std::string> WindowsHostNames::gethostname() {
  if (!Start()) return {};
  std::array<char, 256> name{};
  const bool isGiven = library_.gethostname(name.data(), static_cast<int>(name.size() - 1)) == 0;
  lastError_ = isGiven ? 0 : library_.WSAGetLastError();
  if (!isGiven) return {};
  return ToCodePage(FromAnsi(name.data()));
}

std::optional<std::vector<Ipv4Address>> WindowsHostNames::gethostbyname(const std::string& name) {
  if (!Start()) return {};
  const hostent* entry = library_.gethostbyname(name.c_str());
  lastError_ = entry ? 0 : library_.WSAGetLastError();
  if (!entry) return {};
  std::vector<Ipv4Address> addresses = AddressesOf(*entry);
  if (!addresses.empty()) return addresses;
  lastError_ = kNameWithoutAddress;
  return {};
}

} // namespace quendra::platform::windows
