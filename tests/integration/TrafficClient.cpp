#include "integration/TrafficClient.h"

#include "integration/SocketHelpers.h"
#include "integration/TrafficServer.h"

#include <algorithm>
#include <array>
#include <ctime>
#include <netinet/ip_icmp.h>
#include <netinet/tcp.h>
#include <unistd.h>

namespace quendra::integration {

namespace {

/// Waits for a reply no longer than a real client would.
void LimitWaiting(int descriptor) {
  const timeval limit{30, 0};
  setsockopt(descriptor, SOL_SOCKET, SO_RCVTIMEO, &limit, sizeof limit);
}

/// Keeps to a rate over any length of time.
class Pace {
 public:
  explicit Pace(const Order& order) : pause_(order.pause) { clock_gettime(CLOCK_MONOTONIC, &next_); }
  void Wait() {
    if (pause_ == 0) return;
    next_.tv_nsec += pause_ * 1000L;
    next_.tv_sec += next_.tv_nsec / 1'000'000'000;
    next_.tv_nsec %= 1'000'000'000;
    clock_nanosleep(CLOCK_MONOTONIC, TIMER_ABSTIME, &next_, nullptr);
  }

 private:
  long pause_;
  timespec next_{};
};

void Exchange(int connection, const Order& order) {
  std::vector<char> bytes(static_cast<std::size_t>(std::max(order.request, order.reply)) +
                          sizeof(RequestHead));
  const RequestHead head{static_cast<std::uint32_t>(order.request) +
                             static_cast<std::uint32_t>(sizeof(RequestHead)),
                         static_cast<std::uint32_t>(order.reply)};
  std::memcpy(bytes.data(), &head, sizeof head);
  SendAll(connection, bytes.data(), head.request);
  if (!ReceiveAll(connection, bytes.data(), head.reply)) throw std::runtime_error("no reply");
}

/// After one word that means nothing, so that an answer is never empty.
void Report(int channel, std::vector<std::uint16_t> ports) {
  ports.insert(ports.begin(), 0);
  Check(send(channel, ports.data(), ports.size() * sizeof ports[0], 0), "the channel");
}

std::uint16_t LocalPort(int connection) {
  sockaddr_in local{};
  socklen_t size = sizeof local;
  getsockname(connection, reinterpret_cast<sockaddr*>(&local), &size);
  return ntohs(local.sin_port);
}

void Ping(int descriptor, const sockaddr_in& target) {
  std::array<unsigned char, 64> packet{};
  auto* header = reinterpret_cast<icmphdr*>(packet.data());
  header->type = ICMP_ECHO;
  // The sum over type 8 and zeros.
  header->checksum = static_cast<std::uint16_t>(~htons(0x0800));
  sendto(descriptor, packet.data(), packet.size(), 0, Generic(target), sizeof target);
}

} // namespace

void TrafficClient::Run(int channel) {
  Order order;
  while (recv(channel, &order, sizeof order, 0) == sizeof order) Report(channel, Obey(order));
}

std::vector<std::uint16_t> TrafficClient::Obey(const Order& order) {
  switch (order.kind) {
  case Order::Kind::Connect: return MakeConnections(order.count);
  case Order::Kind::Exchange: Exchanges(order); break;
  case Order::Kind::ShortConnections: ShortConnections(order); break;
  case Order::Kind::Datagrams: Datagrams(order); break;
  }
  return {};
}

void TrafficClient::Exchanges(const Order& order) const {
  Pace pace(order);
  for (const int connection : connections_)
    for (int i = 0; i < order.count; ++i) {
      Exchange(connection, order);
      pace.Wait();
    }
}

int TrafficClient::Connect() const {
  const int connection = Check(socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0), "socket");
  // Bound first, or the system would give one port to two connections to different servers; a search for a
  // port alone can't tell such processes apart.
  const sockaddr_in anyPort = InetAddress("0.0.0.0", 0);
  Check(bind(connection, Generic(anyPort), sizeof anyPort), "bind");
  const sockaddr_in server = InetAddress(address_, port_);
  Check(connect(connection, Generic(server), sizeof server), "connect");
  const int yes = 1;
  setsockopt(connection, IPPROTO_TCP, TCP_NODELAY, &yes, sizeof yes);
  LimitWaiting(connection);
  return connection;
}

std::vector<std::uint16_t> TrafficClient::MakeConnections(int count) {
  std::vector<std::uint16_t> ports;
  for (int i = 0; i < count; ++i) {
    connections_.push_back(Connect());
    ports.push_back(LocalPort(connections_.back()));
  }
  return ports;
}

void TrafficClient::ShortConnections(const Order& order) const {
  for (int i = 0; i < order.count; ++i) {
    const int connection = Connect();
    Exchange(connection, order);
    usleep(10000);
    close(connection);
  }
}

/// Datagrams, and an echo request with every fifth.
void TrafficClient::Datagrams(const Order& order) const {
  const int datagrams = Check(socket(AF_INET, SOCK_DGRAM | SOCK_CLOEXEC, 0), "socket");
  const int echoes = Check(socket(AF_INET, SOCK_RAW | SOCK_CLOEXEC, IPPROTO_ICMP), "raw socket");
  const sockaddr_in server = InetAddress(address_, port_);
  const std::vector<char> bytes(static_cast<std::size_t>(order.request));
  Pace pace(order);
  for (int i = 0; i < order.count; ++i) {
    sendto(datagrams, bytes.data(), bytes.size(), 0, Generic(server), sizeof server);
    if (i % 5 == 0) Ping(echoes, server);
    pace.Wait();
  }
  close(datagrams);
  close(echoes);
}

} // namespace quendra::integration
