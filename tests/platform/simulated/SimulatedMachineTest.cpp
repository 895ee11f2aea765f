#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace quendra::platform::simulated {
namespace {

using Lines = std::vector<std::string>;
using Bytes = std::vector<std::uint8_t>;

struct SimulatedMachineTest : testing::Test {
  SimulatedMachine machine;
  Machine operations = machine.Operations();
};

// Processes.

TEST_F(SimulatedMachineTest, A_snapshot_stands_still_while_processes_come_and_go) {
  machine.AddProcess({.id = 4, .name = "System"});
  machine.AddProcess({.id = 8, .parent = 4, .name = "smss.exe"});
  const Handle snapshot = operations.processes.CreateToolhelp32Snapshot(2, 0);

  machine.EndProcess(4);
  machine.AddProcess({.id = 12, .name = "late.exe"});

  Processes::Entry entry;
  ASSERT_TRUE(operations.processes.Process32First(snapshot, entry));
  EXPECT_EQ(entry.processId, 4U);
  ASSERT_TRUE(operations.processes.Process32Next(snapshot, entry));
  EXPECT_EQ(entry.parentProcessId, 4U);
  EXPECT_FALSE(operations.processes.Process32Next(snapshot, entry));
}

TEST_F(SimulatedMachineTest, Snapshots_fail_when_told_to) {
  machine.processes.FailSnapshots = true;

  EXPECT_EQ(operations.processes.CreateToolhelp32Snapshot(2, 0), kInvalidHandle);
}

TEST_F(SimulatedMachineTest, Handles_that_were_not_closed_are_counted) {
  machine.AddProcess({.id = 4, .name = "System"});
  const Handle snapshot = operations.processes.CreateToolhelp32Snapshot(2, 0);
  const Handle process = operations.processes.OpenProcess(1040, false, 4);
  EXPECT_EQ(machine.processes.OpenHandles(), 2);

  operations.processes.CloseHandle(snapshot);
  operations.processes.CloseHandle(process);
  operations.processes.CloseHandle(process);

  EXPECT_EQ(machine.processes.OpenHandles(), 0);
  EXPECT_EQ(machine.processes.VainCloses, 1);
}

TEST_F(SimulatedMachineTest, Opening_a_chosen_process_fails_with_the_scripted_answer) {
  machine.AddProcess({.id = 4, .name = "System"});
  machine.processes.FailOpen(4, kInvalidHandle);

  EXPECT_EQ(operations.processes.OpenProcess(0x40, false, 4), kInvalidHandle);
  EXPECT_EQ(operations.processes.GetLastError(), 5U);
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

TEST_F(SimulatedMachineTest, A_process_without_a_path_has_no_modules) {
  machine.AddProcess({.id = 4, .name = "System"});
  const Handle process = operations.processes.OpenProcess(1040, false, 4);
  std::array<ModuleHandle, 50> modules{};

  EXPECT_FALSE(operations.processes.EnumProcessModules(process, modules));
}

TEST_F(SimulatedMachineTest, A_name_longer_than_its_field_is_cut) {
  machine.AddProcess({.id = 4, .name = std::string(400, 'n')});
  Processes::Entry entry;

  operations.processes.Process32First(operations.processes.CreateToolhelp32Snapshot(2, 0), entry);

  EXPECT_EQ(std::string(entry.exeFile.data()).size(), 259U);
}

// Tokens.

TEST_F(SimulatedMachineTest, Each_step_of_a_privilege_fails_with_its_scripted_error) {
  Handle token = kNoHandle;
  std::uint64_t luid = 0;
  std::array<std::uint8_t, 16> previous{};
  machine.tokens.OpenProcessTokenError = 5;
  EXPECT_FALSE(operations.tokens.OpenProcessToken(kInvalidHandle, 40, token));
  EXPECT_EQ(operations.processes.GetLastError(), 5U);

  machine.tokens.OpenProcessTokenError = 0;
  EXPECT_TRUE(operations.tokens.OpenProcessToken(kInvalidHandle, 40, token));
  machine.tokens.LookupPrivilegeValueError = 1313;
  EXPECT_FALSE(operations.tokens.LookupPrivilegeValueA("", "SeDebugPrivilege", luid));
  EXPECT_EQ(operations.processes.GetLastError(), 1313U);

  machine.tokens.LookupPrivilegeValueError = 0;
  EXPECT_TRUE(operations.tokens.LookupPrivilegeValueA("", "SeDebugPrivilege", luid));
  machine.tokens.AdjustTokenPrivilegesError = 1300;
  EXPECT_TRUE(operations.tokens.AdjustTokenPrivileges(token, false, luid, 2, previous));
  EXPECT_EQ(operations.processes.GetLastError(), 1300U);
  EXPECT_TRUE(machine.tokens.Adjusted.empty());

  machine.tokens.AdjustTokenPrivilegesError = 0;
  EXPECT_TRUE(operations.tokens.AdjustTokenPrivileges(token, false, luid, 2, previous));
  EXPECT_EQ(machine.tokens.Adjusted, Lines{"SeDebugPrivilege 2"});
}

// Version blocks.

TEST_F(SimulatedMachineTest, A_version_block_has_its_texts_under_language_and_code_page) {
  machine.AddVersionBlock("C:\\a.exe", {0x0D, 0x04, 0xE7, 0x04}, {{"ProductName", "Product"}});
  Bytes block(operations.versionInfo.GetFileVersionInfoSizeA("C:\\a.exe"));
  ASSERT_TRUE(operations.versionInfo.GetFileVersionInfoA("C:\\a.exe", block));

  const auto product =
      operations.versionInfo.VerQueryValueA(block, "\\StringFileInfo\\040D04E7\\ProductName");

  ASSERT_TRUE(product);
  EXPECT_EQ(std::string(product->begin(), product->end()), std::string("Product\0", 8));
  EXPECT_FALSE(operations.versionInfo.VerQueryValueA(block, "\\StringFileInfo\\040904B0\\ProductName"));
  EXPECT_FALSE(operations.versionInfo.VerQueryValueA(block, "\\StringFileInfo\\040D04E7\\CompanyName"));
  EXPECT_EQ(machine.versionInfo.Queries.size(), 3U);
}

TEST_F(SimulatedMachineTest, A_short_translation_names_a_table_with_zeros_in_place_of_what_it_lacks) {
  machine.AddVersionBlock("C:\\a.exe", {0x0D, 0x04}, {{"ProductName", "Product"}});
  Bytes block(operations.versionInfo.GetFileVersionInfoSizeA("C:\\a.exe"));
  ASSERT_TRUE(operations.versionInfo.GetFileVersionInfoA("C:\\a.exe", block));

  EXPECT_EQ(operations.versionInfo.VerQueryValueA(block, "\\VarFileInfo\\Translation"), (Bytes{0x0D, 0x04}));
  EXPECT_TRUE(operations.versionInfo.VerQueryValueA(block, "\\StringFileInfo\\040D0000\\ProductName"));
}

TEST_F(SimulatedMachineTest, A_block_that_cannot_be_read_has_a_size_all_the_same) {
  machine.AddVersionBlock("C:\\a.exe", {}, {});
  machine.versionInfo.FailReading("C:\\a.exe");
  Bytes block(operations.versionInfo.GetFileVersionInfoSizeA("C:\\a.exe"));

  EXPECT_GT(block.size(), 0U);
  EXPECT_FALSE(operations.versionInfo.GetFileVersionInfoA("C:\\a.exe", block));
}

// Icons.

TEST_F(SimulatedMachineTest, Icons_that_were_not_destroyed_are_counted) {
  machine.SetIcon("C:\\a.exe", {1, 2, 3});

  const Handle icon = operations.icons.ExtractIconExA("C:\\a.exe", 0);
  EXPECT_EQ(operations.icons.ImageOf(icon), (Bytes{1, 2, 3}));
  EXPECT_EQ(operations.icons.ExtractIconExA("C:\\a.exe", 1), kNoHandle);
  EXPECT_EQ(machine.icons.Live(), 1);
  EXPECT_TRUE(operations.icons.DestroyIcon(icon));

  EXPECT_EQ(machine.icons.Live(), 0);
  EXPECT_EQ(machine.icons.Destroyed, 1);
}

// The native interface.

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

// The IP helper.

TEST_F(SimulatedMachineTest, Connections_stand_in_the_table_as_they_lie_in_memory) {
  machine.AddConnection({.state = 5,
                         .localAddress = "10.0.0.7",
                         .localPort = 40000,
                         .remoteAddress = "192.168.1.254",
                         .remotePort = 80,
                         .owner = 1234});
  IpHelper::TcpTable table;

  ASSERT_EQ(operations.ipHelper.AllocateAndGetTcpExTableFromStack(table), 0U);

  EXPECT_EQ(*table, (Bytes{1, 0, 0,   0,   5, 0,   0, 0,  10, 0, 0,    7,    0x9C, 0x40,
                           0, 0, 192, 168, 1, 254, 0, 80, 0,  0, 0xD2, 0x04, 0,    0}));
}

TEST_F(SimulatedMachineTest, A_failing_table_leaves_the_one_before) {
  IpHelper::TcpTable table;
  operations.ipHelper.AllocateAndGetTcpExTableFromStack(table);
  const auto before = table;
  machine.ipHelper.TableError = IpHelper::kErrorNotSupported;

  EXPECT_EQ(operations.ipHelper.AllocateAndGetTcpExTableFromStack(table), 50U);

  EXPECT_EQ(table, before);
}

TEST_F(SimulatedMachineTest, Deleted_connections_are_kept) {
  std::array<std::uint8_t, 20> record{12};

  EXPECT_EQ(operations.ipHelper.SetTcpEntry(record), 0U);

  ASSERT_EQ(machine.ipHelper.Deleted.size(), 1U);
  EXPECT_EQ(machine.ipHelper.Deleted[0], record);
}

TEST_F(SimulatedMachineTest, A_text_that_is_no_address_is_zero) {
  for (const char* text : {"", "1.2.3", "1.2.3.256", "a.b.c.d", "1,2,3,4"})
    EXPECT_EQ(AddressOf(text), Ipv4Address()) << text;
  EXPECT_EQ(AddressOf("1.2.3.4").InMemory(), 0x04030201U);
}

TEST_F(SimulatedMachineTest, Host_names_fail_when_told_to) {
  machine.hostNames.Addresses = {"127.0.0.1"};
  EXPECT_TRUE(operations.hostNames.gethostbyname("subscriber"));
  EXPECT_FALSE(operations.hostNames.gethostbyname("other"));
  machine.hostNames.FailAddresses = true;
  machine.hostNames.FailName = true;

  EXPECT_FALSE(operations.hostNames.gethostbyname("subscriber"));
  EXPECT_FALSE(operations.hostNames.gethostname());
}

// Capture.

struct SimulatedCaptureTest : SimulatedMachineTest {
  static constexpr const char* kAdapter = "\\Device\\NPF_{1}";
  SimulatedCaptureTest() { machine.AddCaptureAdapter({kAdapter, "Ethernet", "10.0.0.7"}); }
  std::int32_t result = 0;
  FrameBytes frame;
  CaptureHeader header{};
};

TEST_F(SimulatedCaptureTest, Frames_come_in_the_order_of_their_delivery_and_then_a_blank_one) {
  machine.Deliver(Bytes(60, 1));
  machine.Deliver(Bytes(70, 2), 1500);

  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 60);
  EXPECT_EQ(frame[0], 1);
  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 70);
  EXPECT_EQ(frame.UpperBound(), 69);
  EXPECT_EQ(header[3], 1500U);
  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 0);
  EXPECT_EQ(frame.UpperBound(), 59);
  EXPECT_EQ(frame[59], 0);
}

