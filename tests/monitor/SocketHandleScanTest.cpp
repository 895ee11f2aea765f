#include "monitor/MonitorFixture.h"

#include "platform/process/Handles.h"

namespace quendra::monitor {

namespace {

const char16_t* kTcpDevice = u"\\Device\\Tcp";
const char16_t* kUdpDevice = u"\\Device\\Udp";

struct SocketHandles : MonitorFixture {
  SocketHandles() {
    machine.AddProcess({10, 1, "a.exe", ""});
    machine.AddProcess({70000, 1, "b.exe", ""});
    // Two more, so that the table never fits in the first room.
    machine.AddHandle({10, 0x900, u"", 0});
    machine.AddHandle({10, 0x904, u"", 0});
  }
  std::int32_t TcpOwner(std::size_t port) { return procPort.PortOwnerTable[port].tcpOwner; }
  std::int32_t UdpOwner(std::size_t port) { return procPort.PortOwnerTable[port].udpOwner; }
};

/// Native handles whose answers a test makes up; every object has the same name.
struct OddHandles : platform::Handles {
  std::vector<std::uint32_t> TableStatuses{kStatusInfoLengthMismatch, 0};
  std::uint32_t Count = 1;
  std::u16string Name = kTcpDevice;
  std::uint32_t NameStatus = 0;
  std::array<std::uint8_t, 2> Port{0, 80};
  std::uint32_t DriverStatus = 0;

  std::vector<std::size_t> nameRooms;
  std::vector<std::uint8_t> driverInput;
  std::size_t driverOutputSize = 0;
  std::uint32_t controlCode = 0;
  platform::Handle eventOfDriver;
  platform::Handle eventGiven;
  std::string eventAsked;
  platform::Handle target;
  std::uint32_t duplicateAccess = 0;

  std::uint32_t NtQuerySystemInformation(std::uint32_t, std::span<std::uint8_t> buffer,
                                         std::uint32_t&) override {
    const std::uint32_t status = TableStatuses.empty() ? 0 : TableStatuses.front();
    if (!TableStatuses.empty()) TableStatuses.erase(TableStatuses.begin());
    PutLittle32(buffer, 0, Count);
    if (buffer.size() >= 20) {
      PutLittle32(buffer, 4, 10);
      PutLittle16(buffer, 10, 4);
    }
    return status;
  }
  bool DuplicateHandle(platform::Handle, platform::Handle, platform::Handle targetProcess,
                       platform::Handle& duplicate, std::uint32_t access, bool, std::uint32_t) override {
    target = targetProcess;
    duplicateAccess = access;
    duplicate = platform::Handle(0x5000);
    return true;
  }
  std::uint32_t NtQueryObject(platform::Handle, std::uint32_t, std::span<std::uint8_t> buffer,
                              std::uint32_t&) override {
    nameRooms.push_back(buffer.size());
    PutLittle16(buffer, 0, static_cast<std::uint16_t>(Name.size() * 2));
    for (std::size_t i = 0; i < Name.size() && 10 + 2 * i <= buffer.size(); ++i)
      PutLittle16(buffer, 8 + 2 * i, Name[i]);
    return NameStatus;
  }
  platform::Handle CreateEventW(bool manualReset, bool initialState, const std::u16string& name) override {
    eventAsked = std::string(manualReset ? "manual" : "automatic") + (initialState ? " set " : " clear ") +
                 ToUtf8(name);
    return eventGiven;
  }
  std::uint32_t NtDeviceIoControlFile(platform::Handle, platform::Handle event, std::uint32_t code,
                                      std::span<const std::uint8_t> input,
                                      std::span<std::uint8_t> output) override {
    eventOfDriver = event;
    controlCode = code;
    driverInput.assign(input.begin(), input.end());
    driverOutputSize = output.size();
    output[12] = Port[0];
    output[13] = Port[1];
    return DriverStatus;
  }
};

struct OddSocketHandles : MonitorFixture {
  OddHandles handles;
  modProcPort odd{machine.ipHelper, {machine.processes, handles}, desktop, controls.main_ListView1, fileInfo};

