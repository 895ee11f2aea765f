#include "diagnostics/interfaces/CIpHelper.h"
#include "forms/headless/HeadlessDesktop.h"
#include "integration/NetworkNamespace.h"
#include "platform/linux/net/LinuxIpHelper.h"
#include "platform/net/InterfaceRow.h"
#include "runtime/Text.h"

#include <gtest/gtest.h>
#include <linux/if_packet.h>
#include <net/if.h>
#include <netinet/in.h>
#include <sys/socket.h>

#include <array>
#include <cstdio>
#include <map>
#include <optional>
#include <sstream>

namespace quendra::integration {
namespace {

using diagnostics::CInterface;
using Row = platform::InterfaceRow;
using Fields = std::map<std::string, std::string>;

/// Links of the test's own namespace, and what the system's own tool prints of them.
class InterfaceTable : public testing::Test {
 protected:
  void SetUp() override {
    if (!NetworkNamespace::Possible()) GTEST_SKIP() << NetworkNamespace::kSkipReason;
    network_.emplace();
    // The system would send frames of its own while the figures are compared.
    NetworkNamespace::Set("net/ipv6/conf/default/disable_ipv6", "1");
    RunCommand("ip link set lo up");
    RunCommand("ip link add near address 02:00:0a:ff:00:01 mtu 1400 type veth peer name far");
    RunCommand("ip link set near alias 'Cable to the far end'");
    RunCommand("ip link add hub type bridge mcast_snooping 0 && ip link set far master hub");
    RunCommand("ip tuntap add dev bare mode tun");
    RunCommand("ip link set near up && ip link set far up && ip link set hub up");
    RunCommand("ip addr add 192.0.2.1/24 dev near");
    RunCommand("ip addr add 198.51.100.1/24 dev bare && ip link set bare up");
  }

