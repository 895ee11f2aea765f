#include "integration/RouterChain.h"

namespace quendra::integration {

RouterChain::RouterChain(int routers) : RouterChain(routers, {}) {}

RouterChain::RouterChain(int routers, SlowLink::Rule firstLink) {
  MakeHosts(routers);
  if (firstLink) slowLink_.emplace(*hosts_[0], *hosts_[1], std::move(firstLink));
  for (int link = slowLink_ ? 1 : 0; link <= routers; ++link) MakeLink(link);
  for (int link = 0; link <= routers; ++link) SetAddresses(link);
  for (int host = 0; host < routers + 2; ++host) SetRoutes(host);
  Self().Enter();
}

void RouterChain::MakeHosts(int routers) {
  for (int host = 0; host < routers + 2; ++host) {
    hosts_.push_back(std::make_unique<NetworkNamespace>());
    RunCommand("ip link set lo up");
    NetworkNamespace::Set("net/ipv4/ip_forward", "1");
    // Else a router answers a few echoes a second and no more.
    NetworkNamespace::Set("net/ipv4/icmp_ratelimit", "0");
    hosts_.back()->Leave();
  }
}

void RouterChain::MakeLink(int link) {
  const NetworkNamespace& far = Router(link + 1);
  Router(link).Enter();
  RunCommand("ip link add qfwd type veth peer name qback netns /proc/" + std::to_string(getpid()) + "/fd/" +
             std::to_string(far.Descriptor()));
  Router(link).Leave();
}

void RouterChain::SetAddresses(int link) {
  Router(link).Enter();
  RunCommand("ip addr add " + NearAddress(link) + "/30 dev qfwd && ip link set qfwd up");
  Router(link + 1).Enter();
  RunCommand("ip addr add " + FarAddress(link) + "/30 dev qback && ip link set qback up");
  Router(link + 1).Leave();
}

void RouterChain::SetRoutes(int host) {
  Router(host).Enter();
  const bool isLast = host + 1 == static_cast<int>(hosts_.size());
  if (!isLast) RunCommand("ip route add 10.20.0.0/16 via " + FarAddress(host));
  if (host > 1) RunCommand("ip route add 10.20.0.0/30 via " + NearAddress(host - 1));
  Router(host).Leave();
}

void RouterChain::Silence(int router) {
  Router(router).Enter();
  // One message of an ended TTL in ten minutes is none here.
  NetworkNamespace::Set("net/ipv4/icmp_ratelimit", "600000");
  Self().Enter();
}

} // namespace quendra::integration
