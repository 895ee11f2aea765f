#include "platform/linux/LinuxFixture.h"
#include "platform/linux/net/SocketDiagnostics.h"

#include <arpa/inet.h>
#include <gtest/gtest.h>
#include <linux/inet_diag.h>
#include <linux/netlink.h>

#include <cstring>

namespace quendra::platform::linux_ {

namespace {

using Bytes = std::vector<std::uint8_t>;
using Progress = SocketDiagnostics::Progress;

inet_diag_msg Message(std::uint8_t family, std::uint8_t state) {
  inet_diag_msg message{};
  message.idiag_family = family;
  message.idiag_state = state;
  message.id.idiag_sport = htons(40000);
  message.id.idiag_dport = htons(80);
  message.idiag_inode = 4711;
  message.idiag_uid = 1000;
  return message;
}

inet_diag_msg Message4(std::uint8_t state = 1) {
  inet_diag_msg message = Message(AF_INET, state);
  message.id.idiag_src[0] = htonl(0x0A000001);
  message.id.idiag_dst[0] = htonl(0x0A000002);
  return message;
}

void SetMapped(std::uint32_t (&address)[4], std::uint32_t ipv4) {
  address[2] = htonl(0xFFFF);
  address[3] = htonl(ipv4);
}

Bytes Datagram(const inet_diag_msg& message, const Bytes& attributes = {}, std::uint32_t sequence = 7) {
  Bytes bytes;
  nlmsghdr header{};
  header.nlmsg_len = static_cast<std::uint32_t>(sizeof header + sizeof message + attributes.size());
  header.nlmsg_type = 18;
  header.nlmsg_seq = sequence;
  Append(bytes, header);
  Append(bytes, message);
  bytes.insert(bytes.end(), attributes.begin(), attributes.end());
  return bytes;
}

Bytes V6OnlyAttribute(std::uint8_t value) {
  Bytes bytes;
  Append(bytes, nlattr{8, INET_DIAG_SHUTDOWN});
  for (int i = 0; i < 4; ++i) bytes.push_back(0);
  Append(bytes, nlattr{5, INET_DIAG_SKV6ONLY});
  for (const std::uint8_t byte : {value, std::uint8_t{0}, std::uint8_t{0}, std::uint8_t{0}})
    bytes.push_back(byte);
  return bytes;
}

std::vector<TcpSocket> SocketsOf(const Bytes& datagram) {
  // A copy takes exactly the memory that it needs, so that a checker sees a read past its end.
  const Bytes exact(datagram);
  std::vector<TcpSocket> sockets;
  EXPECT_EQ(SocketDiagnostics::TakeUp(exact, 7, sockets), Progress::More);
  return sockets;
}

TEST(LinuxSocketDiagnostics, A_connection_comes_with_addresses_and_ports_in_network_order_and_its_number) {
  const auto sockets = SocketsOf(Datagram(Message4()));
  ASSERT_EQ(sockets.size(), 1u);
  EXPECT_EQ(sockets[0].localAddress, htonl(0x0A000001));
  EXPECT_EQ(sockets[0].remoteAddress, htonl(0x0A000002));
  EXPECT_EQ(sockets[0].localPort, htons(40000));
  EXPECT_EQ(sockets[0].remotePort, htons(80));
  EXPECT_EQ(sockets[0].node, 4711u);
  EXPECT_EQ(sockets[0].user, 1000u);
}

TEST(LinuxSocketDiagnostics, The_kernels_states_become_the_owner_tables_numbers) {
  // Established, SYN sent, SYN received, FIN wait 1, FIN wait 2, time wait, closed, close wait, last ACK,
  // listening, closing, a request not yet answered.
  const std::uint32_t expected[] = {5, 3, 4, 6, 7, 11, 1, 8, 10, 2, 9, 4};
  for (std::uint8_t state = 1; state <= 12; ++state) {
    const auto sockets = SocketsOf(Datagram(Message4(state)));
    ASSERT_EQ(sockets.size(), 1u);
    EXPECT_EQ(sockets[0].state, expected[state - 1]) << int{state};
  }
}

TEST(LinuxSocketDiagnostics, A_state_that_the_table_lacks_is_left_out) {
  for (const std::uint8_t state : {0, 13, 255}) EXPECT_TRUE(SocketsOf(Datagram(Message4(state))).empty());
}

TEST(LinuxSocketDiagnostics, A_connection_over_IPv4_mapped_addresses_comes_with_its_IPv4_addresses) {
  inet_diag_msg message = Message(AF_INET6, 1);
  SetMapped(message.id.idiag_src, 0x7F000001);
  SetMapped(message.id.idiag_dst, 0x7F000002);
  const auto sockets = SocketsOf(Datagram(message));
  ASSERT_EQ(sockets.size(), 1u);
  EXPECT_EQ(sockets[0].localAddress, htonl(0x7F000001));
  EXPECT_EQ(sockets[0].remoteAddress, htonl(0x7F000002));
}

TEST(LinuxSocketDiagnostics, A_connection_over_IPv6_is_left_out) {
  inet_diag_msg message = Message(AF_INET6, 1);
  message.id.idiag_src[0] = message.id.idiag_dst[0] = htonl(0x20010DB8);
  EXPECT_TRUE(SocketsOf(Datagram(message)).empty());
  inet_diag_msg half = Message(AF_INET6, 1);
  SetMapped(half.id.idiag_src, 0x7F000001);
  half.id.idiag_dst[0] = htonl(0x20010DB8);
  EXPECT_TRUE(SocketsOf(Datagram(half)).empty());
}

TEST(LinuxSocketDiagnostics, A_listener_on_every_address_of_both_families_listens_on_every_IPv4_address) {
  const auto sockets = SocketsOf(Datagram(Message(AF_INET6, 10), V6OnlyAttribute(0)));
  ASSERT_EQ(sockets.size(), 1u);
  EXPECT_EQ(sockets[0].localAddress, 0u);
  EXPECT_EQ(sockets[0].localPort, htons(40000));
}

TEST(LinuxSocketDiagnostics, A_listener_for_IPv6_alone_is_left_out) {
  EXPECT_TRUE(SocketsOf(Datagram(Message(AF_INET6, 10), V6OnlyAttribute(1))).empty());
  EXPECT_TRUE(SocketsOf(Datagram(Message(AF_INET6, 10))).empty());
}

TEST(LinuxSocketDiagnostics, Another_family_is_left_out) {
  EXPECT_TRUE(SocketsOf(Datagram(Message(AF_UNIX, 1))).empty());
}

TEST(LinuxSocketDiagnostics, Two_sockets_in_one_datagram_are_both_taken) {
  Bytes both = Datagram(Message4());
  const Bytes second = Datagram(Message4(10));
  both.insert(both.end(), second.begin(), second.end());
  EXPECT_EQ(SocketsOf(both).size(), 2u);
}

TEST(LinuxSocketDiagnostics, An_answer_to_another_request_is_left_out) {
  EXPECT_TRUE(SocketsOf(Datagram(Message4(), {}, 6)).empty());
}

TEST(LinuxSocketDiagnostics, The_end_and_an_error_end_the_answer) {
  std::vector<TcpSocket> sockets;
  for (const auto& [type, progress] :
       {std::pair{NLMSG_DONE, Progress::Done}, std::pair{NLMSG_ERROR, Progress::Failed}}) {
    Bytes bytes;
    nlmsghdr header{};
    header.nlmsg_len = sizeof header;
    header.nlmsg_type = static_cast<std::uint16_t>(type);
    header.nlmsg_seq = 7;
    Append(bytes, header);
    EXPECT_EQ(SocketDiagnostics::TakeUp(bytes, 7, sockets), progress);
  }
}

TEST(LinuxSocketDiagnostics, A_datagram_cut_at_any_length_is_read_no_further_than_it_goes) {
  const Bytes whole = Datagram(Message(AF_INET6, 10), V6OnlyAttribute(0));
  for (std::size_t length = 0; length < whole.size(); ++length) {
    // In memory of exactly this size, so that a checker sees a read past its end.
    const Bytes cut(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length));
    std::vector<TcpSocket> sockets;
    SocketDiagnostics::TakeUp(cut, 7, sockets);
    EXPECT_TRUE(sockets.empty()) << length;
  }
}

TEST(LinuxSocketDiagnostics, Lengths_that_lie_end_the_answer_and_attributes_that_lie_are_not_followed) {
  std::vector<TcpSocket> sockets;
  for (const std::uint32_t length : {0u, 1u, 15u, 0xFFFFFFFFu}) {
    Bytes bytes = Datagram(Message4());
    std::memcpy(bytes.data(), &length, 4);
    EXPECT_EQ(SocketDiagnostics::TakeUp(bytes, 7, sockets), Progress::Failed) << length;
  }
  for (const std::uint16_t length : {0, 1, 3, 4, 0xFFFF}) {
    Bytes attributes = V6OnlyAttribute(0);
    std::memcpy(attributes.data(), &length, 2);
    if (length != 4) {
      EXPECT_TRUE(SocketsOf(Datagram(Message(AF_INET6, 10), attributes)).empty()) << length;
    }
  }
}

TEST(LinuxSocketDiagnostics, Attributes_cut_at_any_length_are_read_no_further_than_they_go) {
  const Bytes whole = V6OnlyAttribute(0);
  const std::size_t valueAt = 12;
  for (std::size_t length = 0; length <= valueAt; ++length) {
    const Bytes cut(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length));
    EXPECT_TRUE(SocketsOf(Datagram(Message(AF_INET6, 10), cut)).empty()) << length;
  }
}

TEST(LinuxSocketDiagnostics, The_kernel_answers_twice_on_one_object) {
  SocketDiagnostics diagnostics;
  std::vector<TcpSocket> sockets;
  EXPECT_TRUE(diagnostics.Read(sockets));
  EXPECT_TRUE(diagnostics.Read(sockets));
}

} // namespace

} // namespace quendra::platform::linux_
