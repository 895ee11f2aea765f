#include "platform/BackendFixture.h"
#include "platform/capture/CaptureControls.h"
#include "platform/capture/CaptureLibrary.h"
#include "platform/net/HostNames.h"
#include "platform/net/IpHelper.h"
#include "platform/process/Handles.h"
#include "platform/process/Icons.h"
#include "platform/process/Tokens.h"
#include "platform/process/VersionInfo.h"
#include "platform/system/System.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <optional>
#include <vector>

// What every machine must answer alike, real or simulated.

namespace quendra::platform {
namespace {

struct Kind {
  const char* name;
  std::unique_ptr<Backend> (*make)();
};

struct BehaviourTest : testing::TestWithParam<Kind> {
  std::unique_ptr<Backend> backend = GetParam().make();
  Machine machine = backend->Operations();

  std::vector<Processes::Entry> Snapshot() {
    std::vector<Processes::Entry> entries;
    const Handle snapshot = machine.processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0);
    EXPECT_NE(snapshot, kInvalidHandle);
    Processes::Entry entry;
    for (bool more = machine.processes.Process32First(snapshot, entry); more;
         more = machine.processes.Process32Next(snapshot, entry))
      entries.push_back(entry);
    EXPECT_TRUE(machine.processes.CloseHandle(snapshot));
    return entries;
  }

  using Connection = TcpTableEntry;
  std::vector<Connection> OwnerTable() {
    IpHelper::TcpTable table;
    EXPECT_EQ(machine.ipHelper.AllocateAndGetTcpExTableFromStack(table), 0U);
    const std::size_t count = Little32(*table, 0);
    EXPECT_EQ(table->size(), 4 + 24 * count);
    std::vector<Connection> connections;
    for (std::size_t at = 4; at + 24 <= table->size(); at += 24)
      connections.push_back(Connection::ReadFrom(*table, at));
    return connections;
  }
  std::optional<Connection> Find(std::uint16_t localPort, std::uint16_t remotePort) {
    for (const Connection& connection : OwnerTable())
      if (connection.localPort == PortInMemory(localPort) &&
          connection.remotePort == PortInMemory(remotePort))
        return connection;
    return {};
  }
};

constexpr std::uint32_t kLoopbackInMemory = 0x0100007F;

// Processes.

TEST_P(BehaviourTest, A_snapshot_holds_the_own_process_once_with_its_name_and_parent) {
  const auto entries = Snapshot();

  const auto isOwn = [&](const Processes::Entry& entry) { return entry.processId == backend->OwnId(); };
  ASSERT_EQ(std::count_if(entries.begin(), entries.end(), isOwn), 1);
  const auto own = *std::find_if(entries.begin(), entries.end(), isOwn);
  EXPECT_EQ(std::string(own.exeFile.data()), backend->OwnName());
  EXPECT_EQ(own.parentProcessId, backend->OwnParent());
}

TEST_P(BehaviourTest, Every_name_in_a_snapshot_ends_in_a_NUL) {
  for (const auto& entry : Snapshot())
    EXPECT_NE(std::find(entry.exeFile.begin(), entry.exeFile.end(), '\0'), entry.exeFile.end())
        << entry.processId;
}

TEST_P(BehaviourTest, A_snapshot_can_be_walked_again_from_its_first_entry) {
  const Handle snapshot = machine.processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0);
  Processes::Entry first;
  Processes::Entry other;
  ASSERT_TRUE(machine.processes.Process32First(snapshot, first));
  ASSERT_TRUE(machine.processes.Process32Next(snapshot, other));
  EXPECT_NE(first.processId, other.processId);

  EXPECT_TRUE(machine.processes.Process32First(snapshot, other));

  EXPECT_EQ(first.processId, other.processId);
  machine.processes.CloseHandle(snapshot);
}

TEST_P(BehaviourTest, A_snapshot_of_nothing_fails_with_the_invalid_handle) {
  EXPECT_EQ(machine.processes.CreateToolhelp32Snapshot(0, 0), kInvalidHandle);
}

TEST_P(BehaviourTest, Handles_that_are_none_or_closed_have_no_entries) {
  const Handle snapshot = machine.processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0);
  EXPECT_TRUE(machine.processes.CloseHandle(snapshot));
  Processes::Entry entry;

  for (const Handle handle : {snapshot, kNoHandle, kInvalidHandle}) {
    EXPECT_FALSE(machine.processes.Process32First(handle, entry)) << handle;
    EXPECT_FALSE(machine.processes.Process32Next(handle, entry)) << handle;
  }
}

