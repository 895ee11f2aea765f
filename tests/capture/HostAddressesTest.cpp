#include "capture/HostAddresses.h"

#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

namespace quendra::capture {
namespace {

struct HostAddressesTest : testing::Test {
  platform::simulated::SimulatedMachine machine;
  HostAddresses host{machine.hostNames, machine.ipHelper};

  void AddAdapter(std::vector<std::string> gateways) {
    machine.ipHelper.Adapters.push_back({"name", "description", {}, std::move(gateways)});
  }
};

TEST_F(HostAddressesTest, The_last_address_is_the_one_at_the_end_of_the_hosts_list) {
  machine.hostNames.Addresses = {"127.0.0.1", "192.168.7.1", "10.0.0.138"};
  EXPECT_EQ(host.LocalHostAddress(HostAddress::Last), u"10.0.0.138");
}

TEST_F(HostAddressesTest, The_other_address_is_the_one_before_the_last) {
  machine.hostNames.Addresses = {"127.0.0.1", "192.168.7.1", "10.0.0.138"};
  EXPECT_EQ(host.LocalHostAddress(HostAddress::BeforeLast), u"192.168.7.1");
}

TEST_F(HostAddressesTest, With_one_address_the_one_before_the_last_is_empty) {
  machine.hostNames.Addresses = {"10.0.0.138"};
  EXPECT_EQ(host.LocalHostAddress(HostAddress::Last), u"10.0.0.138");
  EXPECT_EQ(host.LocalHostAddress(HostAddress::BeforeLast), u"");
}

TEST_F(HostAddressesTest, Without_addresses_both_are_empty) {
  EXPECT_EQ(host.LocalHostAddress(HostAddress::Last), u"");
  EXPECT_EQ(host.LocalHostAddress(HostAddress::BeforeLast), u"");
}

TEST_F(HostAddressesTest, A_failure_of_either_call_gives_empty_texts) {
  machine.hostNames.Addresses = {"192.168.7.1", "10.0.0.138"};
  machine.hostNames.FailName = true;
  EXPECT_EQ(host.LocalHostAddress(HostAddress::Last), u"");
  machine.hostNames.FailName = false;
  machine.hostNames.FailAddresses = true;
  EXPECT_EQ(host.LocalHostAddress(HostAddress::Last), u"");
  EXPECT_EQ(host.LocalHostAddress(HostAddress::BeforeLast), u"");
}

TEST_F(HostAddressesTest, The_gateway_is_the_first_address_on_any_adapters_list) {
  AddAdapter({});
  AddAdapter({"10.0.0.1", "10.0.0.2"});
  AddAdapter({"192.168.7.254"});
  EXPECT_EQ(host.GatewayAddress(), u"10.0.0.1");
}

TEST_F(HostAddressesTest, Empty_gateways_are_passed_over) {
  AddAdapter({"", ""});
  AddAdapter({"", "10.0.0.2"});
  EXPECT_EQ(host.GatewayAddress(), u"10.0.0.2");
}

TEST_F(HostAddressesTest, Without_adapters_or_gateways_the_gateway_is_empty) {
  EXPECT_EQ(host.GatewayAddress(), u"");
  AddAdapter({""});
  EXPECT_EQ(host.GatewayAddress(), u"");
}

TEST_F(HostAddressesTest, A_failure_gives_an_empty_gateway) {
  AddAdapter({"10.0.0.1"});
  machine.ipHelper.AdaptersError = platform::IpHelper::kErrorNotSupported;
  EXPECT_EQ(host.GatewayAddress(), u"");
}

/// Counts the calls, and gains an adapter between them when told so.
struct GrowingIpHelper : platform::simulated::SimulatedIpHelper {
  std::uint32_t GetAdaptersInfo(std::vector<platform::AdapterRecord>& adapters,
                                std::uint32_t& size) override {
    Rooms.push_back(size);
    const auto result = SimulatedIpHelper::GetAdaptersInfo(adapters, size);
    if (Grow) Adapters.push_back(Adapters.back());
    return result;
  }
  std::vector<std::uint32_t> Rooms;
  bool Grow = false;
};

TEST_F(HostAddressesTest, The_adapters_are_asked_for_once_without_room_and_once_with_what_they_need) {
  GrowingIpHelper helper;
  helper.Adapters.push_back({"name", "description", {}, {"10.0.0.1"}});
  const HostAddresses other(machine.hostNames, helper);
  EXPECT_EQ(other.GatewayAddress(), u"10.0.0.1");
  EXPECT_EQ(helper.Rooms, (std::vector<std::uint32_t>{0, 640}));
  helper.Grow = true;
  EXPECT_EQ(other.GatewayAddress(), u"");
}

} // namespace
} // namespace quendra::capture
