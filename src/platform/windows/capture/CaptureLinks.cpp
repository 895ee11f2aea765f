#include "platform/windows/capture/CaptureLinks.h"

#include "platform/windows/net/SizedTable.h"

#include <algorithm>
#include <cstring>

namespace quendra::platform::windows {

namespace {

// Of the interface table's kinds, one that later systems have for a wireless card.
constexpr std::uint32_t kWirelessInterface = 71;

// The capture library's names.
constexpr std::string_view kDevicePrefix = "\\Device\\NPF_";
constexpr std::string_view kDialUpDevice = "GenericDialupAdapter";
constexpr std::string_view kLoopbackName = "Loopback";

bool IsShown(std::uint32_t kind) {
  return kind == kEthernetInterface || kind == kWirelessInterface || kind == kPppInterface ||
         kind == kTunnelInterface;
}

const InterfaceRow* RowOf(const std::vector<InterfaceRow>& rows, std::uint32_t index) {
  const auto found = std::ranges::find_if(
      rows, [&](const InterfaceRow& row) { return row.Get(InterfaceRow::kIndex) == index; });
  return found == rows.end() ? nullptr : &*found;
}

bool IsUp(const InterfaceRow& row) {
  return row.Get(InterfaceRow::kAdminStatus) == kAdminUp && row.Get(InterfaceRow::kOperStatus) >= kConnected;
}

CaptureLink LinkOf(const ListedCard& card, const std::vector<InterfaceRow>& rows, std::uint32_t routed) {
  const InterfaceRow* row = RowOf(rows, card.index);
  CaptureLink link;
  link.name = card.name;
  link.description = card.description;
  link.index = card.index;
  if (!card.addresses.empty()) link.address = card.addresses.front();
  link.isUp = row != nullptr && IsUp(*row);
  link.isDialUp = card.kind == kPppInterface;
  link.hasDefaultRoute = card.index == routed;
  return link;
}

/// The list of adapters lacks it.
CaptureLink LoopbackOf(const InterfaceRow& row) {
  CaptureLink link;
  link.name = kLoopbackName;
  link.description = u"Loopback";
  link.index = row.Get(InterfaceRow::kIndex);
  link.address = Ipv4Address::FromHost(0x7F000001);
  link.isUp = IsUp(row);
  link.isLoopback = true;
  return link;
}

bool SameName(std::string_view left, std::string_view right) {
  const auto lower = [](char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c + 32) : c; };
  return std::ranges::equal(left, right, {}, lower, lower);
}

std::uint32_t DefaultRouteIndex(const IpHelperLibrary& library) {
  std::vector<std::uint8_t> table;
  if (!library.GetIpForwardTable ||
      ReadSizedTable(table, [&](std::uint8_t* room, DWORD& size) {
        return library.GetIpForwardTable(reinterpret_cast<MIB_IPFORWARDTABLE*>(room), &size, TRUE);
      }) != 0)
    return 0;
  const auto* routes = reinterpret_cast<const MIB_IPFORWARDTABLE*>(table.data());
  const MIB_IPFORWARDROW* best = nullptr;
  for (DWORD i = 0; i < routes->dwNumEntries; ++i) {
    const MIB_IPFORWARDROW& route = routes->table[i];
    if (route.dwForwardDest != 0 || route.dwForwardMask != 0) continue;
    if (best == nullptr || route.dwForwardMetric1 < best->dwForwardMetric1) best = &route;
  }
  return best != nullptr ? best->dwForwardIfIndex : 0;
}

} // namespace

std::vector<CaptureLink> CaptureLinksOf(const std::vector<ListedCard>& cards,
                                        const std::vector<InterfaceRow>& rows, std::uint32_t routed) {
  std::vector<CaptureLink> links;
  for (const ListedCard& card : cards)
    if (IsShown(card.kind)) links.push_back(LinkOf(card, rows, routed));
  for (const InterfaceRow& row : rows)
    if (row.Get(InterfaceRow::kType) == kLoopbackInterface) links.push_back(LoopbackOf(row));
  return links;
}

std::optional<std::vector<CaptureLink>> ReadCaptureLinks(const IpHelperLibrary& library) {
  std::vector<ListedCard> cards;
  std::vector<InterfaceRow> rows;
  if (ReadNetworkCards(library, cards) != 0 || ReadInterfaceRows(library, true, rows) != 0)
    return std::nullopt;
  return CaptureLinksOf(cards, rows, DefaultRouteIndex(library));
}

const CaptureLink* LinkOfDevice(const std::vector<CaptureLink>& links, std::string_view device) {
  if (!device.starts_with(kDevicePrefix)) return nullptr;
  const std::string_view name = device.substr(kDevicePrefix.size());
  // One device stands for whatever line was dialled.
  const bool isDialUp = SameName(name, kDialUpDevice);
  const auto found = std::ranges::find_if(links, [&](const CaptureLink& link) {
    return isDialUp ? link.isDialUp && link.isUp : SameName(link.name, name);
  });
  return found == links.end() ? nullptr : &*found;
}

} // namespace quendra::platform::windows