TEST_F(SimulatedCaptureTest, A_failure_comes_at_its_place_in_the_queue) {
  machine.Deliver(Bytes(60, 1));
  machine.capture.FailCapture(-7);
  machine.Deliver(Bytes(60, 2));

  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 60);
  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), -7);
  EXPECT_EQ(frame[0], 0);
  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 60);
}

TEST_F(SimulatedCaptureTest, The_newest_record_has_a_header_in_host_order_before_its_frame) {
  machine.SetTick(12345);
  machine.Deliver(Bytes(60, 1));
  machine.Deliver(Bytes(70, 2), 1500);
  const auto control = operations.captureControls.Create();
  Bytes buffer(100, 0xEE);

  control->ReadBuffer(buffer);

  EXPECT_EQ(Little32(buffer, 0), 12U);
  EXPECT_EQ(Little32(buffer, 4), 345000U);
  EXPECT_EQ(Little32(buffer, 8), 70U);
  EXPECT_EQ(Little32(buffer, 12), 1500U);
  EXPECT_EQ(buffer[16], 20);
  EXPECT_EQ(buffer[20], 2);
  EXPECT_EQ(buffer[89], 2);
  EXPECT_EQ(buffer[90], 0xEE);
}

TEST_F(SimulatedCaptureTest, Events_come_only_between_their_start_and_stop) {
  const auto control = operations.captureControls.Create();
  int events = 0;
  control->PacketReceived = [&] { ++events; };

  EXPECT_FALSE(machine.SignalPackets());
  control->StartEvents(result);
  EXPECT_TRUE(machine.SignalPackets());
  control->StopEvents(result);
  EXPECT_FALSE(machine.SignalPackets());

  EXPECT_EQ(events, 1);
}