TEST_P(BehaviourTest, A_handle_is_closed_once) {
  const Handle process = machine.processes.OpenProcess(1040, false, backend->OwnId());
  ASSERT_NE(process, kNoHandle);

  EXPECT_TRUE(machine.processes.CloseHandle(process));
  EXPECT_FALSE(machine.processes.CloseHandle(process));
  EXPECT_FALSE(machine.processes.CloseHandle(kNoHandle));
}

TEST_P(BehaviourTest, Opening_a_missing_process_fails_and_leaves_an_error) {
  EXPECT_EQ(machine.processes.OpenProcess(1040, false, backend->MissingId()), kNoHandle);
  EXPECT_NE(machine.processes.GetLastError(), 0U);
}

TEST_P(BehaviourTest, The_idle_process_cannot_be_opened) {
  EXPECT_EQ(machine.processes.OpenProcess(1040, false, 0), kNoHandle);
}

TEST_P(BehaviourTest, The_first_module_of_the_own_process_is_its_executable) {
  const Handle process = machine.processes.OpenProcess(1040, false, backend->OwnId());
  std::array<ModuleHandle, 50> modules{};
  ASSERT_TRUE(machine.processes.EnumProcessModules(process, modules));

  std::string path(260, ' ');
  const auto length = machine.processes.GetModuleFileNameExA(process, modules[0], path, 500);

  EXPECT_EQ(path.size(), 260U);
  EXPECT_EQ(path.substr(0, length), backend->OwnPath());
  machine.processes.CloseHandle(process);
}

TEST_P(BehaviourTest, A_module_path_is_never_written_beyond_the_text_or_the_stated_size) {
  const Handle process = machine.processes.OpenProcess(1040, false, backend->OwnId());
  std::array<ModuleHandle, 50> modules{};
  ASSERT_TRUE(machine.processes.EnumProcessModules(process, modules));
  std::string shortText(4, ' ');
  std::string longText(100, ' ');

  EXPECT_EQ(machine.processes.GetModuleFileNameExA(process, modules[0], shortText, 500), 4U);
  EXPECT_EQ(machine.processes.GetModuleFileNameExA(process, modules[0], longText, 3), 3U);

  EXPECT_EQ(shortText, backend->OwnPath().substr(0, 4));
  EXPECT_EQ(longText, backend->OwnPath().substr(0, 3) + std::string(97, ' '));
  machine.processes.CloseHandle(process);
}

TEST_P(BehaviourTest, A_process_that_was_not_opened_has_no_modules) {
  std::array<ModuleHandle, 50> modules{};
  std::string path(10, ' ');

  EXPECT_FALSE(machine.processes.EnumProcessModules(kNoHandle, modules));
  EXPECT_EQ(machine.processes.GetModuleFileNameExA(kNoHandle, ModuleHandle(1), path, 10), 0U);
  EXPECT_NE(machine.processes.GetLastError(), 0U);
}

// Tokens.

TEST_P(BehaviourTest, The_debug_privilege_is_enabled_or_fails_with_1300) {
  Handle token = kNoHandle;
  std::uint64_t luid = 0;
  std::array<std::uint8_t, 16> previous{};

  EXPECT_TRUE(machine.tokens.OpenProcessToken(machine.processes.GetCurrentProcess(), 40, token));
  EXPECT_EQ(machine.processes.GetLastError(), 0U);
  EXPECT_TRUE(machine.tokens.LookupPrivilegeValueA("", std::string("SeDebugPrivilege\0", 17), luid));
  EXPECT_EQ(machine.processes.GetLastError(), 0U);
  EXPECT_TRUE(machine.tokens.AdjustTokenPrivileges(token, false, luid, 2, previous));

  const auto error = machine.processes.GetLastError();
  EXPECT_TRUE(error == 0 || error == 1300) << error;
  EXPECT_TRUE(machine.processes.CloseHandle(token));
}

TEST_P(BehaviourTest, A_token_that_is_none_cannot_be_adjusted) {
  std::array<std::uint8_t, 16> previous{};
  Handle token = kNoHandle;

  EXPECT_FALSE(machine.tokens.AdjustTokenPrivileges(kNoHandle, false, 1, 2, previous));
  EXPECT_NE(machine.processes.GetLastError(), 0U);
  EXPECT_FALSE(machine.tokens.OpenProcessToken(kNoHandle, 40, token));
}

