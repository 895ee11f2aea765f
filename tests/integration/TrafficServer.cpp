#include "integration/TrafficServer.h"

#include "integration/SocketHelpers.h"

#include <algorithm>
#include <netinet/tcp.h>
#include <unistd.h>

namespace quendra::integration {

namespace {

constexpr std::uint32_t kMostBytes = 4 << 20;

int Bound(int type, const sockaddr_in& address) {
  const int descriptor = Check(socket(AF_INET, type | SOCK_CLOEXEC, 0), "socket");
  const int yes = 1;
  setsockopt(descriptor, SOL_SOCKET, SO_REUSEADDR, &yes, sizeof yes);
  Check(bind(descriptor, Generic(address), sizeof address), "bind");
  return descriptor;
}

void GiveBack(int datagrams) {
  char bytes[2048];
  sockaddr_in sender{};
  socklen_t size = sizeof sender;
  const ssize_t got =
      recvfrom(datagrams, bytes, sizeof bytes, 0, reinterpret_cast<sockaddr*>(&sender), &size);
  if (got > 0) sendto(datagrams, bytes, static_cast<std::size_t>(got), 0, Generic(sender), sizeof sender);
}

int Accept(int listener) {
  const int connection = Check(accept4(listener, nullptr, nullptr, SOCK_CLOEXEC), "accept");
  const int yes = 1;
  setsockopt(connection, IPPROTO_TCP, TCP_NODELAY, &yes, sizeof yes);
  return connection;
}

} // namespace

TrafficServer::TrafficServer(const std::string& address, std::uint16_t port)
    : listener_(Bound(SOCK_STREAM, InetAddress(address, port))),
      datagrams_(Bound(SOCK_DGRAM, InetAddress(address, port))), port_(port) {
  Check(listen(listener_, 512), "listen");
}

void TrafficServer::Run(int channel) {
  polled_ = {{channel, POLLIN, 0}, {listener_, POLLIN, 0}, {datagrams_, POLLIN, 0}};
  const std::size_t own = polled_.size();
  Check(send(channel, &port_, sizeof port_, 0), "the channel");
  while (poll(polled_.data(), polled_.size(), -1) >= 0) {
    if (polled_[0].revents != 0) return;
    for (std::size_t i = own; i < polled_.size(); ++i) {
      if (polled_[i].revents == 0 || ServeRequest(polled_[i].fd)) continue;
      close(polled_[i].fd);
      polled_[i].fd = -1;
    }
    if (polled_[2].revents != 0) GiveBack(datagrams_);
    if (polled_[1].revents != 0) polled_.push_back({Accept(listener_), POLLIN, 0});
    std::erase_if(polled_, [](const pollfd& entry) { return entry.fd < 0; });
  }
}

/// False when the client has hung up.
bool TrafficServer::ServeRequest(int connection) {
  static std::vector<char> bytes(kMostBytes);
  RequestHead head;
  if (!ReceiveAll(connection, reinterpret_cast<char*>(&head), sizeof head)) return false;
  if (head.request < sizeof head || head.request > kMostBytes || head.reply > kMostBytes) return false;
  if (!ReceiveAll(connection, bytes.data(), head.request - sizeof head)) return false;
  SendAll(connection, bytes.data(), head.reply);
  return true;
}

} // namespace quendra::integration
