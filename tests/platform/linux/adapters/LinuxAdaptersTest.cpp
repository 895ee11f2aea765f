#include "platform/linux/adapters/LinuxAdapters.h"

#include "forms/headless/posix/PolledDesktop.h"
#include "platform/adapters/AdapterNumbers.h"
#include "platform/linux/network_manager/PrivateBusFixture.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>
#include <sched.h>

namespace quendra::platform::linux_ {

namespace {

struct AdaptersTest : testing::Test {
  std::vector<std::shared_ptr<NetworkCard>> Cards() {
    return adapters.GetObject(Adapters::kMoniker)->ExecQuery(Adapters::kCards);
  }
  NetworkCard& Card(const std::string& description) {
    for (const auto& card : cards = Cards())
      if (card->Description() == description) return *card;
    throw std::runtime_error("there is no " + description);
  }
  std::vector<std::string> Descriptions() {
    std::vector<std::string> texts;
    for (const auto& card : Cards()) texts.push_back(card->Description());
    return texts;
  }

  forms::headless::PolledDesktop loop;
  NetworkManagerBus connection{loop, loop};
  LinuxAdapters adapters{connection};
  std::vector<std::shared_ptr<NetworkCard>> cards;
};

struct ManagedCardsTest : AdaptersTest {
  void SetUp() override {
    if (const std::string missing = RealNetworkManager::Missing(); !missing.empty()) GTEST_SKIP() << missing;
    ASSERT_TRUE(manager.Start()) << manager.Log();
  }
  bool HasLanded(const std::string& address) {
    return Wait(
        [&] { return manager.InItsNetwork("ip -4 -o addr show").find(address) != std::string::npos; });
  }
  std::string OwnAddresses() { return manager.InItsNetwork("ip -4 -o addr show dev qn0"); }

  RealNetworkManager manager{std::string(RealNetworkManager::kTwoLinks) +
                             " && ip addr add 10.77.0.1/24 dev qn1 && ip addr add 10.77.0.2/24 dev qn0"};
};

/// Runs in a network of its own with two links and no NetworkManager.
struct KernelCardsTest : AdaptersTest {
  void SetUp() override {
    if (::geteuid() != 0) GTEST_SKIP() << "needs root for namespaces";
  }
  /// The results of both changes.
  static std::string Configure(NetworkCard& card, std::uint16_t metric) {
    const std::string address = std::to_string(card.EnableStatic({"10.200.1.1"}, {"255.0.0.0"}));
    return address + " " + std::to_string(card.SetGateways({"10.0.0.138"}, {metric})) + "\n";
  }
  static void EnterNetwork() {
    if (::unshare(CLONE_NEWNET) != 0 ||
        !RunShell("ip link set lo up && " + std::string(RealNetworkManager::kTwoLinks) +
                  " && ip addr add 10.77.0.1/24 dev qn1 && ip addr add 10.77.0.2/24 dev qn0 && "
                  "ip addr add 10.78.0.2/24 dev qn0 && ip route add default via 10.77.0.9 dev qn0"))
      throw std::runtime_error("no network of its own");
  }

