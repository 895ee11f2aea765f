#include "platform/simulated/net/SimulatedSockets.h"
#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

namespace quendra::platform::simulated {

namespace {

using Lines = std::vector<std::string>;

/// A machine with one window that writes down each message as "socket event error".
class SimulatedSocketsTest : public testing::Test {
 protected:
  SimulatedSocketsTest() {
    window_ = desktop.Windows.Create();
    using Procedure = forms::WindowProcedure::element_type;
    desktop.Windows.Replace(
        window_,
        std::make_shared<Procedure>([this](auto, std::uint32_t, std::uint32_t wParam, std::uint32_t lParam) {
          seen.push_back(std::to_string(wParam) + " " + std::to_string(lParam & 0xFFFF) + " " +
                         std::to_string(lParam >> 16));
          return 0;
        }));
    net.WSAStartup(257);
  }
  SocketHandle NewSocket(std::int32_t type = 1) {
    const SocketHandle socket = net.socket(2, type, type == 1 ? 6 : 17);
    net.WSAAsyncSelect(socket, window_, 32769, 59);
    return socket;
  }
  SocketHandle Connected() {
    const SocketHandle socket = NewSocket();
    net.connect(socket, {AddressOf("10.1.1.1"), 80});
    desktop.RunUntilIdle();
    seen.clear();
    return socket;
  }
  std::int32_t Read(SocketHandle socket, std::size_t size) {
    std::vector<std::uint8_t> buffer(size);
    return net.recv(socket, buffer, 0);
  }
  std::string Line(SocketHandle socket, int event, int error = 0) {
    return std::to_string(socket.Value()) + " " + std::to_string(event) + " " + std::to_string(error);
  }

  forms::headless::HeadlessDesktop desktop;
  SimulatedMachine machine{desktop};
  SimulatedSockets& net = machine.sockets;
  SimulatedServer& server = net.Listen("10.1.1.1", 80);
  Lines seen;