TEST_F(SimulatedCaptureTest, Events_go_on_while_each_takes_frames_and_leaves_some) {
  const auto control = operations.captureControls.Create();
  int events = 0;
  control->PacketReceived = [&] {
    ++events;
    if (events < 3) operations.captureLibrary.vpCapture(frame, header);
  };
  control->StartEvents(result);
  for (int i = 0; i < 5; ++i) machine.Deliver(Bytes(60, 1));

  machine.capture.SignalWhileFramesAreTaken();

  EXPECT_EQ(events, 3);
  EXPECT_EQ(machine.capture.WaitingFrames(), 3);
}

TEST_F(SimulatedCaptureTest, Calls_of_library_control_and_clock_stand_in_one_order) {
  auto control = operations.captureControls.Create();
  operations.captureLibrary.VBPcapInit();
  operations.captureLibrary.vpSetCurrentAdapter(0);
  operations.captureLibrary.vpBegin(1000);
  control->BindAdapter(std::string("\\Device\\NPF_{1}\0\0\0", 18), result);
  control->SetValueA(32);
  operations.system.Sleep(300);
  control.reset();
  operations.captureLibrary.vpEnd();

  EXPECT_EQ(machine.Calls,
            (Lines{"create control", "VBPcapInit", "vpSetCurrentAdapter 0", "vpBegin 1000",
                   "BindAdapter \\Device\\NPF_{1}", "SetValueA 32", "Sleep 300", "drop control", "vpEnd"}));
}

