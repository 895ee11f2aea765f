#include "platform/simulated/SimulatedMachineFixture.h"

namespace quendra::platform::simulated {

namespace {

struct NativeHandlesTest : SimulatedMachineTest {
  NativeHandlesTest() { machine.AddProcess({.id = 100, .name = "a.exe"}); }

  Handle Duplicate(std::uint16_t handle) {
    const Handle process = operations.processes.OpenProcess(0x40, false, 100);
    Handle duplicate = kNoHandle;
    operations.handles.DuplicateHandle(process, Handle(handle), kInvalidHandle, duplicate, 0x101F0000, false,
                                       0);
    operations.processes.CloseHandle(process);
    return duplicate;
  }
  std::uint32_t returned = 0;
};

} // namespace

TEST_F(NativeHandlesTest, A_buffer_too_small_gets_the_count_and_the_mismatch) {
  machine.AddHandle({.pid = 100, .handle = 8, .deviceName = u"\\Device\\Tcp"});
  machine.AddHandle({.pid = 100, .handle = 12, .deviceName = u"\\Device\\Udp"});
  Bytes buffer(20);

  EXPECT_EQ(operations.handles.NtQuerySystemInformation(16, buffer, returned), 0xC0000004U);
  EXPECT_EQ(Little32(buffer, 0), 2U);
  EXPECT_EQ(returned, 36U);

  buffer.assign(36, 0);
  EXPECT_EQ(operations.handles.NtQuerySystemInformation(16, buffer, returned), 0U);
  EXPECT_EQ(Little32(buffer, 4 + 16), 100U);
  EXPECT_EQ(buffer[4 + 16 + 6], 12);
}

TEST_F(NativeHandlesTest, Handles_may_appear_between_two_queries) {
  machine.handles.AppearAfterNextQuery({{.pid = 100, .handle = 8}, {.pid = 100, .handle = 12}});
  Bytes buffer(20);

  EXPECT_EQ(operations.handles.NtQuerySystemInformation(16, buffer, returned), 0U);
  EXPECT_EQ(Little32(buffer, 0), 0U);
  EXPECT_EQ(operations.handles.NtQuerySystemInformation(16, buffer, returned), 0xC0000004U);
  EXPECT_EQ(Little32(buffer, 0), 2U);
}

TEST_F(NativeHandlesTest, A_name_of_11_characters_just_fits_into_32_bytes) {
  machine.AddHandle({.pid = 100, .handle = 8, .deviceName = u"\\Device\\Tcp"});
  machine.AddHandle({.pid = 100, .handle = 12, .deviceName = u"\\Device\\Tcpx"});
  Bytes buffer(32);

  EXPECT_EQ(operations.handles.NtQueryObject(Duplicate(8), 1, buffer, returned), 0U);
  EXPECT_EQ(buffer[0], 22);
  EXPECT_EQ(buffer[8], '\\');
  EXPECT_NE(operations.handles.NtQueryObject(Duplicate(12), 1, buffer, returned), 0U);
}

TEST_F(NativeHandlesTest, The_transport_driver_answers_the_port_in_network_order) {
  machine.AddHandle({.pid = 100, .handle = 8, .deviceName = u"\\Device\\Tcp", .port = 0x1234});
  std::array<std::uint8_t, 24> input{};
  std::array<std::uint8_t, 52> output{};
  const Handle duplicate = Duplicate(8);

  EXPECT_NE(operations.handles.NtDeviceIoControlFile(duplicate, Handle(), 0x210012, input, output), 0U);
  input[16] = 3;
  EXPECT_EQ(operations.handles.NtDeviceIoControlFile(duplicate, Handle(), 0x210012, input, output), 0U);
  EXPECT_EQ(output[12], 0x12);
  EXPECT_EQ(output[13], 0x34);
  EXPECT_NE(operations.handles.NtDeviceIoControlFile(duplicate, Handle(), 0x210013, input, output), 0U);
}

TEST_F(NativeHandlesTest, A_handle_is_not_duplicated_when_told_so) {
  machine.AddHandle({.pid = 100, .handle = 8, .duplicable = false});

  EXPECT_EQ(Duplicate(8), kNoHandle);
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

} // namespace quendra::platform::simulated