 private:
  forms::WindowHandle window_;
};

TEST_F(SimulatedSocketsTest, A_connection_is_told_as_FD_CONNECT_then_FD_WRITE) {
  const SocketHandle socket = NewSocket();
  EXPECT_EQ(net.connect(socket, {AddressOf("10.1.1.1"), 80}), kSocketError);
  EXPECT_EQ(net.WSAGetLastError(), kWouldBlock);
  desktop.RunUntilIdle();
  EXPECT_EQ(seen, (Lines{Line(socket, 16), Line(socket, 2)}));
}

TEST_F(SimulatedSocketsTest, A_server_refuses_with_the_number_told_or_stays_silent) {
  server.Refuse();
  const SocketHandle first = Connected();
  server.Refuse(10065);
  const SocketHandle second = NewSocket();
  net.connect(second, {AddressOf("10.1.1.1"), 80});
  desktop.RunUntilIdle();
  EXPECT_EQ(seen, Lines{Line(second, 16, 10065)});
  server.StaySilent();
  net.connect(first, {AddressOf("10.1.1.1"), 80});
  desktop.RunUntilIdle();
  EXPECT_EQ(seen.size(), 1u);
}

TEST_F(SimulatedSocketsTest, FD_READ_comes_once_until_a_read_and_again_while_data_remains) {
  const SocketHandle socket = Connected();
  server.Connections[0]->Send("abc");
  server.Connections[0]->Send("def");
  desktop.RunUntilIdle();
  EXPECT_EQ(seen, Lines{Line(socket, 1)});
  EXPECT_EQ(Read(socket, 4), 4);
  desktop.RunUntilIdle();
  EXPECT_EQ(seen.size(), 2u);
  EXPECT_EQ(Read(socket, 4), 2);
  desktop.RunUntilIdle();
  EXPECT_EQ(seen.size(), 2u);
  EXPECT_EQ(Read(socket, 4), kSocketError);
  EXPECT_EQ(net.WSAGetLastError(), kWouldBlock);
}

TEST_F(SimulatedSocketsTest, The_end_is_told_once_and_behind_the_last_data) {
  const SocketHandle socket = Connected();
  server.Connections[0]->Send("abc");
  server.Connections[0]->Close();
  desktop.RunUntilIdle();
  EXPECT_EQ(seen, Lines{Line(socket, 1)});
  EXPECT_EQ(Read(socket, 10), 3);
  desktop.RunUntilIdle();
  EXPECT_EQ(seen.back(), Line(socket, 32));
  EXPECT_EQ(Read(socket, 10), 0);
  desktop.RunUntilIdle();
  EXPECT_EQ(seen.size(), 2u);
}

TEST_F(SimulatedSocketsTest, A_send_that_is_refused_is_followed_by_FD_WRITE) {
  server.TakeAtMost(3);
  const SocketHandle socket = Connected();
  const std::array<std::uint8_t, 5> bytes{};
  EXPECT_EQ(net.send(socket, bytes, 0), 3);
  desktop.RunUntilIdle();
  EXPECT_TRUE(seen.empty());
  EXPECT_EQ(net.send(socket, bytes, 0), kSocketError);
  EXPECT_EQ(net.WSAGetLastError(), kWouldBlock);
  desktop.RunUntilIdle();
  EXPECT_EQ(seen, Lines{Line(socket, 2)});
}

TEST_F(SimulatedSocketsTest, A_server_that_echoes_sends_back_what_came) {
  server.Echo();
  const SocketHandle socket = Connected();
  const std::array<std::uint8_t, 5> bytes{1, 2, 3, 4, 5};
  net.send(socket, bytes, 0);
  desktop.RunUntilIdle();
  EXPECT_EQ(Read(socket, 10), 5);
}

TEST_F(SimulatedSocketsTest, An_operation_told_to_fail_does_so_as_often_as_told) {
  net.Fail("bind", 10013, 2);
  const SocketHandle socket = NewSocket();
  EXPECT_EQ(net.bind(socket, {}), kSocketError);
  EXPECT_EQ(net.WSAGetLastError(), 10013);
  EXPECT_EQ(net.bind(socket, {}), kSocketError);
  EXPECT_EQ(net.bind(socket, {}), 0);
  EXPECT_EQ(net.Count("bind"), 3);
}

TEST_F(SimulatedSocketsTest, An_address_that_is_not_the_machines_own_can_not_be_bound) {
  EXPECT_EQ(net.bind(NewSocket(), {AddressOf("10.1.1.1"), 0}), kSocketError);
  EXPECT_EQ(net.WSAGetLastError(), kAddressNotAvailable);
}

TEST_F(SimulatedSocketsTest, Ports_given_by_the_machine_run_from_1025_to_5000_and_around) {
  SocketAddress local;
  std::uint16_t last = 0;
  for (int i = 0; i < 4000; ++i) {
    const SocketHandle socket = NewSocket();
    net.bind(socket, {});
    net.getsockname(socket, local);
    ASSERT_GE(local.port, 1025);
    ASSERT_LE(local.port, 5000);
    ASSERT_NE(local.port, last);
    last = local.port;
    net.closesocket(socket);
  }
}

TEST_F(SimulatedSocketsTest, A_look_up_that_never_answers_can_be_cancelled) {
  net.NeverAnswer("silent");
  std::array<std::uint8_t, 1024> buffer{};
  const LookUpHandle lookUp = net.WSAAsyncGetHostByName(WindowHandle(1), 32768, "silent", buffer);
  desktop.RunUntilIdle();
  EXPECT_EQ(net.LookUpsUnderWay(), 1);
  EXPECT_EQ(net.WSACancelAsyncRequest(lookUp), 0);
  EXPECT_EQ(net.WSACancelAsyncRequest(lookUp), kSocketError);
}

TEST_F(SimulatedSocketsTest, Handles_that_are_no_socket_fail_with_10038) {
  EXPECT_EQ(net.closesocket(SocketHandle(77)), kSocketError);
  EXPECT_EQ(net.WSAGetLastError(), kNotASocket);
  EXPECT_EQ(net.WSAAsyncSelect(SocketHandle(77), WindowHandle(1), 2, 3), kSocketError);
}

TEST(SimulatedSocketsWithoutALoop, Any_handle_is_taken_and_the_library_starts_and_ends) {
  SimulatedMachine machine;
  EXPECT_EQ(machine.sockets.WSAStartup(257), 0);
  EXPECT_EQ(machine.sockets.closesocket(SocketHandle(77)), 0);
  EXPECT_EQ(machine.sockets.WSAAsyncSelect(SocketHandle(77), WindowHandle(1), 2, 3), 0);
  EXPECT_EQ(machine.sockets.WSACleanup(), 0);
  EXPECT_EQ(machine.sockets.WSACleanup(), 0);
}

TEST(SimulatedSocketsWithoutALoop, Work_that_waits_in_the_loop_outlives_the_machine) {
  forms::headless::HeadlessDesktop desktop;
  {
    SimulatedMachine machine(desktop);
    machine.sockets.WSAStartup(257);
    const SocketHandle socket = machine.sockets.socket(2, 1, 6);
    machine.sockets.connect(socket, {AddressOf("127.0.0.1"), 80});
  }
  desktop.RunUntilIdle();
  EXPECT_FALSE(desktop.Ended);
}

} // namespace

} // namespace quendra::platform::simulated