// Sockets and their owners.

TEST_P(BehaviourTest, A_listening_socket_stands_in_the_owner_table_as_it_lies_in_memory) {
  const std::uint16_t port = backend->Listen();

  const auto listening = Find(port, 0);

  ASSERT_TRUE(listening);
  EXPECT_EQ(listening->state, 2U);
  EXPECT_EQ(listening->localAddress, kLoopbackInMemory);
  EXPECT_EQ(listening->remoteAddress, 0U);
  EXPECT_EQ(listening->owner, backend->OwnId());
}

TEST_P(BehaviourTest, Both_ends_of_a_connection_stand_in_the_owner_table) {
  const std::uint16_t server = backend->Listen();
  const std::uint16_t client = backend->Connect(server);

  for (const auto& [local, remote] : {std::pair(client, server), std::pair(server, client)}) {
    const auto end = Find(local, remote);
    ASSERT_TRUE(end) << local;
    EXPECT_EQ(end->state, 5U);
    EXPECT_EQ(end->localAddress, kLoopbackInMemory);
    EXPECT_EQ(end->remoteAddress, kLoopbackInMemory);
    EXPECT_EQ(end->owner, backend->OwnId());
  }
}

TEST_P(BehaviourTest, Every_state_in_the_owner_table_has_a_number_from_1_to_12) {
  backend->Connect(backend->Listen());

  const auto connections = OwnerTable();

  EXPECT_GE(connections.size(), 3U);
  for (const Connection& connection : connections) {
    EXPECT_TRUE(connection.state >= 1 && connection.state <= 12) << connection.state;
    EXPECT_LE(connection.localPort, 0xFFFFU);
    EXPECT_LE(connection.remotePort, 0xFFFFU);
  }
}

TEST_P(BehaviourTest, A_table_once_given_stays_as_it_was) {
  backend->Listen();
  IpHelper::TcpTable first;
  ASSERT_EQ(machine.ipHelper.AllocateAndGetTcpExTableFromStack(first), 0U);
  const auto before = *first;

  backend->Listen();
  IpHelper::TcpTable second;
  ASSERT_EQ(machine.ipHelper.AllocateAndGetTcpExTableFromStack(second), 0U);

  EXPECT_EQ(*first, before);
  EXPECT_NE(first, second);
}

// Addresses.

TEST_P(BehaviourTest, The_own_name_has_addresses_and_the_first_is_the_loopback) {
  const auto name = machine.hostNames.gethostname();
  ASSERT_TRUE(name);
  EXPECT_FALSE(name->empty());

  const auto addresses = machine.hostNames.gethostbyname(*name + std::string(1, '\0'));

  ASSERT_TRUE(addresses);
  ASSERT_FALSE(addresses->empty());
  EXPECT_EQ(addresses->front().InMemory(), kLoopbackInMemory);
}

TEST_P(BehaviourTest, A_question_for_a_name_that_fails_has_its_own_number_which_socket_calls_leave_alone) {
  EXPECT_FALSE(machine.hostNames.gethostbyname(std::string(300, 'x')));
  machine.sockets.WSAStartup(257);
  EXPECT_EQ(machine.sockets.listen(SocketHandle(4711), 1), kSocketError);
  machine.sockets.WSACleanup();
  EXPECT_EQ(machine.hostNames.LastError(), kHostNotFound);

  EXPECT_TRUE(machine.hostNames.gethostname());
  EXPECT_EQ(machine.hostNames.LastError(), 0);
}

TEST_P(BehaviourTest, Adapters_are_asked_for_in_two_phases) {
  std::vector<AdapterRecord> adapters;
  std::uint32_t size = 0;
  const auto first = machine.ipHelper.GetAdaptersInfo(adapters, size);
  if (first == IpHelper::kErrorBufferOverflow) {
    EXPECT_GT(size, 0U);
    EXPECT_EQ(size % IpHelper::kAdapterBytes, 0U);
    EXPECT_TRUE(adapters.empty());
  } else {
    // A machine without adapters has nothing to make room for.
    EXPECT_EQ(first, 0U);
    EXPECT_EQ(size, 0U);
  }

  EXPECT_EQ(machine.ipHelper.GetAdaptersInfo(adapters, size), 0U);

  EXPECT_EQ(adapters.size(), size / IpHelper::kAdapterBytes);
  for (const AdapterRecord& adapter : adapters) EXPECT_FALSE(adapter.name.empty());
}

