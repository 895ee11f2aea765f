#include "platform/linux/net/LinkRow.h"

#include "runtime/Text.h"

#include <net/if.h>
#include <net/if_arp.h>

#include <linux/if_link.h>
#include <linux/rtnetlink.h>

namespace quendra::platform::linux_ {

namespace {

// States of a link (RFC 2863), as the kernel numbers them.
enum LinkState : std::uint8_t { kUnknown = 0, kDormant = 5, kUp = 6 };

std::uint32_t KindOf(std::uint16_t type) {
  switch (type) {
  case ARPHRD_ETHER: return kEthernetInterface;
  case ARPHRD_LOOPBACK: return kLoopbackInterface;
  case ARPHRD_PPP: return kPppInterface;
  case ARPHRD_TUNNEL:
  case ARPHRD_TUNNEL6:
  case ARPHRD_SIT:
  case ARPHRD_IPGRE:
  case ARPHRD_NONE: return kTunnelInterface;
  default: return kOtherInterface;
  }
}

/// A dial-up link is connected, others are operational. One that doesn't tell its state runs when it has a
/// carrier.
std::uint32_t OperStatusOf(const ifinfomsg& info, std::uint8_t state) {
  const bool isDialUp = info.ifi_type == ARPHRD_PPP;
  const bool runs = state == kUp || (state == kUnknown && (info.ifi_flags & IFF_RUNNING) != 0);
  if ((info.ifi_flags & IFF_UP) == 0) return isDialUp ? kUnreachable : kNonOperational;
  if (state == kDormant) return kConnecting;
  if (!runs) return kDisconnected;
  return isDialUp ? kConnected : kOperational;
}

std::string TextOf(NetlinkBytes content) {
  return std::string(
      CutAtNul(std::string_view(reinterpret_cast<const char*>(content.data()), content.size())));
}

void PutName(const std::string& name, InterfaceRow& row) {
  const Text text = FromUtf8(name);
  for (std::size_t i = 0; i < text.size() && 2 * i + 2 < InterfaceRow::kNameBytes; ++i)
    PutLittle16(row.bytes, 2 * i, text[i]);
}

void PutDescription(const std::string& description, InterfaceRow& row) {
  std::string text = ToCodePage(FromUtf8(description));
  text.resize(std::min(text.size(), InterfaceRow::kDescriptionBytes - 1));
  std::ranges::copy(text, row.bytes.begin() + InterfaceRow::kDescriptionOffset);
  row.Set(InterfaceRow::kDescriptionLength, static_cast<std::uint32_t>(text.size()));
}

/// An address that finds no room is none.
void PutAddress(NetlinkBytes address, InterfaceRow& row) {
  if (address.size() > InterfaceRow::kAddressBytes) return;
  std::ranges::copy(address, row.bytes.begin() + InterfaceRow::kAddressOffset);
  row.Set(InterfaceRow::kAddressLength, static_cast<std::uint32_t>(address.size()));
}

/// The kernel counts multicast packets apart only where they come in.
Link::Counters CountersOf(const rtnl_link_stats64& stats) {
  const std::uint64_t multicast = std::min<std::uint64_t>(stats.multicast, stats.rx_packets);
  return {stats.rx_bytes,   stats.rx_packets - multicast,
          multicast,        stats.rx_dropped,
          stats.rx_errors,  stats.tx_bytes,
          stats.tx_packets, stats.tx_dropped,
          stats.tx_errors};
}

/// Kernels of other ages tell more or fewer figures; those that are missing are 0.
rtnl_link_stats64 StatsOf(NetlinkBytes content) {
  rtnl_link_stats64 stats{};
  if (!content.empty()) std::memcpy(&stats, content.data(), std::min(content.size(), sizeof stats));
  return stats;
}

} // namespace

std::optional<Link> LinkOf(NetlinkBytes message) {
  const auto info = ReadAt<ifinfomsg>(message, 0);
  if (!info) return {};
  Link link;
  std::string alias;
  std::uint8_t state = kUnknown;
  ForEachAttribute(After(message, sizeof *info), [&](int type, NetlinkBytes content) {
    if (type == IFLA_IFNAME) link.name = TextOf(content);
    if (type == IFLA_IFALIAS) alias = TextOf(content);
    if (type == IFLA_MTU) link.row.Set(InterfaceRow::kMtu, ReadAt<std::uint32_t>(content, 0).value_or(0));
    if (type == IFLA_ADDRESS) PutAddress(content, link.row);
    if (type == IFLA_OPERSTATE) state = ReadAt<std::uint8_t>(content, 0).value_or(kUnknown);
    if (type == IFLA_STATS64) link.counters = CountersOf(StatsOf(content));
  });
  link.row.Set(InterfaceRow::kIndex, static_cast<std::uint32_t>(info->ifi_index));
  link.row.Set(InterfaceRow::kType, KindOf(info->ifi_type));
  link.row.Set(InterfaceRow::kAdminStatus, (info->ifi_flags & IFF_UP) != 0 ? kAdminUp : kAdminDown);
  link.row.Set(InterfaceRow::kOperStatus, OperStatusOf(*info, state));
  PutName(link.name, link.row);
  PutDescription(alias.empty() ? link.name : alias, link.row);
  return link;
}

} // namespace quendra::platform::linux_
