#include "integration/NetworkNamespace.h"
#include "platform/linux/LinuxFixture.h"
#include "platform/linux/net/LinuxHostNames.h"
#include "platform/linux/net/LinuxIpHelper.h"
#include "platform/linux/net/NetworkInterfaces.h"
#include "platform/net/Sockets.h"

#include <arpa/inet.h>
#include <gtest/gtest.h>
#include <sys/prctl.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cstring>
#include <optional>

namespace quendra::platform::linux_ {

namespace {

using integration::NetworkNamespace;
using integration::RunCommand;

using Entry = TcpTableEntry;

/// The table in a namespace of the test's own where that can be made, else on this machine's loopback.
struct LinuxIpHelperTest : testing::Test {
  std::optional<NetworkNamespace> network;
  ProcFolder folder;
  TestClock clock;
  LinuxIpHelper helper{folder, {::geteuid() == 0, ::geteuid()}, clock.AsClock()};

  LinuxIpHelperTest() {
    if (!NetworkNamespace::Possible()) return;
    network.emplace();
    RunCommand("ip link set lo up");
  }

  std::vector<Entry> Table() {
    IpHelper::TcpTable table;
    EXPECT_EQ(helper.AllocateAndGetTcpExTableFromStack(table), 0u);
    const std::size_t count = Little32(*table, 0);
    EXPECT_EQ(table->size(), 4 + 24 * count);
    std::vector<Entry> entries;
    for (std::size_t i = 0; i < count; ++i) entries.push_back(Entry::ReadFrom(*table, 4 + 24 * i));
    return entries;
  }
  /// The entry with this state and local port; all zero when there is none.
  Entry Find(std::uint32_t state, std::uint16_t localPort) {
    for (const Entry& entry : Table())
      if (entry.state == state && entry.localPort == htons(localPort)) return entry;
    return {};
  }
};

sockaddr_in Loopback(std::uint16_t port) {
  sockaddr_in address{};
  address.sin_family = AF_INET;
  address.sin_port = htons(port);
  address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
  return address;
}

/// A listening socket on the port, or on any for 0; its descriptor.
int Listen(std::uint16_t port) {
  const int socket = ::socket(AF_INET, SOCK_STREAM, 0);
  const int on = 1;
  ::setsockopt(socket, SOL_SOCKET, SO_REUSEADDR, &on, sizeof on);
  const sockaddr_in address = Loopback(port);
  if (::bind(socket, reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0) return -1;
  ::listen(socket, 1024);
  return socket;
}

int ListenOnEveryFamily(bool v6Only) {
  const int socket = ::socket(AF_INET6, SOCK_STREAM, 0);
  const int only = v6Only ? 1 : 0;
  ::setsockopt(socket, IPPROTO_IPV6, IPV6_V6ONLY, &only, sizeof only);
  sockaddr_in6 address{};
  address.sin6_family = AF_INET6;
  if (::bind(socket, reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0) return -1;
  ::listen(socket, 1024);
  return socket;
}

int Connect(std::uint16_t port) {
  const int socket = ::socket(AF_INET, SOCK_STREAM, 0);
  const sockaddr_in address = Loopback(port);
  return ::connect(socket, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0 ? socket : -1;
}

std::uint16_t LocalPort(int socket) {
  sockaddr_storage address{};
  socklen_t length = sizeof address;
  ::getsockname(socket, reinterpret_cast<sockaddr*>(&address), &length);
  return ntohs(reinterpret_cast<const sockaddr_in*>(&address)->sin_port);
}

std::string PortText(int socket) { return std::to_string(LocalPort(socket)); }
std::uint16_t PortIn(const Child& child) { return static_cast<std::uint16_t>(std::stoul(child.Answer())); }

TEST_F(LinuxIpHelperTest, A_listener_of_another_process_is_listed_with_its_owner) {
  const Child child([] { return PortText(Listen(0)); });
  const Entry entry = Find(2, PortIn(child));
  EXPECT_EQ(entry.owner, static_cast<std::uint32_t>(child.Id()));
  EXPECT_EQ(entry.localAddress, htonl(INADDR_LOOPBACK));
  EXPECT_EQ(entry.remoteAddress, 0u);
  EXPECT_EQ(entry.remotePort, 0u);
}

TEST_F(LinuxIpHelperTest, Both_ends_of_a_connection_are_listed_with_their_owners) {
  const int listener = Listen(0);
  const std::uint16_t port = LocalPort(listener);
  const Child client([port] { return PortText(Connect(port)); });
  const int accepted = ::accept(listener, nullptr, nullptr);
  const Entry near = Find(5, port), far = Find(5, PortIn(client));
  EXPECT_EQ(near.owner, static_cast<std::uint32_t>(::getpid()));
  EXPECT_EQ(near.remotePort, htons(PortIn(client)));
  EXPECT_EQ(far.owner, static_cast<std::uint32_t>(client.Id()));
  EXPECT_EQ(far.remotePort, htons(port));
  ::close(accepted);
  ::close(listener);
}

TEST_F(LinuxIpHelperTest, A_connection_that_nobody_has_accepted_yet_has_no_owner) {
  const int listener = Listen(0);
  const int client = Connect(LocalPort(listener));
  bool seen = false;
  for (const Entry& entry : Table())
    if (entry.state == 5 && entry.localPort == htons(LocalPort(listener))) {
      seen = true;
      EXPECT_EQ(entry.owner, 0u);
    }
  EXPECT_TRUE(seen);
  ::close(client);
  ::close(listener);
}

TEST_F(LinuxIpHelperTest, A_port_over_32767_is_listed_in_network_order) {
  const int listener = Listen(54321);
  if (listener < 0) GTEST_SKIP() << "port 54321 is taken and no network namespace can be made";
  EXPECT_EQ(Find(2, 54321).owner, static_cast<std::uint32_t>(::getpid()));
  ::close(listener);
}

TEST_F(LinuxIpHelperTest, A_listener_of_both_families_and_its_IPv4_connections_are_listed) {
  const int listener = ListenOnEveryFamily(false);
  if (listener < 0) GTEST_SKIP() << "this machine has no IPv6 sockets";
  const std::uint16_t port = LocalPort(listener);
  const int client = Connect(port);
  const int accepted = ::accept(listener, nullptr, nullptr);
  const auto own = static_cast<std::uint32_t>(::getpid());
  const Entry listening = Find(2, port), connected = Find(5, port);
  EXPECT_EQ(listening.owner, own);
  EXPECT_EQ(listening.localAddress, 0u);
  EXPECT_EQ(connected.owner, own);
  EXPECT_EQ(connected.localAddress, htonl(INADDR_LOOPBACK));
  EXPECT_EQ(connected.remoteAddress, htonl(INADDR_LOOPBACK));
  EXPECT_EQ(connected.remotePort, htons(LocalPort(client)));
  for (const int socket : {accepted, client, listener}) ::close(socket);
}

TEST_F(LinuxIpHelperTest, A_listener_of_IPv6_alone_is_not_listed) {
  const int listener = ListenOnEveryFamily(true);
  if (listener < 0) GTEST_SKIP() << "this machine has no IPv6 sockets";
  EXPECT_EQ(Find(2, LocalPort(listener)).state, 0u);
  ::close(listener);
}

TEST_F(LinuxIpHelperTest, A_closed_connection_that_waits_has_no_owner) {
  const int listener = Listen(0);
  const std::uint16_t port = LocalPort(listener);
  const int client = Connect(port);
  const int accepted = ::accept(listener, nullptr, nullptr);
  ::close(accepted); // the side that closes first waits
  char byte;
  EXPECT_EQ(::read(client, &byte, 1), 0);
  ::close(client);
  Entry entry{};
  for (int i = 0; i < 1000 && entry.state == 0; ++i) entry = Find(11, port);
  EXPECT_EQ(entry.state, 11u);
  EXPECT_EQ(entry.owner, 0u);
  ::close(listener);
}

TEST_F(LinuxIpHelperTest, A_connection_taken_over_by_a_child_gets_the_child_as_owner) {
  const int listener = Listen(0);
  const std::uint16_t port = LocalPort(listener);
  const int client = Connect(port);
  const int accepted = ::accept(listener, nullptr, nullptr);
  EXPECT_EQ(Find(5, port).owner, static_cast<std::uint32_t>(::getpid()));
  const Child child([] { return std::string("there"); });
  EXPECT_EQ(Find(5, port).owner, static_cast<std::uint32_t>(::getpid()));
  ::close(accepted);
  clock.now += 2000;
  EXPECT_EQ(Find(5, port).owner, static_cast<std::uint32_t>(child.Id()));
  ::close(client);
  ::close(listener);
}

TEST_F(LinuxIpHelperTest, Five_hundred_new_connections_all_have_owners_at_once) {
  const int listener = Listen(0);
  const std::uint16_t port = LocalPort(listener);
  Table();
  const Child client([port] {
    for (int i = 0; i < 500; ++i)
      if (Connect(port) < 0) return std::string("failed at ") + std::to_string(i);
    return std::string("done");
  });
  ASSERT_EQ(client.Answer(), "done");
  int owned = 0;
  for (const Entry& entry : Table())
    owned += entry.remotePort == htons(port) && entry.owner == static_cast<std::uint32_t>(client.Id());
  EXPECT_EQ(owned, 500);
  ::close(listener);
}

TEST_F(LinuxIpHelperTest, A_connection_of_another_cannot_be_ended) {
  const std::uint8_t record[20] = {12};
  EXPECT_EQ(helper.SetTcpEntry(record), IpHelper::kErrorNotSupported);
}

TEST_F(LinuxIpHelperTest, A_user_without_rights_sees_the_table_and_owners_of_own_sockets_alone) {
  if (::geteuid() != 0) GTEST_SKIP() << "needs the administrator to become another user";
  const int listener = Listen(0);
  const std::uint16_t port = LocalPort(listener);
  const Child user([port] {
    if (::setgid(65534) != 0 || ::setuid(65534) != 0) return std::string("no other user");
    // A process that was the administrator's is closed to all others, and so to itself, until it says
    // otherwise.
    ::prctl(PR_SET_DUMPABLE, 1);
    const int own = Listen(0);
    const ProcFolder proc;
    LinuxIpHelper limited(proc, {false, 65534});
    IpHelper::TcpTable table;
    if (limited.AllocateAndGetTcpExTableFromStack(table) != 0) return std::string("no table");
    std::string text;
    for (std::size_t at = 4; at < table->size(); at += 24) {
      Entry entry;
      std::memcpy(&entry, table->data() + at, 24);
      if (entry.localPort == htons(port)) text += " theirs " + std::to_string(entry.owner);
      if (entry.localPort == htons(LocalPort(own)))
        text += entry.owner == static_cast<std::uint32_t>(::getpid()) ? " own is own" : " own is not";
    }
    return text;
  });
  EXPECT_NE(user.Answer().find(" theirs 0"), std::string::npos) << user.Answer();
  EXPECT_NE(user.Answer().find(" own is own"), std::string::npos) << user.Answer();
  ::close(listener);
}

TEST(LinuxRoutes, Default_routes_are_read_with_gateway_and_metric_the_preferred_first) {
  const auto routes =
      ParseDefaultRoutes("Iface\tDestination\tGateway \tFlags\tRefCnt\tUse\tMetric\tMask\t\tMTU\n"
                         "wlan0\t00000000\t0101A8C0\t0003\t0\t0\t600\t00000000\t0\t0\t0\n"
                         "eth0\t00000000\t0100000A\t0003\t0\t0\t100\t00000000\t0\t0\t0   \n"
                         "eth0\t0000000A\t00000000\t0001\t0\t0\t100\t00FFFFFF\t0\t0\t0\n"
                         "ppp0\t00000000\t00000000\t0001\t0\t0\t700\t00000000\t0\t0\t0\n");
  ASSERT_EQ(routes.size(), 3u);
  EXPECT_EQ(routes[0].interface, "eth0");
  EXPECT_EQ(routes[0].gateway.AsAscii(), "10.0.0.1");
  EXPECT_EQ(routes[1].interface, "wlan0");
  EXPECT_EQ(routes[1].gateway.AsAscii(), "192.168.1.1");
  EXPECT_EQ(routes[2].interface, "ppp0");
  EXPECT_EQ(routes[2].gateway, Ipv4Address());
}

TEST(LinuxRoutes, Routes_that_are_down_or_reject_and_lines_that_are_no_routes_are_left_out) {
  EXPECT_TRUE(ParseDefaultRoutes("eth0\t00000000\t0100000A\t0002\t0\t0\t100\t00000000\n"
                                 "eth0\t00000000\t0100000A\t0201\t0\t0\t100\t00000000\n"
                                 "eth0\t00000000\t0100000A\t0001\t0\t0\t100\n"
                                 "eth0\tx\t0100000A\t0001\t0\t0\t100\t00000000\n"
                                 "eth0\t00000000\t0100000A\t0001\t0\t0\t-1\t00000000\n"
                                 "\n\t\t\t\t\t\t\t\t\n")
                  .empty());
}

TEST(LinuxHostAddresses, Loopback_comes_first_and_the_main_address_of_the_default_routes_interface_last) {
  const auto at = Ipv4Address::FromHost;
  NetworkInterface lo{"lo", true, false, {at(1)}, {}, 0};
  NetworkInterface wired{"eth0", false, true, {at(20), at(21)}, {at(2)}, 100};
  NetworkInterface wireless{"wlan0", false, true, {at(30)}, {at(3)}, 600};
  NetworkInterface bridge{"br0", false, false, {at(40)}, {}, 0};
  EXPECT_EQ(HostAddressOrder({wired, wireless, lo, bridge}),
            (std::vector<Ipv4Address>{at(1), at(40), at(30), at(21), at(20)}));
}

struct LinuxNetwork : testing::Test {
  std::optional<NetworkNamespace> network;
  ProcFolder folder;
  LinuxHostNames names{folder};
  LinuxIpHelper helper{folder, {true, 0}};

  void SetUp() override {
    if (!NetworkNamespace::Possible()) GTEST_SKIP() << NetworkNamespace::kSkipReason;
    network.emplace();
  }
  void Lay() {
    RunCommand("ip link set lo up");
    for (const std::string n : {"0", "1", "2"})
      RunCommand("ip link add qd" + n + " type veth peer name qp" + n);
    RunCommand("ip addr add 10.7.0.2/24 dev qd0 && ip addr add 10.8.0.2/24 dev qd1 && "
               "ip addr add 10.8.0.3/24 dev qd1 label qd1:1 && ip addr add 10.9.0.2/24 dev qd2 && "
               "ip link set qd0 up && ip link set qd1 up && ip link set qp0 up && ip link set qp1 up && "
               "ip route add default via 10.8.0.1 dev qd1 metric 100 && "
               "ip route add default via 10.7.0.1 dev qd0 metric 200");
  }
  std::vector<std::string> OwnAddresses() {
    std::vector<std::string> texts;
    for (const auto address : names.gethostbyname(*names.gethostname()).value_or(std::vector<Ipv4Address>{}))
      texts.push_back(address.AsAscii());
    return texts;
  }
};

TEST_F(LinuxNetwork,
       The_own_name_gives_loopback_first_the_default_routes_address_last_and_no_interface_that_is_down) {
  Lay();
  EXPECT_EQ(OwnAddresses(), (std::vector<std::string>{"127.0.0.1", "10.7.0.2", "10.8.0.3", "10.8.0.2"}));
}

TEST_F(LinuxNetwork, The_own_name_without_any_interface_that_is_up_gives_nothing) {
  EXPECT_FALSE(names.gethostbyname(*names.gethostname()));
  EXPECT_EQ(names.LastError(), kHostNotFound);
}

TEST_F(LinuxNetwork, The_own_name_is_compared_without_regard_to_case_and_an_empty_name_is_the_own) {
  Lay();
  std::string upper = *names.gethostname();
  for (char& letter : upper) letter = static_cast<char>(std::toupper(static_cast<unsigned char>(letter)));
  const auto own = names.gethostbyname(*names.gethostname());
  ASSERT_TRUE(own);
  EXPECT_EQ(own->size(), 4u);
  EXPECT_EQ(names.gethostbyname(upper), own);
  EXPECT_EQ(names.gethostbyname(""), own);
}

TEST_F(LinuxNetwork, Another_name_is_looked_up) {
  RunCommand("ip link set lo up");
  EXPECT_EQ(names.gethostbyname("127.0.0.9"), (std::vector<Ipv4Address>{Ipv4Address::FromHost(0x7F000009)}));
  EXPECT_FALSE(names.gethostbyname("no.such.host.invalid"));
}

TEST_F(LinuxNetwork, Adapters_are_listed_with_addresses_and_gateways_the_preferred_way_out_first) {
  Lay();
  std::vector<AdapterRecord> adapters;
  std::uint32_t size = 10 * IpHelper::kAdapterBytes;
  ASSERT_EQ(helper.GetAdaptersInfo(adapters, size), 0u);
  ASSERT_EQ(adapters.size(), 2u);
  EXPECT_EQ(adapters[0].name, "qd1");
  EXPECT_EQ(adapters[0].addresses, (std::vector<std::string>{"10.8.0.2", "10.8.0.3"}));
  EXPECT_EQ(adapters[0].gateways, std::vector<std::string>{"10.8.0.1"});
  EXPECT_EQ(adapters[1].gateways, std::vector<std::string>{"10.7.0.1"});
}

TEST_F(LinuxNetwork, A_list_of_adapters_in_too_little_room_fails_with_the_room_needed) {
  Lay();
  std::vector<AdapterRecord> adapters;
  std::uint32_t size = 2 * IpHelper::kAdapterBytes - 1;
  EXPECT_EQ(helper.GetAdaptersInfo(adapters, size), IpHelper::kErrorBufferOverflow);
  EXPECT_EQ(size, 2u * IpHelper::kAdapterBytes);
  EXPECT_TRUE(adapters.empty());
  EXPECT_EQ(helper.GetAdaptersInfo(adapters, size), 0u);
  EXPECT_EQ(adapters.size(), 2u);
}

TEST_F(LinuxNetwork, Without_adapters_the_list_is_empty) {
  std::vector<AdapterRecord> adapters(3);
  std::uint32_t size = 0;
  EXPECT_EQ(helper.GetAdaptersInfo(adapters, size), 0u);
  EXPECT_TRUE(adapters.empty());
}

} // namespace

} // namespace quendra::platform::linux_