  OddSocketHandles() { machine.AddProcess({10, 1, "a.exe", ""}); }
};

} // namespace

// The table of handles.

TEST_F(SocketHandles, The_table_is_asked_for_with_20_bytes_and_then_with_what_its_count_needs) {
  EXPECT_TRUE(procPort.ScanSocketHandles());
  EXPECT_EQ(machine.handles.TableQueries, (std::vector<std::size_t>{20, 2 * 16 + 4}));
}

TEST_F(SocketHandles, The_table_is_asked_for_again_when_handles_were_added_in_between) {
  machine.AddHandle({10, 4, kTcpDevice, 80});
  machine.handles.AppearAfterNextQuery({{10, 8, kTcpDevice, 443}});
  EXPECT_TRUE(procPort.ScanSocketHandles());
  EXPECT_EQ(machine.handles.TableQueries, (std::vector<std::size_t>{20, 52, 20, 68}));
  EXPECT_EQ(TcpOwner(80), 10);
  EXPECT_EQ(TcpOwner(443), 10);
}

TEST(SocketHandlesOfABareMachine, A_table_that_fits_in_20_bytes_is_not_looked_at) {
  platform::simulated::SimulatedMachine machine;
  forms::headless::HeadlessDesktop desktop;
  MonitorControls controls;
  mdlFileInfo fileInfo{machine.processes, machine.tokens, machine.versionInfo, desktop};
  modProcPort procPort{
      machine.ipHelper, {machine.processes, machine.handles}, desktop, controls.main_ListView1, fileInfo};
  machine.AddProcess({10, 1, "a.exe", ""});
  machine.AddHandle({10, 4, kTcpDevice, 80});
  EXPECT_TRUE(procPort.ScanSocketHandles());
  EXPECT_EQ(machine.handles.TableQueries, (std::vector<std::size_t>{20}));
  EXPECT_EQ(procPort.PortOwnerTable[80].tcpOwner, 0);
}

TEST_F(OddSocketHandles, A_second_query_that_fails_otherwise_ends_the_queries_and_its_entries_count) {
  handles.TableStatuses = {1, 0xC0000022};
  EXPECT_TRUE(odd.ScanSocketHandles());
  EXPECT_EQ(odd.PortOwnerTable[80].tcpOwner, 10);
}

TEST_F(OddSocketHandles, A_count_whose_bytes_no_32_bits_hold_is_an_overflow) {
  handles.Count = 0x08000000;
  EXPECT_EQ(FaultNumberOf([&] { odd.ScanSocketHandles(); }), Fault::kOverflow);
}

TEST_F(OddSocketHandles, A_system_without_the_table_has_no_handles) {
  handles.TableStatuses = {platform::Handles::kStatusNotImplemented,
                           platform::Handles::kStatusNotImplemented};
  handles.Count = 0;
  EXPECT_TRUE(odd.ScanSocketHandles());
  EXPECT_TRUE(handles.nameRooms.empty());
}

// Each handle.

TEST_F(SocketHandles, A_tcp_socket_gives_its_port_a_tcp_owner) {
  machine.AddHandle({70000, 4, kTcpDevice, 1025});
  procPort.ScanSocketHandles();
  EXPECT_EQ(TcpOwner(1025), 70000);
  EXPECT_EQ(UdpOwner(1025), 0);
}

TEST_F(SocketHandles, A_udp_socket_gives_its_port_a_udp_owner) {
  machine.AddHandle({10, 4, kUdpDevice, 1025});
  procPort.ScanSocketHandles();
  EXPECT_EQ(TcpOwner(1025), 0);
  EXPECT_EQ(UdpOwner(1025), 10);
}

TEST_F(SocketHandles, A_port_over_32767_comes_out_positive) {
  machine.AddHandle({10, 4, kTcpDevice, 65535});
  machine.AddHandle({10, 8, kTcpDevice, 32768});
  procPort.ScanSocketHandles();
  EXPECT_EQ(TcpOwner(65535), 10);
  EXPECT_EQ(TcpOwner(32768), 10);
}

TEST_F(SocketHandles, Of_two_owners_of_a_port_the_last_one_counts) {
  machine.AddHandle({10, 4, kTcpDevice, 80});
  machine.AddHandle({70000, 4, kTcpDevice, 80});
  procPort.ScanSocketHandles();
  EXPECT_EQ(TcpOwner(80), 70000);
}

TEST_F(SocketHandles, A_port_keeps_its_last_owner_when_the_socket_has_gone) {
  machine.AddHandle({70000, 4, kTcpDevice, 80});
  procPort.ScanSocketHandles();
  machine.EndProcess(70000);
  procPort.ScanSocketHandles();
  EXPECT_EQ(TcpOwner(80), 70000);
}

TEST_F(SocketHandles, Handles_of_process_0_are_skipped) {
  machine.AddHandle({0, 4, kTcpDevice, 80});
  procPort.ScanSocketHandles();
  for (const auto& call : machine.processes.OpenCalls) EXPECT_NE(call.id, 0u);
  EXPECT_EQ(TcpOwner(80), 0);
}

TEST_F(SocketHandles, Owners_are_opened_with_the_right_to_duplicate) {
  machine.AddHandle({70000, 4, kTcpDevice, 80});
  procPort.ScanSocketHandles();
  ASSERT_EQ(machine.processes.OpenCalls.size(), 3u);
  EXPECT_EQ(machine.processes.OpenCalls.back().id, 70000u);
  EXPECT_EQ(machine.processes.OpenCalls.back().access, 0x40u);
}

TEST_F(SocketHandles, An_owner_that_opens_as_the_invalid_handle_ends_the_step) {
  machine.AddHandle({70000, 4, kTcpDevice, 80});
  machine.processes.FailOpen(70000, platform::kInvalidHandle);
  EXPECT_TRUE(procPort.ScanSocketHandles());
  EXPECT_EQ(TcpOwner(80), 0);
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

TEST_F(SocketHandles, An_owner_that_does_not_open_leaves_its_ports_unknown) {
  machine.AddHandle({70000, 4, kTcpDevice, 80});
  machine.processes.FailOpen(70000);
  EXPECT_TRUE(procPort.ScanSocketHandles());
  EXPECT_EQ(TcpOwner(80), 0);
  EXPECT_EQ(machine.processes.VainCloses, 0);
}

TEST_F(SocketHandles, A_handle_that_cannot_be_duplicated_is_left_and_its_owner_closed) {
  machine.AddHandle({70000, 4, kTcpDevice, 80, false});
  procPort.ScanSocketHandles();
  EXPECT_EQ(TcpOwner(80), 0);
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

TEST_F(SocketHandles, Only_names_of_22_bytes_cost_a_question_to_the_driver) {
  machine.AddHandle({10, 4, u"\\Device\\Afd", 80});
  machine.AddHandle({10, 8, u"\\Device\\Tcp6", 81});
  machine.AddHandle({10, 12, u"\\Device\\RawIp", 82});
  machine.AddHandle({10, 16, u"\\Device\\Http\\Filter", 83});
  machine.AddHandle({10, 20, u"", 84});
  machine.handles.DriverQueries = 0;
  procPort.ScanSocketHandles();
  // "\Device\Afd" has eleven characters too and is taken for a datagram socket.
  EXPECT_EQ(machine.handles.DriverQueries, 1);
  EXPECT_EQ(UdpOwner(80), 10);
}

TEST_F(SocketHandles, A_driver_that_refuses_leaves_the_port_unknown) {
  machine.AddHandle({10, 4, kTcpDevice, 80, true, 0xC0000008});
  procPort.ScanSocketHandles();
  EXPECT_EQ(TcpOwner(80), 0);
}

TEST_F(SocketHandles, Port_0_is_not_written) {
  machine.AddHandle({10, 4, kTcpDevice, 0});
  procPort.ScanSocketHandles();
  EXPECT_EQ(TcpOwner(0), 0);
}

TEST_F(SocketHandles, No_handle_stays_open) {
  for (std::uint16_t i = 1; i < 50; ++i)
    machine.AddHandle({10, static_cast<std::uint16_t>(4 * i), kTcpDevice, i});
  machine.AddHandle({10, 0x404, u"\\Device\\Http\\Filter", 83});
  machine.AddHandle({10, 0x408, kTcpDevice, 84, true, 1});
  procPort.ScanSocketHandles();
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
  EXPECT_EQ(machine.processes.VainCloses, 0);
}

TEST_F(OddSocketHandles, The_name_is_asked_for_with_exactly_32_bytes) {
  odd.ScanSocketHandles();
  EXPECT_EQ(handles.nameRooms, (std::vector<std::size_t>{32}));
}

TEST_F(OddSocketHandles, A_name_counts_in_any_case) {
  handles.Name = u"\\DEVICE\\tCp";
  odd.ScanSocketHandles();
  EXPECT_EQ(odd.PortOwnerTable[80].tcpOwner, 10);
}

TEST_F(OddSocketHandles, A_name_counts_up_to_its_first_NUL) {
  handles.Name = std::u16string(u"\\Devic\0\\Tcp", 11);
  odd.ScanSocketHandles();
  EXPECT_EQ(odd.PortOwnerTable[80].tcpOwner, 0);
  EXPECT_EQ(odd.PortOwnerTable[80].udpOwner, 10);
}

TEST_F(OddSocketHandles, A_name_that_could_not_be_had_is_not_read) {
  handles.NameStatus = 0xC0000004;
  odd.ScanSocketHandles();
  EXPECT_EQ(handles.controlCode, 0u);
}

TEST_F(OddSocketHandles, The_duplicate_is_made_for_the_own_process) {
  odd.ScanSocketHandles();
  EXPECT_EQ(handles.target, platform::kOwnProcess);
  EXPECT_EQ(handles.target.Value(), 0xFFFFFFFFu);
  EXPECT_EQ(handles.duplicateAccess, 0x101F0000u);
}

TEST_F(OddSocketHandles, Only_the_invalid_handle_for_an_owner_ends_the_step_before_duplicating) {
  machine.processes.FailOpen(10, platform::kInvalidHandle);
  odd.ScanSocketHandles();
  EXPECT_EQ(handles.duplicateAccess, 0u);
  handles.TableStatuses = {platform::Handles::kStatusInfoLengthMismatch, 0};
  machine.processes.FailOpen(10, platform::kNoHandle);
  odd.ScanSocketHandles();
  EXPECT_EQ(handles.duplicateAccess, 0x101F0000u);
}

// The driver's answer.

TEST_F(OddSocketHandles, The_driver_is_asked_for_the_address_of_query_type_3) {
  handles.eventGiven = platform::Handle(0x6000);
  odd.QueryHandlePort(platform::Handle(0x5000));
  std::vector<std::uint8_t> query(24);
  query[16] = 3;
  EXPECT_EQ(handles.driverInput, query);
  EXPECT_EQ(handles.driverOutputSize, 52u);
  EXPECT_EQ(handles.controlCode, 0x210012u);
  EXPECT_EQ(handles.eventAsked, "manual clear 0");
  EXPECT_EQ(handles.eventOfDriver, handles.eventGiven);
}

TEST_F(OddSocketHandles, The_event_is_closed_if_it_exists) {
  odd.QueryHandlePort(platform::Handle(0x5000));
  EXPECT_EQ(machine.processes.VainCloses, 0);
  handles.eventGiven = platform::Handle(0x6000);
  odd.QueryHandlePort(platform::Handle(0x5000));
  EXPECT_EQ(machine.processes.VainCloses, 1);
}

TEST_F(OddSocketHandles, The_port_is_read_in_network_order) {
  handles.Port = {0x04, 0x01};
  EXPECT_EQ(odd.QueryHandlePort(platform::Handle(0x5000)), 1025);
  handles.Port = {0xFF, 0xFE};
  EXPECT_EQ(odd.QueryHandlePort(platform::Handle(0x5000)), 65534);
  handles.Port = {0x80, 0x00};
  EXPECT_EQ(odd.QueryHandlePort(platform::Handle(0x5000)), 32768);
}

TEST_F(OddSocketHandles, Any_status_but_0_gives_port_0) {
  handles.DriverStatus = 0x103;
  EXPECT_EQ(odd.QueryHandlePort(platform::Handle(0x5000)), 0);
}

} // namespace quendra::monitor