// Files.

TEST_P(BehaviourTest, A_file_that_is_not_there_has_neither_icon_nor_version_block) {
  std::array<std::uint8_t, 64> block{};

  EXPECT_EQ(machine.icons.ExtractIconExA("/no/such/file", 0), kNoHandle);
  EXPECT_EQ(machine.icons.ExtractIconExA("", 0), kNoHandle);
  EXPECT_EQ(machine.versionInfo.GetFileVersionInfoSizeA("/no/such/file"), 0U);
  EXPECT_EQ(machine.versionInfo.GetFileVersionInfoSizeA(""), 0U);
  EXPECT_FALSE(machine.versionInfo.GetFileVersionInfoA("/no/such/file", block));
}

TEST_P(BehaviourTest, Bytes_that_are_no_version_block_hold_no_values) {
  const std::vector<std::uint8_t> zeros(64, 0);
  const std::vector<std::uint8_t> noise(64, 0xA5);

  for (const char* query :
       {"\\VarFileInfo\\Translation", "\\StringFileInfo\\040D04E7\\ProductName", "", "\\"}) {
    EXPECT_FALSE(machine.versionInfo.VerQueryValueA(zeros, query)) << query;
    EXPECT_FALSE(machine.versionInfo.VerQueryValueA(noise, query)) << query;
    EXPECT_FALSE(machine.versionInfo.VerQueryValueA({}, query)) << query;
  }
}

TEST_P(BehaviourTest, An_icon_that_is_none_has_no_image_and_cannot_be_destroyed) {
  EXPECT_TRUE(machine.icons.ImageOf(kNoHandle).empty());
  EXPECT_TRUE(machine.icons.ImageOf(kInvalidHandle).empty());
  EXPECT_FALSE(machine.icons.DestroyIcon(kNoHandle));
}

// The native interface.

TEST_P(BehaviourTest, The_handle_table_says_that_the_buffer_is_too_small_or_that_it_is_not_there) {
  std::vector<std::uint8_t> none;
  std::uint32_t returned = 0;

  const auto status = machine.handles.NtQuerySystemInformation(16, none, returned);

  EXPECT_TRUE(status == Handles::kStatusInfoLengthMismatch || status == Handles::kStatusNotImplemented)
      << status;
  EXPECT_NE(machine.handles.NtQuerySystemInformation(999, none, returned), 0U);
}

TEST_P(BehaviourTest, Handles_that_are_none_have_no_duplicate_no_name_and_no_port) {
  std::array<std::uint8_t, 32> name{};
  std::array<std::uint8_t, 24> input{};
  std::array<std::uint8_t, 52> output{};
  std::uint32_t returned = 0;
  Handle duplicate = kNoHandle;

  EXPECT_FALSE(
      machine.handles.DuplicateHandle(kNoHandle, Handle(8), kInvalidHandle, duplicate, 0x101F0000, false, 0));
  EXPECT_EQ(duplicate, kNoHandle);
  EXPECT_NE(machine.handles.NtQueryObject(kNoHandle, 1, name, returned), 0U);
  EXPECT_NE(
      machine.handles.NtDeviceIoControlFile(kNoHandle, kNoHandle, Handles::kQueryInformation, input, output),
      0U);
}

// System.

TEST_P(BehaviourTest, The_version_is_of_the_family_with_an_owner_table) {
  OsVersion version;

  ASSERT_TRUE(machine.system.GetVersionExA(version));

  EXPECT_EQ(version.platformId, 2U);
  EXPECT_EQ(version.majorVersion, 5U);
  EXPECT_EQ(version.minorVersion, 1U);
}

TEST_P(BehaviourTest, Ticks_never_go_back_and_waiting_moves_them_on) {
  const auto first = machine.system.GetTickCount();
  const auto second = machine.system.GetTickCount();
  machine.system.Sleep(25);
  const auto third = machine.system.GetTickCount();

  EXPECT_LT(second - first, 60000U);
  // Ticks may move in steps of 10 ms, as the system's own do.
  EXPECT_GE(third - second, 10U);
  EXPECT_LT(third - second, 60000U);
}

TEST_P(BehaviourTest, The_day_number_is_one_of_this_century) {
  EXPECT_GT(machine.system.DayNumber(), 36526);
  EXPECT_LT(machine.system.DayNumber(), 73050);
}

