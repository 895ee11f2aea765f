#include "platform/linux/capture/LinuxCaptureAdapters.h"

#include "platform/linux/capture/InterfaceQuestions.h"
#include "platform/linux/capture/LinkWatch.h"
#include "platform/linux/capture/PcapSession.h"
#include "platform/linux/net/DefaultRoute.h"

#include <ifaddrs.h>
#include <net/if.h>
#include <net/if_arp.h>
#include <netinet/in.h>
#include <sys/socket.h>

namespace quendra::platform::linux_ {

namespace {

constexpr unsigned kNone = 0xFFFE; // ARPHRD_NONE, for which old headers lack a name
constexpr unsigned kRawIp = 519;   // ARPHRD_RAWIP, likewise

/// Empty for a link whose packets cannot be shown as Ethernet frames.
std::string KindOf(const InterfaceQuestions& questions, const pcap_if_t& device) {
  if (device.flags & PCAP_IF_LOOPBACK) return "Loopback";
  const auto type = questions.HardwareType(device.name);
  if (!type) return {};
  switch (*type) {
  case ARPHRD_PPP:
  case ARPHRD_SLIP:
  case ARPHRD_CSLIP: return "Dial-up";
  case ARPHRD_TUNNEL:
  case ARPHRD_SIT:
  case ARPHRD_IPGRE:
  case kNone:
  case kRawIp: return "Tunnel";
  case ARPHRD_ETHER: break;
  default: return {};
  }
  if (device.flags & PCAP_IF_WIRELESS) return "Wi-Fi";
  const std::string driver = questions.DriverName(device.name);
  if (driver == "bridge") return "Bridge";
  if (driver == "tun") return "Virtual adapter";
  if (driver == "veth") return "Virtual Ethernet";
  return "Ethernet";
}

LiveAdapter AdapterNamed(const std::string& name, const std::string& kind) {
  LiveAdapter adapter;
  adapter.name = name;
  adapter.description = kind + " (" + name + ")";
  return adapter;
}

/// Empty without a default route.
std::string DefaultRouteInterface() {
  const auto routes = ReadDefaultRoutes(ProcFolder("/proc"));
  return routes.empty() ? std::string() : routes.front().interface;
}

std::vector<LiveAdapter> AdaptersOf(const pcap_if_t* devices) {
  const InterfaceQuestions questions;
  const std::string preferred = DefaultRouteInterface();
  std::vector<LiveAdapter> adapters;
  for (const pcap_if_t* device = devices; device != nullptr; device = device->next) {
    // What has no interface index (the "any" device, USB and other monitors) is no adapter to a subscriber.
    const unsigned number = ::if_nametoindex(device->name);
    if (number == 0 || !(device->flags & PCAP_IF_UP)) continue;
    const std::string kind = KindOf(questions, *device);
    if (kind.empty()) continue;
    LiveAdapter adapter = AdapterNamed(device->name, kind);
    adapter.number = number;
    adapter.hasDefaultRoute = adapter.name == preferred;
    adapter.isLoopback = (device->flags & PCAP_IF_LOOPBACK) != 0;
    adapters.push_back(std::move(adapter));
  }
  return adapters;
}

} // namespace

bool LinuxCaptureAdapters::MayCapture() const {
  return static_cast<bool>(Descriptor(::socket(AF_PACKET, SOCK_RAW | SOCK_CLOEXEC, 0)));
}

std::vector<LiveAdapter> LinuxCaptureAdapters::List() const {
  char error[PCAP_ERRBUF_SIZE];
  pcap_if_t* devices = nullptr;
  if (library_.findalldevs(&devices, error) != 0) devices = nullptr;
  const std::unique_ptr<pcap_if_t, decltype(library_.freealldevs)> owner(devices, library_.freealldevs);
  auto adapters = AdaptersOf(devices);
  if (adapters.empty()) adapters.push_back(AdapterNamed("lo", "Loopback"));
  return adapters;
}

unsigned LinuxCaptureAdapters::NumberIfUp(const std::string& name) const {
  return InterfaceQuestions().IsUp(name) ? ::if_nametoindex(name.c_str()) : 0;
}

Ipv4Address LinuxCaptureAdapters::AddressOf(const std::string& name) const {
  ifaddrs* addresses = nullptr;
  if (::getifaddrs(&addresses) != 0) return {};
  const std::unique_ptr<ifaddrs, decltype(&::freeifaddrs)> owner(addresses, &::freeifaddrs);
  for (const ifaddrs* entry = addresses; entry != nullptr; entry = entry->ifa_next) {
    if (entry->ifa_addr == nullptr || entry->ifa_addr->sa_family != AF_INET || name != entry->ifa_name)
      continue;
    return Ipv4Address::FromMemory(reinterpret_cast<const sockaddr_in*>(entry->ifa_addr)->sin_addr.s_addr);
  }
  return {};
}

std::unique_ptr<FrameSource> LinuxCaptureAdapters::Open(const std::string& name, FrameShaper& shaper) {
  return PcapSession::Open(library_, descriptors_, name, shaper);
}

std::unique_ptr<EventLoop::Subscription> LinuxCaptureAdapters::Watch(std::function<void()> changed) {
  return std::make_unique<LinkWatch>(descriptors_, std::move(changed));
}

} // namespace quendra::platform::linux_
