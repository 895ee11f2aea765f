#include "platform/linux/capture/LinuxCaptureAdapters.h"

#include "platform/linux/net/NetworkInterfaces.h"

#include <algorithm>
#include <arpa/inet.h>
#include <cstring>
#include <ifaddrs.h>
#include <linux/ethtool.h>
#include <linux/if_packet.h>
#include <linux/sockios.h>
#include <memory>
#include <net/if.h>
#include <net/if_arp.h>
#include <netinet/in.h>
#include <optional>
#include <sys/ioctl.h>
#include <sys/socket.h>
#include <unistd.h>

namespace quendra::platform::linux_ {

namespace {

constexpr unsigned kNone = 0xFFFE; // ARPHRD_NONE, for which old headers lack a name
constexpr unsigned kRawIp = 519;   // ARPHRD_RAWIP, likewise

class Socket {
 public:
  Socket(int domain, int type) : descriptor_(socket(domain, type | SOCK_CLOEXEC, 0)) {}
  ~Socket() {
    if (descriptor_ >= 0) close(descriptor_);
  }
  Socket(const Socket&) = delete;
  Socket& operator=(const Socket&) = delete;
  int Descriptor() const { return descriptor_; }
  bool IsOpen() const { return descriptor_ >= 0; }

 private:
  int descriptor_;
};

ifreq RequestFor(const std::string& name) {
  ifreq request{};
  name.copy(request.ifr_name, IFNAMSIZ - 1);
  return request;
}

/// Asked of the interface itself and not of sysfs, which may show another network namespace.
std::optional<unsigned> HardwareType(const Socket& socket, const std::string& name) {
  ifreq request = RequestFor(name);
  if (ioctl(socket.Descriptor(), SIOCGIFHWADDR, &request) != 0) return std::nullopt;
  return request.ifr_hwaddr.sa_family;
}

std::string DriverName(const Socket& socket, const std::string& name) {
  ethtool_drvinfo info{};
  info.cmd = ETHTOOL_GDRVINFO;
  ifreq request = RequestFor(name);
  request.ifr_data = reinterpret_cast<char*>(&info);
  if (ioctl(socket.Descriptor(), SIOCETHTOOL, &request) != 0) return {};
  return {info.driver, strnlen(info.driver, sizeof info.driver)};
}

/// Empty for a link whose packets cannot be shown as Ethernet frames.
std::string KindOf(const Socket& socket, const pcap_if_t& device) {
  if (device.flags & PCAP_IF_LOOPBACK) return "Loopback";
  const auto type = HardwareType(socket, device.name);
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
  const std::string driver = DriverName(socket, device.name);
  if (driver == "bridge") return "Bridge";
  if (driver == "tun") return "Virtual adapter";
  if (driver == "veth") return "Virtual Ethernet";
  return "Ethernet";
}

/// Empty without a default route.
std::string DefaultRouteInterface() {
  const auto routes = ParseDefaultRoutes(ProcFolder("/proc").File("thread-self/net/route").value_or(""));
  return routes.empty() ? std::string() : routes.front().interface;
}

CaptureAdapter LoopbackAdapter() { return {"lo", "Loopback (lo)"}; }

struct RankedAdapter {
  CaptureAdapter adapter;
  int rank; // 0 default route, 1 others, 2 loopback
  unsigned index;
};

std::vector<RankedAdapter> RankedAdapters(const pcap_if_t* devices) {
  const Socket socket(AF_INET, SOCK_DGRAM);
  const std::string preferred = DefaultRouteInterface();
  std::vector<RankedAdapter> ranked;
  for (const pcap_if_t* device = devices; device != nullptr; device = device->next) {
    // What has no interface index (the "any" device, USB and other monitors) is no adapter to a subscriber.
    const unsigned index = if_nametoindex(device->name);
    if (index == 0 || !(device->flags & PCAP_IF_UP)) continue;
    const std::string kind = KindOf(socket, *device);
    if (kind.empty()) continue;
    const std::string name = device->name;
    const int rank = (device->flags & PCAP_IF_LOOPBACK) ? 2 : name == preferred ? 0 : 1;
    ranked.push_back({{name, kind + " (" + name + ")"}, rank, index});
  }
  return ranked;
}

} // namespace

std::vector<CaptureAdapter> ListCaptureAdapters(const PcapLibrary& library) {
  char error[PCAP_ERRBUF_SIZE];
  pcap_if_t* devices = nullptr;
  if (library.findalldevs(&devices, error) != 0) devices = nullptr;
  const std::unique_ptr<pcap_if_t, decltype(library.freealldevs)> owner(devices, library.freealldevs);

  auto ranked = RankedAdapters(devices);
  std::sort(ranked.begin(), ranked.end(), [](const RankedAdapter& a, const RankedAdapter& b) {
    return a.rank != b.rank ? a.rank < b.rank : a.index < b.index;
  });
  std::vector<CaptureAdapter> adapters;
  for (auto& entry : ranked) adapters.push_back(std::move(entry.adapter));
  if (adapters.empty()) adapters.push_back(LoopbackAdapter());
  return adapters;
}

Ipv4Address AddressOfAdapter(const std::string& name) {
  ifaddrs* addresses = nullptr;
  if (getifaddrs(&addresses) != 0) return {};
  const std::unique_ptr<ifaddrs, decltype(&freeifaddrs)> owner(addresses, &freeifaddrs);
  for (const ifaddrs* entry = addresses; entry != nullptr; entry = entry->ifa_next) {
    if (entry->ifa_addr == nullptr || entry->ifa_addr->sa_family != AF_INET || name != entry->ifa_name)
      continue;
    return Ipv4Address::FromMemory(reinterpret_cast<const sockaddr_in*>(entry->ifa_addr)->sin_addr.s_addr);
  }
  return {};
}

unsigned NumberOfAdapterThatIsUp(const std::string& name) {
  const Socket socket(AF_INET, SOCK_DGRAM);
  ifreq request = RequestFor(name);
  if (ioctl(socket.Descriptor(), SIOCGIFFLAGS, &request) != 0 || (request.ifr_flags & IFF_UP) == 0) return 0;
  return if_nametoindex(name.c_str());
}

bool MayCapture() { return Socket(AF_PACKET, SOCK_RAW).IsOpen(); }

} // namespace quendra::platform::linux_