TEST_F(SimulatedCaptureTest, A_new_control_takes_the_place_of_the_one_before) {
  auto first = operations.captureControls.Create();
  auto second = operations.captureControls.Create();
  Lines rung;
  first->PacketReceived = [&] { rung.push_back("first"); };
  second->PacketReceived = [&] { rung.push_back("second"); };
  first->StartEvents(result);
  second->StartEvents(result);

  machine.SignalPackets();
  second.reset();
  machine.SignalPackets();

  EXPECT_EQ(rung, (Lines{"second", "first"}));
  EXPECT_EQ(machine.capture.LiveControls(), 1);
}

TEST_F(SimulatedCaptureTest, Making_a_control_faults_when_told_to) {
  machine.capture.CreateFault = Fault::kCannotCreateObject;

  EXPECT_THROW((void)operations.captureControls.Create(), Fault);

  EXPECT_EQ(machine.capture.LiveControls(), 0);
}

TEST_F(SimulatedCaptureTest, An_adapter_that_is_removed_in_its_session_is_told_of_and_delivers_nothing) {
  std::vector<CaptureLibrary::Availability> told;
  machine.capture.AdapterChanged = [&] { told.push_back(machine.capture.availability()); };
  operations.captureLibrary.vpSetCurrentAdapter(0);
  operations.captureLibrary.vpBegin(1000);
  machine.capture.RemoveAdapter(kAdapter);
  machine.capture.RemoveAdapter(kAdapter);
  machine.Deliver(Bytes(60));
  EXPECT_LT(operations.captureLibrary.vpCapture(frame, header), 0);
  machine.capture.ReturnAdapter(kAdapter);
  machine.Deliver(Bytes(60));
  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 60);
  EXPECT_EQ(told, (std::vector{CaptureLibrary::Availability::AdapterGone,
                               CaptureLibrary::Availability::Available}));
}

TEST_F(SimulatedCaptureTest, An_adapter_that_is_removed_outside_its_session_is_not_told_of) {
  int told = 0;
  machine.capture.AdapterChanged = [&] { ++told; };
  machine.capture.RemoveAdapter(kAdapter);
  EXPECT_EQ(machine.capture.availability(), CaptureLibrary::Availability::Available);
  operations.captureLibrary.vpSetCurrentAdapter(0);
  operations.captureLibrary.vpBegin(1000);
  EXPECT_EQ(machine.capture.availability(), CaptureLibrary::Availability::AdapterGone);
  machine.capture.RemoveAdapter("eth1");
  EXPECT_EQ(told, 0);
}

TEST_F(SimulatedCaptureTest, The_library_gives_the_last_adapters_index_or_what_it_is_told) {
  EXPECT_EQ(operations.captureLibrary.VBPcapInit(), 0);
  machine.capture.InitResult = -1;
  EXPECT_EQ(operations.captureLibrary.VBPcapInit(), -1);
}

TEST(SimulatedMachineLife, A_control_may_outlive_its_machine) {
  std::unique_ptr<CaptureControl> control;
  {
    SimulatedMachine machine;
    control = machine.Operations().captureControls.Create();
  }
  std::int32_t result = 0;
  auto address = Ipv4Address::FromHost(1);
  std::uint32_t second = 1;
  Bytes buffer(30);

  control->StartEvents(result);
  control->ReadBuffer(buffer);
  control->AdapterAddress("x", address, second);

  EXPECT_EQ(address, Ipv4Address());
}

// The rest.

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

} // namespace
} // namespace quendra::platform::simulated
