#include "platform/linux/icmp/LinuxIcmp.h"

#include "integration/NetworkNamespace.h"
#include "platform/linux/LinuxFixture.h"
#include "platform/linux/icmp/PingEchoSocket.h"
#include "platform/linux/icmp/RawEchoSocket.h"
#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <netinet/in.h>
#include <sys/socket.h>
#include <sys/time.h>
#include <sys/types.h>

#include <array>
#include <chrono>
#include <csignal>
#include <grp.h>
#include <memory>

namespace quendra::platform::linux_ {

namespace {

using integration::NetworkNamespace;
using integration::RunCommand;

Descriptor IcmpSocket(int type) {
  return Descriptor(::socket(AF_INET, type | SOCK_NONBLOCK | SOCK_CLOEXEC, IPPROTO_ICMP));
}
OpenedEchoSocket OpenRaw() { return {std::make_unique<RawEchoSocket>(IcmpSocket(SOCK_RAW)), false}; }
OpenedEchoSocket OpenPing() { return {std::make_unique<PingEchoSocket>(IcmpSocket(SOCK_DGRAM)), false}; }

struct Kind {
  const char* name;
  LinuxIcmp::Opener open;
};

/// A network of two hosts with a router of its own between them: this one is 10.4.0.1, the router 10.4.0.2
/// and 10.4.1.2, the far host 10.4.1.1. Both kinds of sockets may be used.
class LinuxIcmpTest : public testing::TestWithParam<Kind> {
 protected:
  void SetUp() override {
    if (!NetworkNamespace::Possible()) GTEST_SKIP() << NetworkNamespace::kSkipReason;
    near = std::make_unique<NetworkNamespace>();
    router = std::make_unique<NetworkNamespace>();
    far = std::make_unique<NetworkNamespace>();
    Link(*near, "qn", "10.4.0.1/24", *router, "qrn", "10.4.0.2/24");
    Link(*far, "qf", "10.4.1.1/24", *router, "qrf", "10.4.1.2/24");
    router->Enter();
    NetworkNamespace::Set("net/ipv4/ip_forward", "1");
    NetworkNamespace::Set("net/ipv4/icmp_ratelimit", "0");
    RunCommand("ip route add unreachable 10.9.0.0/16");
    far->Enter();
    RunCommand("ip route add default via 10.4.1.2");
    near->Enter();
    RunCommand("ip route add default via 10.4.0.2");
    NetworkNamespace::Set("net/ipv4/ping_group_range", "0 0");
    icmp.emplace(GetParam().open);
    handle = icmp->IcmpCreateFile();
  }
  void TearDown() override {
    icmp.reset();
    far.reset();
    router.reset();
    near.reset();
  }

  static void Link(const NetworkNamespace& one, const std::string& link, const std::string& address,
                   const NetworkNamespace& other, const std::string& otherLink,
                   const std::string& otherAddress) {
    one.Enter();
    const std::string place =
        "/proc/" + std::to_string(getpid()) + "/fd/" + std::to_string(other.Descriptor());
    RunCommand("ip link set lo up && ip link add " + link + " type veth peer name " + otherLink + " netns " +
               place);
    RunCommand("ip addr add " + address + " dev " + link + " && ip link set " + link + " up");
    other.Enter();
    RunCommand("ip addr add " + otherAddress + " dev " + otherLink + " && ip link set " + otherLink + " up");
  }

  /// With a TTL, or with the system's own options.
  std::uint32_t Send(const char* address, std::uint8_t ttl = 0, std::uint32_t limit = 2000) {
    const std::array<std::uint8_t, kEchoOptionsSize> image{ttl};
    const std::span<const std::uint8_t> options =
        ttl == 0 ? std::span<const std::uint8_t>() : std::span<const std::uint8_t>(image);
    reply.fill(0xEE);
    return icmp->IcmpSendEcho(handle, {*Ipv4Address::FromText(std::string_view(address)), data, options},
                              reply, limit);
  }
  std::string From() const { return Ipv4Address::FromMemory(Little32(reply, kReplyAddress)).AsAscii(); }
  std::uint32_t Status() const { return Little32(reply, kReplyStatus); }

