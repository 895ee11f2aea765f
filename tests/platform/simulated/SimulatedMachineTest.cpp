#include "platform/simulated/SimulatedMachineFixture.h"

namespace quendra::platform::simulated {

TEST_F(SimulatedMachineTest, The_clock_moves_by_what_is_slept_and_by_what_the_test_says_and_wraps) {
  machine.SetTick(0xFFFFFFF0);

  operations.system.Sleep(6);
  EXPECT_EQ(operations.system.GetTickCount(), 0xFFFFFFF6U);
  machine.AdvanceTick(20);

  EXPECT_EQ(operations.system.GetTickCount(), 10U);
}

TEST_F(SimulatedMachineTest, A_version_that_cannot_be_had_leaves_the_record) {
  machine.system.FailVersion = true;
  OsVersion version{1, 4, 10};

  EXPECT_FALSE(operations.system.GetVersionExA(version));

  EXPECT_EQ(version.majorVersion, 4U);
}

TEST_F(SimulatedMachineTest, Started_command_lines_are_recorded_with_their_window) {
  EXPECT_TRUE(operations.shellStart.Shell("regsvr32.exe -s \"packetvb.dll\"", ShellStart::kNormalWindow));

  EXPECT_EQ(machine.Calls, Lines{"Shell 1 regsvr32.exe -s \"packetvb.dll\""});
}

TEST_F(SimulatedMachineTest, A_socket_gives_what_it_received_piece_by_piece) {
  machine.sockets.Receive(SocketHandle(7), {1, 2, 3});
  machine.sockets.FailReceive(SocketHandle(7));
  std::array<std::uint8_t, 2> buffer{};

  EXPECT_EQ(operations.sockets.recv(SocketHandle(7), buffer, 0), 2);
  EXPECT_EQ(operations.sockets.recv(SocketHandle(7), buffer, 0), 1);
  EXPECT_EQ(buffer[0], 3);
  EXPECT_EQ(operations.sockets.recv(SocketHandle(7), buffer, 0), -1);
  EXPECT_EQ(operations.sockets.recv(SocketHandle(7), buffer, 0), 0);
  EXPECT_EQ(machine.Calls.size(), 4U);
}

} // namespace quendra::platform::simulated