  std::vector<Row> Rows() {
    std::uint32_t size = 0;
    EXPECT_EQ(helper().GetIfTable({}, size, false), platform::IpHelper::kErrorInsufficientBuffer);
    std::vector<std::uint8_t> table(size);
    EXPECT_EQ(helper().GetIfTable(table, size, false), 0U);
    std::vector<Row> rows(Little32(table, 0));
    EXPECT_EQ(table.size(), Row::kFirstOffset + rows.size() * Row::kBytes);
    for (std::size_t i = 0; i < rows.size(); ++i)
      std::copy_n(table.begin() + static_cast<std::ptrdiff_t>(Row::kFirstOffset + i * Row::kBytes),
                  Row::kBytes, rows[i].bytes.begin());
    return rows;
  }
  static std::string NameOf(const Row& row) {
    Text name;
    for (std::size_t at = 0; Little16(row.bytes, at) != 0; at += 2)
      name.push_back(static_cast<char16_t>(Little16(row.bytes, at)));
    return ToUtf8(name);
  }
  Row RowNamed(const std::string& name) {
    for (const Row& row : Rows())
      if (NameOf(row) == name) return row;
    ADD_FAILURE() << "no row of " << name;
    return {};
  }
  /// The figures of one link as the tool prints them, by the names of their fields.
  static Fields Printed(const std::string& name) {
    static constexpr const char* kScript =
        "import json,sys; "
        "link=json.load(sys.stdin)[0]; stats=link['stats64']; "
        "flat={k:v for k,v in link.items() if not isinstance(v,(dict,list))}; "
        "flat.update({d+'_'+k:v for d in ('rx','tx') for k,v in stats[d].items()}); "
        "flat['up']='UP' in link['flags']; flat['runs']='LOWER_UP' in link['flags']; "
        "[print(k+'='+str(v)) for k,v in flat.items()]";
    const std::string command = "ip -s -d -j link show dev " + name + " | python3 -c \"" + kScript + "\"";
    Fields fields;
    FILE* pipe = popen(command.c_str(), "r");
    std::array<char, 512> line;
    while (fgets(line.data(), line.size(), pipe) != nullptr) {
      const std::string text(line.data());
      const auto equals = text.find('=');
      fields[text.substr(0, equals)] = text.substr(equals + 1, text.size() - equals - 2);
    }
    pclose(pipe);
    return fields;
  }
  static std::string AddressOf(const Row& row) {
    std::string text;
    for (std::size_t i = 0; i < row.Get(Row::kAddressLength); ++i) {
      std::array<char, 4> byte;
      std::snprintf(byte.data(), byte.size(), "%02x:", row.bytes[Row::kAddressOffset + i]);
      text += byte.data();
    }
    if (!text.empty()) text.pop_back();
    return text;
  }
  CInterface InterfaceNamed(const std::string& name) {
    forms::headless::HeadlessDesktop desktop;
    diagnostics::CIpHelper reader(helper(), desktop);
    Text field; // as the property gives it: a zero after each letter
    for (const char letter : name + '\0') field += {static_cast<char16_t>(letter), u'\0'};
    for (const auto& item : reader.Interfaces()->NewEnum())
      if (item->InterfaceName.starts_with(field)) return *item;
    ADD_FAILURE() << "no interface of " << name;
    return {};
  }
  /// All that the tool prints of an interface; it prints no speed, and only the limit of a queue.
  static void ExpectAsPrinted(const CInterface& read, Fields printed) {
    const auto expect = [&](std::uint32_t value, const std::string& name) {
      EXPECT_EQ(std::to_string(value), printed.at(name)) << name;
    };
    expect(read.InterfaceIndex, "ifindex");
    expect(read.MaximumTransmissionUnit, "mtu");
    expect(read.OctetsReceived, "rx_bytes");
    expect(read.UnicastPacketsReceived + read.NonunicastPacketsReceived, "rx_packets");
    expect(read.NonunicastPacketsReceived, "rx_multicast");
    expect(read.IncomingErrors, "rx_errors");
    expect(read.DiscardedIncomingPackets, "rx_dropped");
    expect(read.OctetsSent, "tx_bytes");
    expect(read.UnicastPacketsSent + read.NonunicastPacketsSent, "tx_packets");
    expect(read.OutgoingErrors, "tx_errors");
    expect(read.DiscardedOutgoingPackets, "tx_dropped");
    EXPECT_EQ(read.InterfaceType, KindPrinted(printed));
    EXPECT_EQ(read.AdminStatus, printed.at("up") == "True" ? 1U : 2U);
    EXPECT_EQ(read.OperationalStatus, StatusPrinted(printed));
    EXPECT_EQ(read.AdapterAddress, AddressPrinted(printed));
    const std::string alias = printed["ifalias"];
    EXPECT_EQ(ToUtf8(read.InterfaceDescription), alias.empty() ? printed.at("ifname") : alias);
    EXPECT_EQ(read.UnknownProtocolPackets, 0U);
    EXPECT_EQ(read.OutputQueueLength, 0U);
    EXPECT_EQ(read.LastChange, 4.0);
  }
  static std::uint32_t KindPrinted(const Fields& printed) {
    const std::map<std::string, std::uint32_t> kinds{{"ether", 6}, {"loopback", 24}, {"none", 131}};
    return kinds.at(printed.at("link_type"));
  }
  static std::uint32_t StatusPrinted(const Fields& printed) {
    const std::string state = printed.at("operstate");
    if (printed.at("up") != "True") return platform::kNonOperational;
    const bool runs = state == "UP" || (state == "UNKNOWN" && printed.at("runs") == "True");
    return runs ? platform::kOperational : platform::kDisconnected;
  }
  /// "02:00:0a" reads as "2-00-A".
  static Text AddressPrinted(Fields& printed) {
    Text text;
    std::istringstream bytes(printed["address"]);
    for (std::string byte; std::getline(bytes, byte, ':');) {
      const auto value = static_cast<std::uint8_t>(std::stoul(byte, nullptr, 16));
      text += (text.empty() ? u"" : u"-") + (value == 0 ? Text(u"00") : HexText(value));
    }
    return text;
  }
  /// So that counters move, those of what is dropped among them: nobody reads at the other end of the link
  /// that has no carrier, and nobody knows the protocol of the frames that the bridge gets.
  void SendSome() {
    for (const std::uint32_t address : {0x7F000001U, 0xC00002FFU, 0xC6336402U}) SendDatagrams(address);
    const auto dropped = [] { return std::stoul(Printed("hub").at("rx_dropped")); };
    const auto before = dropped();
    SendFrames(if_nametoindex("near"));
    for (int i = 0; i < 100 && dropped() < before + kSent; ++i) usleep(10'000);
  }
  static void SendDatagrams(std::uint32_t address) {
    const int sender = socket(AF_INET, SOCK_DGRAM | SOCK_CLOEXEC, 0);
    const int yes = 1;
    setsockopt(sender, SOL_SOCKET, SO_BROADCAST, &yes, sizeof yes);
    sockaddr_in to{};
    to.sin_family = AF_INET;
    to.sin_port = htons(9);
    to.sin_addr.s_addr = htonl(address);
    for (int i = 0; i < kSent; ++i)
      EXPECT_EQ(sendto(sender, "datagram", 8, 0, reinterpret_cast<const sockaddr*>(&to), sizeof to), 8);
    close(sender);
  }
  static void SendFrames(unsigned link) {
    const int sender = socket(AF_PACKET, SOCK_RAW | SOCK_CLOEXEC, 0);
    sockaddr_ll to{};
    to.sll_family = AF_PACKET;
    to.sll_ifindex = static_cast<int>(link);
    std::array<std::uint8_t, 60> frame{0x01, 0x00, 0x5E, 0, 0, 1, 2, 0, 0x0A, 0xFF, 0, 1, 0x88, 0xB5};
    for (int i = 0; i < kSent; ++i)
      EXPECT_EQ(
          sendto(sender, frame.data(), frame.size(), 0, reinterpret_cast<const sockaddr*>(&to), sizeof to),
          60);
    close(sender);
  }

  static constexpr int kSent = 3;

  platform::linux_::LinuxIpHelper& helper() {
    if (!helper_) helper_.emplace(folder_, platform::linux_::SocketOwners::Rights{true, 0});
    return *helper_;
  }

 private:
  std::optional<NetworkNamespace> network_;
  platform::linux_::ProcFolder folder_;
  std::optional<platform::linux_::LinuxIpHelper> helper_;
};

TEST_F(InterfaceTable, Rows_stand_by_ascending_index) {
  const auto rows = Rows();
  ASSERT_EQ(rows.size(), 5U);
  EXPECT_TRUE(std::ranges::is_sorted(rows, {}, [](const Row& row) { return row.Get(Row::kIndex); }));
}

TEST_F(InterfaceTable, A_machine_of_many_links_shows_the_39_of_the_lowest_indexes) {
  const auto few = Rows();
  RunCommand("for i in $(seq 1 40); do ip link add many$i type bridge; done");
  const auto many = Rows();
  ASSERT_EQ(many.size(), 39U);
  for (std::size_t i = 0; i < few.size(); ++i) EXPECT_EQ(NameOf(many[i]), NameOf(few[i]));
  EXPECT_EQ(InterfaceNamed("lo").InterfaceType, 24U);
}

TEST_F(InterfaceTable, Every_interface_is_as_the_systems_own_tool_prints_it_field_by_field) {
  Rows(); // the counters of these links began with them
  SendSome();
  for (const char* name : {"lo", "near", "far", "hub", "bare"}) {
    SCOPED_TRACE(name);
    ExpectAsPrinted(InterfaceNamed(name), Printed(name));
  }
  EXPECT_GT(InterfaceNamed("lo").OctetsReceived, 0U);
  EXPECT_GT(InterfaceNamed("near").UnicastPacketsSent, 0U);
  EXPECT_GT(InterfaceNamed("far").OctetsReceived, 0U);
  EXPECT_GT(InterfaceNamed("hub").NonunicastPacketsReceived, 0U);
  EXPECT_GT(InterfaceNamed("hub").DiscardedIncomingPackets, 0U);
  EXPECT_GT(InterfaceNamed("bare").DiscardedOutgoingPackets, 0U);
}

TEST_F(InterfaceTable, Links_have_their_kind_address_and_description) {
  EXPECT_EQ(RowNamed("lo").Get(Row::kType), 24U);
  EXPECT_EQ(AddressOf(RowNamed("lo")), Printed("lo").at("address"));
  const Row near = RowNamed("near");
  EXPECT_EQ(near.Get(Row::kType), 6U);
  EXPECT_EQ(AddressOf(near), "02:00:0a:ff:00:01");
  EXPECT_EQ(near.Get(Row::kDescriptionLength), 20U);
  EXPECT_EQ(std::string(near.bytes.begin() + Row::kDescriptionOffset,
                        near.bytes.begin() + Row::kDescriptionOffset + 20),
            "Cable to the far end");
  EXPECT_EQ(AddressOf(RowNamed("hub")), Printed("hub").at("address"));
  EXPECT_EQ(RowNamed("bare").Get(Row::kAddressLength), 0U);
  EXPECT_EQ(RowNamed("bare").Get(Row::kType), 131U);
}

TEST_F(InterfaceTable, States_are_numbered_as_the_table_does) {
  EXPECT_EQ(RowNamed("lo").Get(Row::kOperStatus), platform::kOperational);
  EXPECT_EQ(RowNamed("near").Get(Row::kOperStatus), platform::kOperational);
  EXPECT_EQ(RowNamed("bare").Get(Row::kOperStatus), platform::kDisconnected);
  RunCommand("ip link set far down && ip link set bare down");
  EXPECT_EQ(RowNamed("bare").Get(Row::kOperStatus), platform::kNonOperational);
  EXPECT_EQ(RowNamed("near").Get(Row::kOperStatus), platform::kDisconnected);
  EXPECT_EQ(RowNamed("near").Get(Row::kAdminStatus), platform::kAdminUp);
  EXPECT_EQ(RowNamed("far").Get(Row::kAdminStatus), platform::kAdminDown);
}

TEST_F(InterfaceTable, An_unknown_speed_is_10_megabits_and_a_high_one_stops_at_2147483647) {
  EXPECT_EQ(RowNamed("lo").Get(Row::kSpeed), 10'000'000U);
  EXPECT_EQ(RowNamed("near").Get(Row::kSpeed), 2'147'483'647U); // the kernel says 10 gigabits
}

TEST_F(InterfaceTable, Counters_count_from_the_start) {
  SendSome();
  const auto before = Printed("lo");
  ASSERT_GT(std::stoul(before.at("rx_bytes")), 0U);
  EXPECT_EQ(RowNamed("lo").Get(Row::kInOctets), 0U);
  SendSome();
  EXPECT_EQ(RowNamed("lo").Get(Row::kInOctets),
            std::stoul(Printed("lo").at("rx_bytes")) - std::stoul(before.at("rx_bytes")));
}

} // namespace
} // namespace quendra::integration
