#include "platform/windows/net/NetworkCards.h"

#include "platform/windows/net/AnsiText.h"
#include "platform/windows/net/SizedTable.h"

#include <algorithm>
#include <cstring>

namespace quendra::platform::windows {

namespace {

static_assert(sizeof(IP_ADAPTER_INFO) == 640, "as the system lays it out, with times of 32 bits");

template <std::size_t kSize> std::string_view TextIn(const char (&field)[kSize]) {
  return CutAtNul(std::string_view(field, kSize));
}

std::vector<Ipv4Address> AddressesIn(const IP_ADDR_STRING& first) {
  std::vector<Ipv4Address> addresses;
  for (const IP_ADDR_STRING* entry = &first; entry != nullptr; entry = entry->Next)
    addresses.push_back(Ipv4Address::FromText(TextIn(entry->IpAddress.String)).value_or(Ipv4Address()));
  return addresses;
}

ListedCard CardOf(const IP_ADAPTER_INFO& info) {
  ListedCard card;
  card.name = TextIn(info.AdapterName);
  card.description = FromAnsi(TextIn(info.Description));
  card.index = info.Index;
  card.kind = info.Type;
  card.addresses = AddressesIn(info.IpAddressList);
  card.gateways = AddressesIn(info.GatewayList);
  return card;
}

} // namespace

std::uint32_t ReadNetworkCards(const IpHelperLibrary& library, std::vector<ListedCard>& cards) {
  if (!library.GetAdaptersInfo) return IpHelperLibrary::kMissing;
  std::vector<std::uint8_t> table;
  const DWORD result = ReadSizedTable(table, [&](std::uint8_t* room, DWORD& size) {
    return library.GetAdaptersInfo(reinterpret_cast<IP_ADAPTER_INFO*>(room), &size);
  });
  cards.clear();
  if (result == ERROR_NO_DATA) return 0; // a machine without adapters
  if (result != 0) return result;
  for (const auto* info = reinterpret_cast<const IP_ADAPTER_INFO*>(table.data()); info != nullptr;
       info = info->Next)
    cards.push_back(CardOf(*info));
  return 0;
}

std::uint32_t ReadInterfaceRows(const IpHelperLibrary& library, bool sorted,
                                std::vector<InterfaceRow>& rows) {
  if (!library.GetIfTable) return IpHelperLibrary::kMissing;
  std::vector<std::uint8_t> table;
  const DWORD result = ReadSizedTable(table, [&](std::uint8_t* room, DWORD& size) {
    return library.GetIfTable(reinterpret_cast<MIB_IFTABLE*>(room), &size, sorted);
  });
  if (result != 0) return result;
  const std::size_t room = (table.size() - InterfaceRow::kFirstOffset) / InterfaceRow::kBytes;
  rows.resize(std::min<std::size_t>(Little32(table, 0), room));
  const std::uint8_t* at = table.data() + InterfaceRow::kFirstOffset;
  for (InterfaceRow& row : rows) {
    std::memcpy(row.bytes.data(), at, InterfaceRow::kBytes);
    at += InterfaceRow::kBytes;
  }
  return 0;
}

} // namespace quendra::platform::windows
