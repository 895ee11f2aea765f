#include "platform/linux/adapters/RouteRequests.h"

#include "platform/linux/net/NetlinkBytes.h"

#include <linux/rtnetlink.h>
#include <sys/socket.h>

#include <algorithm>
#include <cerrno>

namespace quendra::platform::linux_ {

namespace {

constexpr std::size_t kBufferBytes = 1 << 16;
/// More default routes than that over one link are not ours to take away.
constexpr int kMostRoutes = 16;

Descriptor OpenRouteSocket() {
  Descriptor opened(::socket(AF_NETLINK, SOCK_RAW | SOCK_CLOEXEC, NETLINK_ROUTE));
  // The kernel answers at once; the limit is for one that doesn't.
  const timeval limit{1, 0};
  if (opened) ::setsockopt(opened.Number(), SOL_SOCKET, SO_RCVTIMEO, &limit, sizeof limit);
  return opened;
}

/// A request with a body and attributes of four bytes each.
class Request {
 public:
  template <typename Body> Request(int type, int flags, const Body& body) {
    nlmsghdr header{};
    header.nlmsg_type = static_cast<std::uint16_t>(type);
    header.nlmsg_flags = static_cast<std::uint16_t>(NLM_F_REQUEST | flags);
    Put(header);
    Put(body);
  }
  void Add(int type, std::uint32_t value) {
    Put(nlattr{sizeof(nlattr) + sizeof value, static_cast<std::uint16_t>(type)});
    Put(value);
  }
  /// 0 or an error number.
  int Send(const Descriptor& socket) {
    const auto size = static_cast<std::uint32_t>(bytes_.size());
    std::memcpy(bytes_.data(), &size, sizeof size);
    if (!socket) return EBADF;
    return ::send(socket.Number(), bytes_.data(), bytes_.size(), 0) == static_cast<ssize_t>(size) ? 0 : errno;
  }

 private:
  template <typename Record> void Put(const Record& record) {
    const std::size_t at = bytes_.size();
    bytes_.resize(at + NLA_ALIGN(sizeof record));
    std::memcpy(bytes_.data() + at, &record, sizeof record);
  }

  std::vector<std::uint8_t> bytes_;
};

/// Calls `visit` for each message until the answer ends; 0 or an error number.
template <typename Visit> int ReadAnswer(const Descriptor& socket, Visit visit) {
  std::vector<std::uint8_t> buffer(kBufferBytes);
  for (;;) {
    const ssize_t count = ::recv(socket.Number(), buffer.data(), buffer.size(), 0);
    if (count < 0 && errno == EINTR) continue;
    if (count <= 0) return count < 0 ? errno : EIO;
    NetlinkBytes left(buffer.data(), static_cast<std::size_t>(count));
    while (const auto header = ReadAt<nlmsghdr>(left, 0)) {
      if (header->nlmsg_len < sizeof(nlmsghdr) || header->nlmsg_len > left.size()) return EIO;
      const auto message = left.subspan(sizeof(nlmsghdr), header->nlmsg_len - sizeof(nlmsghdr));
      if (header->nlmsg_type == NLMSG_DONE) return 0;
      if (header->nlmsg_type == NLMSG_ERROR) return -ReadAt<std::int32_t>(message, 0).value_or(-EIO);
      visit(message);
      left = After(left, header->nlmsg_len);
    }
  }
}

int Ask(const Descriptor& socket, Request request) {
  if (const int error = request.Send(socket)) return error;
  return ReadAnswer(socket, [](NetlinkBytes) {});
}

Request AddressRequest(int type, int flags, unsigned link, const CardAddress& address) {
  ifaddrmsg body{};
  body.ifa_family = AF_INET;
  body.ifa_prefixlen = static_cast<std::uint8_t>(address.prefix);
  body.ifa_index = link;
  Request request(type, NLM_F_ACK | flags, body);
  request.Add(IFA_LOCAL, address.address.InMemory());
  request.Add(IFA_ADDRESS, address.address.InMemory());
  return request;
}

Request DefaultRouteRequest(int type, int flags, unsigned link) {
  rtmsg body{};
  body.rtm_family = AF_INET;
  body.rtm_table = RT_TABLE_MAIN;
  body.rtm_scope = type == RTM_DELROUTE ? RT_SCOPE_NOWHERE : RT_SCOPE_UNIVERSE;
  body.rtm_protocol = type == RTM_DELROUTE ? RTPROT_UNSPEC : RTPROT_STATIC;
  body.rtm_type = type == RTM_DELROUTE ? RTN_UNSPEC : RTN_UNICAST;
  Request request(type, NLM_F_ACK | flags, body);
  request.Add(RTA_OIF, link);
  return request;
}

} // namespace

RouteRequests::RouteRequests(unsigned link) : link_(link), socket_(OpenRouteSocket()) {}

int RouteRequests::ReadAddresses(std::vector<CardAddress>& addresses) const {
  ifaddrmsg body{};
  body.ifa_family = AF_INET;
  Request request(RTM_GETADDR, NLM_F_DUMP, body);
  if (const int error = request.Send(socket_)) return error;
  return ReadAnswer(socket_, [&](NetlinkBytes message) {
    const auto header = ReadAt<ifaddrmsg>(message, 0);
    if (!header || header->ifa_index != link_) return;
    ForEachAttribute(After(message, sizeof *header), [&](int type, NetlinkBytes content) {
      const auto address = ReadAt<std::uint32_t>(content, 0);
      if (type == IFA_LOCAL && address)
        addresses.push_back({Ipv4Address::FromMemory(*address), header->ifa_prefixlen});
    });
  });
}

int RouteRequests::ReplaceAddresses(const std::vector<CardAddress>& addresses) const {
  if (link_ == 0) return ENODEV;
  std::vector<CardAddress> before;
  if (const int error = ReadAddresses(before)) return error;
  // First those that go: an address of the same network would go with them.
  for (const CardAddress& old : before) {
    if (std::ranges::find(addresses, old) != addresses.end()) continue;
    const int error = Ask(socket_, AddressRequest(RTM_DELADDR, 0, link_, old));
    if (error != 0 && error != EADDRNOTAVAIL) return error;
  }
  for (const CardAddress& address : addresses)
    if (const int error =
            Ask(socket_, AddressRequest(RTM_NEWADDR, NLM_F_CREATE | NLM_F_REPLACE, link_, address)))
      return error;
  return 0;
}

int RouteRequests::ReplaceGateway(const CardGateway& gateway) const {
  if (link_ == 0) return ENODEV;
  for (int i = 0; i < kMostRoutes; ++i) {
    const int error = Ask(socket_, DefaultRouteRequest(RTM_DELROUTE, 0, link_));
    if (error == ESRCH) break;
    if (error != 0) return error;
  }
  Request request = DefaultRouteRequest(RTM_NEWROUTE, NLM_F_CREATE, link_);
  request.Add(RTA_GATEWAY, gateway.address.InMemory());
  request.Add(RTA_PRIORITY, gateway.metric);
  return Ask(socket_, std::move(request));
}

} // namespace quendra::platform::linux_
