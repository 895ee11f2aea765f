#include "platform/linux/net/InterfaceTable.h"

#include <net/if.h>
#include <sys/ioctl.h>
#include <sys/socket.h>

#include <linux/ethtool.h>
#include <linux/rtnetlink.h>
#include <linux/sockios.h>

#include <cerrno>

namespace quendra::platform::linux_ {

namespace {

constexpr std::size_t kBufferBytes = 1 << 17;
enum class Progress { More, Done, Failed };

bool RequestLinks(int netlink) {
  struct {
    nlmsghdr header;
    ifinfomsg body;
  } request{};
  request.header.nlmsg_len = sizeof request;
  request.header.nlmsg_type = RTM_GETLINK;
  request.header.nlmsg_flags = NLM_F_REQUEST | NLM_F_DUMP;
  request.body.ifi_family = AF_UNSPEC;
  return ::send(netlink, &request, sizeof request, 0) == static_cast<ssize_t>(sizeof request);
}

Progress TakeUp(NetlinkBytes datagram, std::vector<Link>& links) {
  while (const auto header = ReadAt<nlmsghdr>(datagram, 0)) {
    if (header->nlmsg_len < sizeof(nlmsghdr) || header->nlmsg_len > datagram.size()) return Progress::Failed;
    if (header->nlmsg_type == NLMSG_DONE) return Progress::Done;
    if (header->nlmsg_type == NLMSG_ERROR) return Progress::Failed;
    const auto message = datagram.subspan(sizeof(nlmsghdr), header->nlmsg_len - sizeof(nlmsghdr));
    if (header->nlmsg_type == RTM_NEWLINK && links.size() < InterfaceTable::kMostLinks)
      if (auto link = LinkOf(message)) links.push_back(std::move(*link));
    datagram = After(datagram, header->nlmsg_len);
  }
  return Progress::More;
}

/// Bits a second.
std::uint32_t SpeedOf(int socket, const std::string& name) {
  ethtool_cmd command{};
  command.cmd = ETHTOOL_GSET;
  ifreq request{};
  name.copy(request.ifr_name, sizeof request.ifr_name - 1);
  request.ifr_data = reinterpret_cast<char*>(&command);
  if (::ioctl(socket, SIOCETHTOOL, &request) != 0) return InterfaceTable::kUnknownSpeed;
  const std::uint32_t megabits = ethtool_cmd_speed(&command);
  if (megabits == 0 || megabits == static_cast<std::uint32_t>(SPEED_UNKNOWN))
    return InterfaceTable::kUnknownSpeed;
  return static_cast<std::uint32_t>(
      std::min(megabits * std::uint64_t{1'000'000}, InterfaceTable::kMostSpeed));
}

} // namespace

InterfaceTable::InterfaceTable() {
  std::vector<Link> links;
  ReadLinks(links);
  for (const Link& link : links) atStart_[link.row.Get(InterfaceRow::kIndex)] = link.counters;
}

bool InterfaceTable::ReadLinks(std::vector<Link>& links) {
  const Descriptor netlink(::socket(AF_NETLINK, SOCK_RAW | SOCK_CLOEXEC, NETLINK_ROUTE));
  if (!netlink || !RequestLinks(netlink.Number())) return false;
  // The kernel answers at once; the limit is for a kernel that doesn't.
  const timeval limit{1, 0};
  ::setsockopt(netlink.Number(), SOL_SOCKET, SO_RCVTIMEO, &limit, sizeof limit);
  std::vector<std::uint8_t> buffer(kBufferBytes);
  for (;;) {
    const ssize_t count = ::recv(netlink.Number(), buffer.data(), buffer.size(), 0);
    if (count < 0 && errno == EINTR) continue;
    if (count <= 0) return false;
    const Progress progress = TakeUp({buffer.data(), static_cast<std::size_t>(count)}, links);
    if (progress != Progress::More) return progress == Progress::Done;
  }
}

bool InterfaceTable::Read(std::vector<InterfaceRow>& rows) {
  std::vector<Link> links;
  if (!ReadLinks(links)) return false;
  std::ranges::sort(links, {}, [](const Link& link) { return link.row.Get(InterfaceRow::kIndex); });
  links.resize(std::min(links.size(), kMostRows));
  const Descriptor socket(::socket(AF_INET, SOCK_DGRAM | SOCK_CLOEXEC, 0));
  rows.clear();
  for (Link& link : links) {
    link.row.Set(InterfaceRow::kSpeed, SpeedOf(socket.Number(), link.name));
    PutCounters(link, link.row);
    rows.push_back(link.row);
  }
  return true;
}

void InterfaceTable::PutCounters(const Link& link, InterfaceRow& row) {
  // One that came later began at 0, as did those of a card that was started again.
  const auto& start = atStart_[row.Get(InterfaceRow::kIndex)];
  for (std::size_t i = 0; i < start.size(); ++i) {
    const std::uint64_t now = link.counters[i];
    row.Set(kCounterFields[i], static_cast<std::uint32_t>(now < start[i] ? now : now - start[i]));
  }
}

} // namespace quendra::platform::linux_
