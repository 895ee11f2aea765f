#include "platform/linux/net/SocketDiagnostics.h"

#include "platform/linux/net/NetlinkBytes.h"

#include <linux/inet_diag.h>
#include <linux/sock_diag.h>
#include <sys/socket.h>

#include <array>
#include <cerrno>
#include <cstring>
#include <optional>

namespace quendra::platform::linux_ {

namespace {

constexpr std::size_t kBufferBytes = 1 << 17;
constexpr std::uint32_t kAllStates = 0x1FFE; // one bit a state, 1 to 12
constexpr std::uint32_t kKernelListening = 10;

// The owner table's number for each state number of the kernel.
constexpr std::array<std::uint32_t, 13> kStates = {0, 5, 3, 4, 6, 7, 11, 1, 8, 10, 2, 9, 4};

bool IsMapped(const std::uint32_t (&address)[4]) {
  static constexpr std::uint8_t kPrefix[12] = {0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0xFF, 0xFF};
  return std::memcmp(address, kPrefix, sizeof kPrefix) == 0;
}

bool IsUnset(const std::uint32_t (&address)[4]) {
  return (address[0] | address[1] | address[2] | address[3]) == 0;
}

/// Whether a listener takes connections of the IPv6 family alone; so it is taken to be when the kernel
/// doesn't tell.
bool IsV6Only(std::span<const std::uint8_t> attributes) {
  std::optional<bool> told;
  ForEachAttribute(attributes, [&](int type, NetlinkBytes content) {
    if (type == INET_DIAG_SKV6ONLY && !content.empty() && !told) told = content[0] != 0;
  });
  return told.value_or(true);
}

/// The two IPv4 addresses of the socket; false when it isn't one over IPv4.
bool AddressesOf(const inet_diag_msg& message, std::span<const std::uint8_t> attributes, TcpSocket& socket) {
  const auto& local = message.id.idiag_src;
  const auto& remote = message.id.idiag_dst;
  if (message.idiag_family == AF_INET) {
    socket.localAddress = local[0];
    socket.remoteAddress = remote[0];
    return true;
  }
  if (message.idiag_family != AF_INET6) return false;
  if (IsMapped(local) && (IsMapped(remote) || IsUnset(remote))) {
    socket.localAddress = local[3];
    socket.remoteAddress = remote[3];
    return true;
  }
  return message.idiag_state == kKernelListening && IsUnset(local) && !IsV6Only(attributes);
}

void TakeUpSocket(std::span<const std::uint8_t> payload, std::vector<TcpSocket>& sockets) {
  const auto message = ReadAt<inet_diag_msg>(payload, 0);
  if (!message || message->idiag_state == 0 || message->idiag_state >= kStates.size()) return;
  TcpSocket socket;
  if (!AddressesOf(*message, payload.subspan(sizeof *message), socket)) return;
  if (sockets.size() >= SocketDiagnostics::kMostSockets) return;
  socket.state = kStates[message->idiag_state];
  socket.localPort = message->id.idiag_sport;
  socket.remotePort = message->id.idiag_dport;
  socket.node = message->idiag_inode;
  socket.user = message->idiag_uid;
  sockets.push_back(socket);
}

} // namespace

SocketDiagnostics::Progress SocketDiagnostics::TakeUp(std::span<const std::uint8_t> datagram,
                                                      std::uint32_t sequence,
                                                      std::vector<TcpSocket>& sockets) {
  while (const auto header = ReadAt<nlmsghdr>(datagram, 0)) {
    if (header->nlmsg_len < sizeof(nlmsghdr) || header->nlmsg_len > datagram.size()) return Progress::Failed;
    if (header->nlmsg_seq == sequence) {
      if (header->nlmsg_type == NLMSG_DONE) return Progress::Done;
      if (header->nlmsg_type == NLMSG_ERROR) return Progress::Failed;
      TakeUpSocket(datagram.subspan(sizeof(nlmsghdr), header->nlmsg_len - sizeof(nlmsghdr)), sockets);
    }
    datagram = After(datagram, header->nlmsg_len);
  }
  return Progress::More;
}

bool SocketDiagnostics::Read(std::vector<TcpSocket>& sockets) {
  // A socket that lost an answer is given up, and a fresh one asked once more.
  for (int attempt = 0; attempt < 2; ++attempt) {
    sockets.clear();
    if (Open() && Request() && Receive(sockets)) return true;
    netlink_ = Descriptor();
  }
  return false;
}

bool SocketDiagnostics::Open() {
  if (netlink_) return true;
  netlink_ = Descriptor(::socket(AF_NETLINK, SOCK_RAW | SOCK_CLOEXEC, NETLINK_SOCK_DIAG));
  if (!netlink_) return false;
  // The kernel answers at once; the limit is for a kernel that doesn't.
  const timeval limit{1, 0};
  ::setsockopt(netlink_.Number(), SOL_SOCKET, SO_RCVTIMEO, &limit, sizeof limit);
  buffer_.resize(kBufferBytes);
  return true;
}

bool SocketDiagnostics::Request() {
  struct {
    nlmsghdr header;
    inet_diag_req body;
  } request{};
  request.header.nlmsg_len = sizeof request;
  // The older of the two requests: without a family it gives both in a single walk over the kernel's tables.
  request.header.nlmsg_type = TCPDIAG_GETSOCK;
  request.header.nlmsg_flags = NLM_F_REQUEST | NLM_F_DUMP;
  request.header.nlmsg_seq = ++sequence_;
  request.body.idiag_family = AF_UNSPEC;
  request.body.idiag_states = kAllStates;
  return ::send(netlink_.Number(), &request, sizeof request, 0) == static_cast<ssize_t>(sizeof request);
}

bool SocketDiagnostics::Receive(std::vector<TcpSocket>& sockets) {
  for (;;) {
    const ssize_t count = ::recv(netlink_.Number(), buffer_.data(), buffer_.size(), 0);
    if (count < 0 && errno == EINTR) continue;
    if (count <= 0) return false;
    const auto progress = TakeUp({buffer_.data(), static_cast<std::size_t>(count)}, sequence_, sockets);
    if (progress != Progress::More) return progress == Progress::Done;
  }
}

} // namespace quendra::platform::linux_