TEST_P(BehaviourTest, The_second_of_the_day_lies_between_midnight_and_midnight) {
  EXPECT_GE(machine.system.SecondOfDay(), 0);
  EXPECT_LT(machine.system.SecondOfDay(), 86400);
}

// Capture.

TEST_P(BehaviourTest, The_capture_library_has_named_adapters_or_says_that_there_are_none) {
  const auto last = machine.captureLibrary.VBPcapInit();
  ASSERT_GE(last, -1);
  const bool available = machine.captureLibrary.availability() == CaptureLibrary::Availability::Available;
  EXPECT_TRUE(last >= 0 || !available);

  for (std::int32_t i = 0; i <= last; ++i) {
    AdapterInfo info;
    machine.captureLibrary.vpGetAdapterInfo(static_cast<std::int16_t>(i), info);
    EXPECT_NE(info.AdapterName[0], '\0') << i;
    EXPECT_NE(info.AdapterDescription[0], '\0') << i;
    EXPECT_EQ(info.AdapterName.back(), '\0') << i;
    EXPECT_EQ(info.AdapterDescription.back(), '\0') << i;
  }
}

TEST_P(BehaviourTest, An_adapter_that_the_library_lacks_leaves_the_record_as_it_was) {
  const auto last = machine.captureLibrary.VBPcapInit();
  AdapterInfo info;
  info.AdapterName[0] = 'x';
  info.AdapterDescription[0] = 'y';

  for (const int index : {-1, last + 1, 32767})
    machine.captureLibrary.vpGetAdapterInfo(static_cast<std::int16_t>(index), info);

  EXPECT_EQ(info.AdapterName[0], 'x');
  EXPECT_EQ(info.AdapterDescription[0], 'y');
}

TEST_P(BehaviourTest, Without_a_session_a_blank_frame_of_60_bytes_is_left) {
  FrameBytes frame;
  CaptureHeader header{};

  EXPECT_LE(machine.captureLibrary.vpCapture(frame, header), 0);

  ASSERT_EQ(frame.UpperBound(), 59);
  EXPECT_TRUE(std::all_of(frame.Data(), frame.Data() + 60, [](std::uint8_t byte) { return byte == 0; }));
}

TEST_P(BehaviourTest, A_control_without_an_adapter_answers_every_call) {
  const auto control = machine.captureControls.Create();
  int events = 0;
  control->PacketReceived = [&] { ++events; };
  std::int32_t result = -1;
  auto address = Ipv4Address::FromHost(1);
  std::uint32_t second = 1;
  std::array<std::uint8_t, 64> buffer{};

  control->AdapterAddress("no such adapter", address, second);
  control->BindAdapter("no such adapter", result);
  control->SetValueA(32);
  control->SetValueB(1000);
  control->OpenChannel(result);
  control->SetChannelSize(15000, result);
  control->SetValueC(15000);
  control->StartEvents(result);
  control->ReadBuffer(buffer);
  control->ReadBuffer({});
  control->StopEvents(result);
  control->ReleaseChannel(result);
  control->CloseChannel(result);

  EXPECT_EQ(address, Ipv4Address());
  EXPECT_EQ(events, 0);
  // A record header that states no bytes of a frame, and none after it.
  EXPECT_TRUE(
      std::all_of(buffer.begin() + 8, buffer.begin() + 16, [](std::uint8_t byte) { return byte == 0; }));
  ASSERT_LE(buffer[16], 32);
  EXPECT_TRUE(
      std::all_of(buffer.begin() + buffer[16], buffer.end(), [](std::uint8_t byte) { return byte == 0; }));
}

TEST_P(BehaviourTest, Ending_a_session_that_never_began_does_no_harm) {
  machine.captureLibrary.vpEnd();
  machine.captureLibrary.vpSetCurrentAdapter(-1);
  machine.captureLibrary.vpSetCurrentAdapter(32767);
  machine.captureLibrary.vpBegin(1000);
  machine.captureLibrary.vpSetParam(0, 65536);
  machine.captureLibrary.vpEnd();
  machine.captureLibrary.vpEnd();
  FrameBytes frame;
  CaptureHeader header{};

  EXPECT_LE(machine.captureLibrary.vpCapture(frame, header), 0);
}

INSTANTIATE_TEST_SUITE_P(, BehaviourTest,
                         testing::Values(Kind{"Simulated", MakeSimulatedBackend},
                                         Kind{"Linux", MakeLinuxBackend}),
                         [](const auto& kind) { return std::string(kind.param.name); });

} // namespace
} // namespace quendra::platform