  PrivateBus bus; ///< which nobody started
};

} // namespace

TEST_F(AdaptersTest, Another_moniker_leads_nowhere_and_another_query_finds_nothing) {
  EXPECT_THROW(adapters.GetObject("winmgmts:\\\\.\\root\\other"), Fault);
  EXPECT_TRUE(adapters.GetObject(Adapters::kMoniker)->ExecQuery("Select * from Win32_Printer").empty());
}

TEST_F(ManagedCardsTest, Cards_are_the_devices_with_an_address_without_loopback) {
  ASSERT_TRUE(Wait([&] { return Cards().size() == 2; }));
  const auto found = Descriptions();
  EXPECT_NE(std::ranges::find(found, "Ethernet (qn0)"), found.end());
  EXPECT_NE(std::ranges::find(found, "Ethernet (qn1)"), found.end());
}

TEST_F(ManagedCardsTest, A_static_address_and_a_gateway_land_on_the_device_and_are_kept) {
  ASSERT_TRUE(Wait([&] { return Cards().size() == 2; }));
  NetworkCard& card = Card("Ethernet (qn0)");
  EXPECT_EQ(card.EnableStatic({"10.200.1.1"}, {"255.0.0.0"}), kCardChanged);
  EXPECT_EQ(card.SetGateways({"10.0.0.138"}, {1}), kCardChanged);
  EXPECT_TRUE(HasLanded("10.200.1.1/8"));
  EXPECT_EQ(OwnAddresses().find("10.77.0.2"), std::string::npos) << OwnAddresses();
  EXPECT_TRUE(Wait([&] {
    return manager.InItsNetwork("ip route show default").find("via 10.0.0.138 dev qn0") != std::string::npos;
  })) << manager.InItsNetwork("ip route show");
  const std::string name = manager.Nmcli("-g GENERAL.CONNECTION device show qn0").substr(0, 3);
  EXPECT_EQ(
      manager.Nmcli("-g ipv4.method,ipv4.addresses,ipv4.gateway,ipv4.route-metric,connection.autoconnect "
                    "con show '" +
                    name + "'"),
      "manual\n10.200.1.1/8\n10.0.0.138\n1\nyes\n");
}

TEST_F(ManagedCardsTest, A_connection_of_the_user_keeps_what_is_not_changed) {
  manager.Nmcli(
      "con add type ethernet con-name mine ifname qn0 ipv4.method manual ipv4.addresses 10.5.0.1/24 "
      "ipv4.dns 10.5.0.9 802-3-ethernet.mtu 1400");
  manager.Nmcli("con up mine");
  ASSERT_TRUE(HasLanded("10.5.0.1/24"));
  EXPECT_EQ(Card("Ethernet (qn0)").EnableStatic({"10.200.1.1"}, {"255.0.0.0"}), kCardChanged);
  EXPECT_TRUE(HasLanded("10.200.1.1/8"));
  EXPECT_EQ(manager.Nmcli("-g ipv4.dns,802-3-ethernet.mtu,ipv4.addresses con show mine"),
            "10.5.0.9\n1400\n10.200.1.1/8\n");
}

TEST_F(ManagedCardsTest, A_card_of_a_manager_that_has_gone_tells_a_failure) {
  ASSERT_TRUE(Wait([&] { return Cards().size() == 2; }));
  NetworkCard& card = Card("Ethernet (qn0)");
  manager.Kill();
  EXPECT_EQ(card.EnableStatic({"10.200.1.1"}, {"255.0.0.0"}), kCardUnknownFailure);
  EXPECT_EQ(card.SetGateways({"10.0.0.138"}, {1}), kCardUnknownFailure);
  EXPECT_EQ(card.EnableStatic({"x"}, {"255.0.0.0"}), kCardInvalidAddress);
}

TEST_F(KernelCardsTest, Without_a_manager_the_links_with_an_address_are_the_cards) {
  const Child child([&] {
    EnterNetwork();
    std::string found;
    for (const std::string& description : Descriptions()) found += description + "\n";
    return found;
  });
  // The second link of the pair has the lower index.
  EXPECT_EQ(child.Answer(), "Network adapter (qn1)\nNetwork adapter (qn0)\n");
}

TEST_F(KernelCardsTest, Without_a_manager_root_gives_the_link_its_address_and_gateway) {
  const Child child([&] {
    EnterNetwork();
    const auto card = Cards().back();
    std::string results = Configure(*card, 1);
    results += Configure(*card, 7);
    return results + OutputOf("ip -4 -o addr show dev qn0 | awk '{print $4}'; ip route show default");
  });
  EXPECT_EQ(child.Answer(),
            "0 0\n0 0\n10.200.1.1/8\ndefault via 10.0.0.138 dev qn0 proto static metric 7 \n");
}

TEST_F(KernelCardsTest, Without_a_manager_another_user_is_told_that_it_may_not) {
  const Child child([&] {
    EnterNetwork();
    const auto card = Cards().back();
    if (::setuid(65534) != 0) return std::string("still root");
    const std::string results = Configure(*card, 1);
    return results + OutputOf("ip -4 -o addr show dev qn0 | awk '{print $4}'");
  });
  EXPECT_EQ(child.Answer(), "91 91\n10.77.0.2/24\n10.78.0.2/24\n");
}

TEST_F(KernelCardsTest, A_link_that_has_gone_tells_a_failure) {
  const Child child([&] {
    EnterNetwork();
    const auto card = Cards().back();
    RunShell("ip link del qn0");
    return std::to_string(card->EnableStatic({"10.200.1.1"}, {"255.0.0.0"}));
  });
  EXPECT_EQ(child.Answer(), "65");
}

} // namespace quendra::platform::linux_