  std::unique_ptr<NetworkNamespace> near;
  std::unique_ptr<NetworkNamespace> router;
  std::unique_ptr<NetworkNamespace> far;
  std::optional<LinuxIcmp> icmp;
  IcmpHandle handle;
  std::array<std::uint8_t, 5> data{'h', 'e', 'l', 'l', 'o'};
  std::array<std::uint8_t, 280> reply{};
};

INSTANTIATE_TEST_SUITE_P(, LinuxIcmpTest, testing::Values(Kind{"raw", OpenRaw}, Kind{"ping", OpenPing}),
                         [](const auto& tested) { return tested.param.name; });

TEST_P(LinuxIcmpTest, The_target_answers_with_success_and_the_data) {
  EXPECT_EQ(Send("10.4.1.1"), 1u);
  EXPECT_EQ(From(), "10.4.1.1");
  EXPECT_EQ(Status(), kEchoSuccess);
  EXPECT_EQ(Little16(reply, kReplyDataSize), 5);
  EXPECT_EQ(std::string(reply.begin() + kEchoReplySize, reply.begin() + kEchoReplySize + 5), "hello");
  EXPECT_EQ(reply[kReplyTtl], 63);
  EXPECT_LT(Little32(reply, kReplyRoundTripTime), 1000u);
}

TEST_P(LinuxIcmpTest, A_router_answers_an_echo_whose_TTL_ends_at_it) {
  EXPECT_EQ(Send("10.4.1.1", 1), 1u);
  EXPECT_EQ(From(), "10.4.0.2");
  EXPECT_EQ(Status(), kEchoTtlExpiredInTransit);
  EXPECT_EQ(Send("10.4.1.1", 2), 1u);
  EXPECT_EQ(From(), "10.4.1.1");
}

TEST_P(LinuxIcmpTest, The_TTL_of_one_echo_is_not_that_of_the_next) {
  EXPECT_EQ(Send("10.4.1.1", 1), 1u);
  EXPECT_EQ(Send("10.4.1.1"), 1u);
  EXPECT_EQ(Status(), kEchoSuccess);
}

TEST_P(LinuxIcmpTest, A_router_without_a_way_answers_that_the_host_is_unreachable) {
  EXPECT_EQ(Send("10.9.0.1"), 1u);
  EXPECT_EQ(From(), "10.4.0.2");
  EXPECT_EQ(Status(), kEchoHostUnreachable);
}

TEST_P(LinuxIcmpTest, Silence_ends_at_the_limit_with_the_status_of_a_time_out) {
  far->Enter();
  NetworkNamespace::Set("net/ipv4/icmp_echo_ignore_all", "1");
  near->Enter();
  const auto start = std::chrono::steady_clock::now();
  EXPECT_EQ(Send("10.4.1.1", 0, 60), 0u);
  EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(60));
  EXPECT_EQ(Status(), kEchoTimedOut);
  EXPECT_EQ(From(), "0.0.0.0");
}

TEST_P(LinuxIcmpTest, A_reply_that_comes_after_its_limit_is_not_taken_for_that_of_the_next_echo) {
  router->Enter();
  RunCommand("ip link set qrf down");
  near->Enter();
  EXPECT_EQ(Send("10.4.1.1", 0, 0), 0u);
  router->Enter();
  RunCommand("ip link set qrf up");
  near->Enter();
  EXPECT_EQ(Send("10.4.1.1"), 1u);
  EXPECT_EQ(From(), "10.4.1.1");
  EXPECT_EQ(Status(), kEchoSuccess);
}

TEST_P(LinuxIcmpTest, Without_any_way_the_echo_fails_at_once_as_the_network_is_unreachable) {
  RunCommand("ip route del default");
  EXPECT_EQ(Send("10.4.1.1"), 0u);
  EXPECT_EQ(Status(), kEchoNetUnreachable);
}

TEST_P(LinuxIcmpTest, No_echo_goes_to_a_broadcast_address) {
  EXPECT_EQ(Send("255.255.255.255"), 0u);
  EXPECT_EQ(Status(), kEchoBadDestination);
}

TEST_P(LinuxIcmpTest, Data_that_no_packet_can_carry_is_refused) {
  const std::vector<std::uint8_t> much(65508);
  EXPECT_EQ(icmp->IcmpSendEcho(handle, {Ipv4Address::FromHost(INADDR_LOOPBACK), much, {}}, reply, 100), 0u);
  EXPECT_EQ(Status(), kEchoBadRequest);
}

TEST_P(LinuxIcmpTest, A_signal_does_not_end_the_wait) {
  static volatile std::sig_atomic_t signals;
  signals = 0;
  struct sigaction before;
  struct sigaction counting {};
  counting.sa_handler = [](int) { signals = signals + 1; };
  sigaction(SIGALRM, &counting, &before);
  const itimerval often{{0, 5'000}, {0, 5'000}};
  setitimer(ITIMER_REAL, &often, nullptr);
  far->Enter();
  NetworkNamespace::Set("net/ipv4/icmp_echo_ignore_all", "1");
  near->Enter();
  const auto start = std::chrono::steady_clock::now();
  EXPECT_EQ(Send("10.4.1.1", 0, 80), 0u);
  const auto waited = std::chrono::steady_clock::now() - start;
  const itimerval never{};
  setitimer(ITIMER_REAL, &never, nullptr);
  sigaction(SIGALRM, &before, nullptr);
  EXPECT_GE(waited, std::chrono::milliseconds(80));
  EXPECT_GT(signals, 0);
  EXPECT_EQ(Status(), kEchoTimedOut);
}

TEST_P(LinuxIcmpTest, Two_handles_do_not_take_each_others_answers) {
  const IcmpHandle other = icmp->IcmpCreateFile();
  ASSERT_NE(other, kNoIcmp);
  EXPECT_EQ(Send("10.4.1.1", 1), 1u);
  const IcmpHandle first = handle;
  handle = other;
  EXPECT_EQ(Send("10.4.1.1"), 1u);
  EXPECT_EQ(Status(), kEchoSuccess);
  handle = first;
  EXPECT_EQ(Send("10.4.1.1"), 1u);
  EXPECT_EQ(Status(), kEchoSuccess);
}

/// What opening a handle gives to somebody who is not root, in a network of their own.
std::string HandleOfUser(const char* groupsThatMayPing) {
  const Child child([&] {
    if (unshare(CLONE_NEWNET) != 0) return std::string("no namespace");
    RunShell("ip link set lo up");
    NetworkNamespace::Set("net/ipv4/ping_group_range", groupsThatMayPing);
    if (setgroups(0, nullptr) != 0 || setgid(65534) != 0 || setuid(65534) != 0)
      return std::string("still root");
    LinuxIcmp icmp;
    const IcmpHandle handle = icmp.IcmpCreateFile();
    if (handle == kNoIcmp) return "lacks " + icmp.MissingRight();
    std::array<std::uint8_t, 280> reply;
    const std::array<std::uint8_t, 1> data{'x'};
    const auto count =
        icmp.IcmpSendEcho(handle, {Ipv4Address::FromHost(INADDR_LOOPBACK), data, {}}, reply, 2000);
    return std::to_string(count) + " reply";
  });
  return child.Answer();
}

TEST(LinuxIcmpRights, A_user_of_a_group_that_may_ping_sends_echoes) {
  if (!NetworkNamespace::Possible()) GTEST_SKIP() << NetworkNamespace::kSkipReason;
  EXPECT_EQ(HandleOfUser("65534 65534"), "1 reply");
}

TEST(LinuxIcmpRights, Any_other_user_has_no_handle_for_want_of_the_right) {
  if (!NetworkNamespace::Possible()) GTEST_SKIP() << NetworkNamespace::kSkipReason;
  EXPECT_EQ(HandleOfUser("1 0"), "lacks CAP_NET_RAW");
}

} // namespace

} // namespace quendra::platform::linux_
