#include "platform/net/RealSocketsFixture.h"

#include <array>
#include <cstring>

namespace quendra::platform {

namespace {

// The library.

TEST_F(RealSocketsTest, Without_a_start_every_call_fails_with_10093) {
  EXPECT_EQ(sockets.WSACleanup(), 0);
  EXPECT_EQ(NewSocket(), kNoSocket);
  EXPECT_EQ(LastError(), 10093);
  EXPECT_EQ(sockets.closesocket(SocketHandle(1)), kSocketError);
  EXPECT_EQ(LastError(), 10093);
  EXPECT_EQ(sockets.WSACleanup(), kSocketError);
  EXPECT_EQ(LastError(), 10093);
  std::array<std::uint8_t, 64> buffer;
  EXPECT_EQ(sockets.WSAAsyncGetHostByName(Window(), kNameMessage, "localhost", buffer), kNoLookUp);
}

TEST_F(RealSocketsTest, A_handle_that_is_no_socket_fails_with_10038) {
  EXPECT_EQ(sockets.closesocket(SocketHandle(4711)), kSocketError);
  EXPECT_EQ(LastError(), 10038);
  const SocketHandle socket = NewSocket();
  EXPECT_EQ(sockets.closesocket(socket), 0);
  EXPECT_EQ(sockets.closesocket(socket), kSocketError);
}

TEST_F(RealSocketsTest, A_closed_sockets_number_is_not_given_again) {
  const SocketHandle socket = NewSocket();
  sockets.closesocket(socket);
  EXPECT_NE(NewSocket(), socket);
}

TEST_F(RealSocketsTest, The_last_cleanup_closes_all_sockets) {
  sockets.WSAStartup(257);
  const SocketHandle socket = NewSocket();
  sockets.WSACleanup();
  EXPECT_EQ(sockets.bind(socket, At(0)), 0);
  sockets.WSACleanup();
  sockets.WSAStartup(257);
  EXPECT_EQ(sockets.bind(socket, At(0)), kSocketError);
  EXPECT_EQ(LastError(), 10038);
}

TEST_F(RealSocketsTest, Options_have_their_values_and_unknown_ones_fail_with_10042) {
  const SocketHandle socket = NewSocket();
  std::int32_t value = 0;
  EXPECT_EQ(sockets.getsockopt(socket, 0xFFFF, 0x1001, value), 0);
  EXPECT_GT(value, 0);
  EXPECT_EQ(sockets.getsockopt(socket, 0xFFFF, 0x1002, value), 0);
  EXPECT_GT(value, 0);
  EXPECT_EQ(sockets.getsockopt(socket, 0xFFFF, 0x2003, value), 0);
  EXPECT_EQ(value, 65507);
  EXPECT_EQ(sockets.getsockopt(socket, 0xFFFF, 0x7777, value), kSocketError);
  EXPECT_EQ(LastError(), 10042);
  EXPECT_EQ(sockets.setsockopt(NewSocket(2), 0xFFFF, 0x20, 1), 0);
}

// Connecting.

TEST_F(RealSocketsTest, A_connection_is_told_as_10035_then_FD_CONNECT_then_FD_WRITE) {
  const SocketHandle listener = Listen();
  const SocketHandle socket = NewSocket();
  Select(socket);
  EXPECT_EQ(sockets.connect(socket, At(PortOf(listener))), kSocketError);
  EXPECT_EQ(LastError(), kWouldBlock);
  ASSERT_TRUE(Saw(socket, kFdWrite));
  Settle();
  std::erase_if(seen, [&](const Seen& entry) { return entry.socket != socket; });
  EXPECT_EQ(seen, (std::vector<Seen>{{socket, kFdConnect, 0}, {socket, kFdWrite, 0}}));
}

TEST_F(RealSocketsTest, A_refused_connection_is_told_as_FD_CONNECT_with_10061) {
  const SocketHandle listener = Listen();
  const std::uint16_t port = PortOf(listener);
  sockets.closesocket(listener);
  const SocketHandle socket = NewSocket();
  Select(socket);
  EXPECT_EQ(sockets.connect(socket, At(port)), kSocketError);
  EXPECT_EQ(LastError(), kWouldBlock);
  ASSERT_TRUE(Saw(socket, kFdConnect, 10061));
  Settle();
  EXPECT_EQ(seen.size(), 1u);
}

TEST_F(RealSocketsTest, Neither_address_0_nor_port_0_can_be_connected_to) {
  const SocketHandle socket = NewSocket();
  EXPECT_EQ(sockets.connect(socket, {{}, 80}), kSocketError);
  EXPECT_EQ(LastError(), kAddressNotAvailable);
  EXPECT_EQ(sockets.connect(socket, At(0)), kSocketError);
  EXPECT_EQ(LastError(), kAddressNotAvailable);
}

TEST_F(RealSocketsTest, Only_the_events_of_the_mask_are_announced) {
  const SocketHandle listener = Listen();
  const SocketHandle socket = NewSocket();
  Select(socket, kFdConnect);
  sockets.connect(socket, At(PortOf(listener)));
  ASSERT_TRUE(Saw(socket, kFdConnect));
  Settle();
  EXPECT_EQ(Count(socket, kFdWrite), 0);
}

TEST_F(RealSocketsTest, Mask_0_ends_the_announcements) {
  Pair();
  Select(near, 0);
  Send(far, "x");
  Settle();
  EXPECT_TRUE(seen.empty());
}

// Reading.

TEST_F(RealSocketsTest, FD_READ_comes_once_until_a_read_and_again_while_data_remains) {
  Pair();
  Send(far, "abcdef");
  ASSERT_TRUE(Saw(near, kFdRead));
  Send(far, "ghi");
  Settle();
  EXPECT_EQ(Count(near, kFdRead), 1);
  EXPECT_EQ(Read(near, 4), "abcd");
  ASSERT_TRUE(Until([&] { return Count(near, kFdRead) == 2; }));
  EXPECT_EQ(Read(near, 100), "efghi");
  Settle();
  EXPECT_EQ(Count(near, kFdRead), 2);
}

TEST_F(RealSocketsTest, A_peek_leaves_the_data_and_announces_it_again) {
  Pair();
  Send(far, "abc");
  ASSERT_TRUE(Saw(near, kFdRead));
  EXPECT_EQ(Read(near, 2, 2), "ab");
  ASSERT_TRUE(Until([&] { return Count(near, kFdRead) == 2; }));
  EXPECT_EQ(Read(near, 10), "abc");
}

TEST_F(RealSocketsTest, A_read_with_nothing_waiting_fails_with_10035) {
  Pair();
  EXPECT_EQ(Read(near, 10), "error 10035");
}

TEST_F(RealSocketsTest, FIONREAD_tells_the_bytes_of_a_stream) {
  Pair();
  Send(far, "abc");
  ASSERT_TRUE(Saw(near, kFdRead));
  std::uint32_t amount = 0;
  EXPECT_EQ(sockets.ioctlsocket(near, 0x4004667F, amount), 0);
  EXPECT_EQ(amount, 3u);
  EXPECT_EQ(sockets.ioctlsocket(near, 1, amount), kSocketError);
  EXPECT_EQ(LastError(), kInvalidArgument);
}

TEST_F(RealSocketsTest, FD_CLOSE_comes_once_and_behind_the_last_data) {
  Pair();
  Send(far, "abcdef");
  sockets.closesocket(far);
  ASSERT_TRUE(Saw(near, kFdRead));
  Settle();
  EXPECT_EQ(Count(near, kFdClose), 0);
  EXPECT_EQ(Read(near, 4), "abcd");
  ASSERT_TRUE(Until([&] { return Count(near, kFdRead) == 2; }));
  EXPECT_EQ(Count(near, kFdClose), 0);
  EXPECT_EQ(Read(near, 4), "ef");
  ASSERT_TRUE(Saw(near, kFdClose));
  EXPECT_EQ(Read(near, 4), "");
  Settle();
  EXPECT_EQ(Count(near, kFdClose), 1);
}

TEST_F(RealSocketsTest, A_reset_is_told_as_FD_CLOSE_with_10054_behind_the_last_data) {
  Pair();
  Send(near, "unread, so that the close is a reset");
  ASSERT_TRUE(Saw(far, kFdRead));
  Send(far, "abc");
  sockets.closesocket(far);
  ASSERT_TRUE(Saw(near, kFdRead));
  Settle();
  EXPECT_EQ(Read(near, 10), "abc");
  EXPECT_TRUE(Saw(near, kFdClose, 10054));
}

// Writing.

TEST_F(RealSocketsTest, FD_WRITE_comes_after_a_refused_send_when_there_is_room_again) {
  Pair();
  const std::string block(1'000'000, 'x');
  while (Send(near, block) > 0) {
  }
  EXPECT_EQ(LastError(), kWouldBlock);
  Settle();
  EXPECT_EQ(Count(near, kFdWrite), 0);
  std::int64_t read = 0;
  ASSERT_TRUE(Until([&] {
    read += static_cast<std::int64_t>(Read(far, 1'000'000).size());
    return Count(near, kFdWrite) == 1;
  }));
  EXPECT_GT(Send(near, "more"), 0);
  Settle();
  EXPECT_EQ(Count(near, kFdWrite), 1);
}

TEST_F(RealSocketsTest, A_send_to_a_connection_that_was_reset_fails_without_a_signal) {
  Pair();
  Send(near, "unread");
  ASSERT_TRUE(Saw(far, kFdRead));
  sockets.closesocket(far);
  ASSERT_TRUE(Saw(near, kFdClose, 10054));
  EXPECT_EQ(Send(near, "x"), kSocketError);
  EXPECT_EQ(LastError(), 10054);
}

// Accepting.

TEST_F(RealSocketsTest, FD_ACCEPT_comes_once_until_accept_and_again_while_connections_wait) {
  const SocketHandle listener = Listen();
  for (int i = 0; i < 2; ++i) {
    const SocketHandle socket = NewSocket();
    Select(socket, kFdConnect);
    sockets.connect(socket, At(PortOf(listener)));
    ASSERT_TRUE(Saw(socket, kFdConnect));
  }
  Settle();
  EXPECT_EQ(Count(listener, kFdAccept), 1);
  EXPECT_NE(sockets.accept(listener), kNoSocket);
  ASSERT_TRUE(Until([&] { return Count(listener, kFdAccept) == 2; }));
  EXPECT_NE(sockets.accept(listener), kNoSocket);
  Settle();
  EXPECT_EQ(Count(listener, kFdAccept), 2);
  EXPECT_EQ(sockets.accept(listener), kNoSocket);
  EXPECT_EQ(LastError(), kWouldBlock);
}

TEST_F(RealSocketsTest, An_accepted_socket_has_its_listeners_selection) {
  const SocketHandle listener = Listen();
  const SocketHandle socket = NewSocket();
  Select(socket);
  sockets.connect(socket, At(PortOf(listener)));
  ASSERT_TRUE(Saw(socket, kFdConnect));
  Send(socket, "early");
  ASSERT_TRUE(Saw(listener, kFdAccept));
  const SocketHandle accepted = sockets.accept(listener);
  EXPECT_TRUE(Saw(accepted, kFdRead));
  EXPECT_EQ(Read(accepted, 10), "early");
}

TEST_F(RealSocketsTest, Both_ends_know_each_others_address) {
  Pair();
  SocketAddress local;
  SocketAddress peer;
  EXPECT_EQ(sockets.getsockname(near, local), 0);
  EXPECT_EQ(sockets.getpeername(far, peer), 0);
  EXPECT_EQ(local, peer);
  EXPECT_EQ(sockets.getpeername(NewSocket(), peer), kSocketError);
  EXPECT_EQ(LastError(), 10057);
}

TEST_F(RealSocketsTest, A_port_in_use_is_refused_with_10048) {
  const SocketHandle listener = Listen();
  EXPECT_EQ(sockets.bind(NewSocket(), At(PortOf(listener))), kSocketError);
  EXPECT_EQ(LastError(), 10048);
}

// Datagrams.

TEST_F(RealSocketsTest, A_datagram_is_announced_measured_and_read_with_its_sender) {
  const SocketHandle receiver = NewSocket(2);
  const SocketHandle sender = NewSocket(2);
  sockets.bind(receiver, At(0));
  sockets.bind(sender, At(0));
  Select(receiver);
  const std::array<std::uint8_t, 5> bytes{1, 2, 3, 4, 5};
  EXPECT_EQ(sockets.sendto(sender, bytes, 0, At(PortOf(receiver))), 5);
  EXPECT_EQ(sockets.sendto(sender, bytes, 0, At(PortOf(receiver))), 5);
  ASSERT_TRUE(Saw(receiver, kFdRead));
  std::uint32_t amount = 0;
  sockets.ioctlsocket(receiver, 0x4004667F, amount);
  EXPECT_EQ(amount, 5u);
  std::array<std::uint8_t, 10> buffer{};
  SocketAddress from;
  EXPECT_EQ(sockets.recvfrom(receiver, buffer, 2, from), 5);
  EXPECT_EQ(sockets.recvfrom(receiver, buffer, 0, from), 5);
  EXPECT_EQ(from, At(PortOf(sender)));
  // The second one fills a shorter buffer and is gone.
  EXPECT_EQ(sockets.recvfrom(receiver, std::span(buffer).first(3), 0, from), kSocketError);
  EXPECT_EQ(LastError(), kMessageTooLong);
  EXPECT_EQ(sockets.recvfrom(receiver, buffer, 0, from), kSocketError);
  EXPECT_EQ(LastError(), kWouldBlock);
}

TEST_F(RealSocketsTest, A_datagram_to_a_port_where_nobody_listens_does_not_stop_the_socket) {
  const SocketHandle other = NewSocket(2);
  sockets.bind(other, At(0));
  const std::uint16_t closed = PortOf(other);
  sockets.closesocket(other);
  const SocketHandle socket = NewSocket(2);
  sockets.bind(socket, At(0));
  Select(socket);
  const std::array<std::uint8_t, 1> byte{7};
  sockets.sendto(socket, byte, 0, At(closed));
  Settle();
  EXPECT_EQ(sockets.sendto(socket, byte, 0, At(PortOf(socket))), 1);
  EXPECT_TRUE(Saw(socket, kFdRead));
}

// Closing.

TEST_F(RealSocketsTest, A_closed_socket_announces_nothing_more) {
  Pair();
  Send(far, "x");
  sockets.closesocket(near);
  Settle();
  EXPECT_EQ(Count(near, kFdRead), 0);
  EXPECT_EQ(Count(near, kFdClose), 0);
}

} // namespace

} // namespace quendra::platform
