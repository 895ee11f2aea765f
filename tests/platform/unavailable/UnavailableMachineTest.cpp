#include "platform/unavailable/UnavailableMachine.h"

#include "platform/process/SystemErrors.h"

#include <gtest/gtest.h>

#include <array>

namespace quendra::platform::unavailable {

namespace {

/// Each family by itself: it answers as on a system that lacks it, and leaves alone what it was given to
/// fill.
class UnavailableFamilies : public testing::Test {
 protected:
  UnavailableMachine machine;
};

TEST_F(UnavailableFamilies, Processes_cannot_be_listed_nor_opened_and_the_error_is_that_of_a_missing_call) {
  Processes::Entry entry;
  EXPECT_EQ(machine.processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0), kInvalidHandle);
  EXPECT_FALSE(machine.processes.Process32First(kInvalidHandle, entry));
  EXPECT_FALSE(machine.processes.Process32Next(kInvalidHandle, entry));
  EXPECT_EQ(machine.processes.OpenProcess(0, false, 1), kNoHandle);
  EXPECT_EQ(machine.processes.GetLastError(), kCallNotImplemented);
}

TEST_F(UnavailableFamilies, No_adapter_is_counted_and_no_frame_comes_but_a_blank_one) {
  FrameBytes frame;
  CaptureHeader header{};
  EXPECT_EQ(machine.captureLibrary.VBPcapInit(), -1);
  EXPECT_LT(machine.captureLibrary.vpCapture(frame, header), 0);
  EXPECT_EQ(frame.UpperBound(), 59);
}

TEST_F(UnavailableFamilies, A_capture_control_is_there_and_binds_no_adapter) {
  std::int32_t result = 0;
  const auto control = machine.captureControls.Create();
  control->BindAdapter("eth0", result);
  EXPECT_EQ(result, -1);
}

TEST_F(UnavailableFamilies, A_process_has_no_modules) {
  std::array<ModuleHandle, 2> modules{};
  std::string path = "before";
  EXPECT_FALSE(machine.processes.EnumProcessModules(kOwnProcess, modules));
  EXPECT_EQ(machine.processes.GetModuleFileNameExA(kOwnProcess, modules[0], path, 500), 0u);
  EXPECT_EQ(path, "before");
}

TEST_F(UnavailableFamilies, No_step_of_a_privilege_succeeds) {
  Handle token = kNoHandle;
  std::uint64_t luid = 0;
  std::array<std::uint8_t, 16> previous{};
  EXPECT_FALSE(machine.tokens.OpenProcessToken(kOwnProcess, 40, token));
  EXPECT_FALSE(machine.tokens.LookupPrivilegeValueA("", "SeDebugPrivilege", luid));
  EXPECT_FALSE(machine.tokens.AdjustTokenPrivileges(token, false, luid, Tokens::kEnabled, previous));
}

TEST_F(UnavailableFamilies, Files_have_neither_version_block_nor_icon) {
  EXPECT_EQ(machine.versionInfo.GetFileVersionInfoSizeA("C:\\a.exe"), 0u);
  EXPECT_FALSE(machine.versionInfo.VerQueryValueA({}, std::string(VersionInfo::kTranslation)));
  EXPECT_EQ(machine.icons.ExtractIconExA("C:\\a.exe", 0), kNoHandle);
  EXPECT_TRUE(machine.icons.ImageOf(kNoHandle).empty());
  EXPECT_FALSE(machine.icons.DestroyIcon(kNoHandle));
}

TEST_F(UnavailableFamilies, Native_queries_end_with_the_status_of_what_does_not_exist) {
  std::array<std::uint8_t, 64> buffer{};
  std::uint32_t returned = 77;
  EXPECT_EQ(machine.handles.NtQuerySystemInformation(Handles::kHandleTable, buffer, returned),
            Handles::kStatusNotImplemented);
  EXPECT_EQ(returned, 0u);
  returned = 77;
  EXPECT_EQ(machine.handles.NtQueryObject(kNoHandle, Handles::kObjectName, buffer, returned),
            Handles::kStatusNotImplemented);
  EXPECT_EQ(returned, 0u);
  EXPECT_EQ(
      machine.handles.NtDeviceIoControlFile(kNoHandle, kNoHandle, Handles::kQueryInformation, buffer, buffer),
      Handles::kStatusNotImplemented);
}

TEST_F(UnavailableFamilies, The_tables_of_the_network_are_not_supported_and_stay_as_they_were) {
  IpHelper::TcpTable table;
  std::vector<AdapterRecord> adapters(1);
  std::uint32_t size = 640;
  const std::array<std::uint8_t, TcpTableEntry::kBytesWithoutOwner> record{};
  EXPECT_EQ(machine.ipHelper.AllocateAndGetTcpExTableFromStack(table), IpHelper::kErrorNotSupported);
  EXPECT_FALSE(table);
  EXPECT_EQ(machine.ipHelper.GetAdaptersInfo(adapters, size), IpHelper::kErrorNotSupported);
  EXPECT_EQ(adapters.size(), 1u);
  EXPECT_EQ(size, 640u);
  EXPECT_EQ(machine.ipHelper.SetTcpEntry(record), IpHelper::kErrorNotSupported);
}

TEST_F(UnavailableFamilies, Names_fail_for_want_of_a_network) {
  EXPECT_FALSE(machine.hostNames.gethostname());
  EXPECT_FALSE(machine.hostNames.gethostbyname("localhost"));
  EXPECT_EQ(machine.hostNames.LastError(), kSubsystemUnavailable);
}

TEST_F(UnavailableFamilies, The_socket_library_does_not_start_and_makes_no_socket) {
  EXPECT_EQ(machine.sockets.WSAStartup(257), kSubsystemUnavailable);
  EXPECT_EQ(machine.sockets.socket(kInternetFamily, kStreamSocket, 6), kNoSocket);
  EXPECT_EQ(machine.sockets.WSAGetLastError(), kSubsystemUnavailable);
}

TEST_F(UnavailableFamilies, A_look_up_is_not_begun_and_leaves_its_buffer) {
  std::array<std::uint8_t, 8> buffer{};
  buffer.fill(0xEE);
  const auto before = buffer;
  EXPECT_EQ(machine.sockets.WSAAsyncGetHostByName(WindowHandle(1), 32768, "localhost", buffer), kNoLookUp);
  EXPECT_EQ(buffer, before);
}

TEST_F(UnavailableFamilies, The_system_tells_no_version_and_starts_no_program) {
  OsVersion version{7, 8, 9};
  EXPECT_FALSE(machine.system.GetVersionExA(version));
  EXPECT_EQ(version.platformId, 7u);
  EXPECT_FALSE(machine.shellStart.Shell("calc.exe", ShellStart::kNormalWindow));
}

TEST_F(UnavailableFamilies, No_key_of_a_registry_is_opened_made_written_or_read) {
  RegistryKey key(77);
  std::uint32_t number = 77;
  std::string name = "before";
  std::array<std::uint8_t, 4> data{};
  EXPECT_EQ(machine.registry.RegCreateKeyA(kCurrentUser, "Software", key), kRegistryCallNotImplemented);
  EXPECT_EQ(machine.registry.RegOpenKeyExA(kCurrentUser, "Software", kKeyRead, key),
            kRegistryCallNotImplemented);
  EXPECT_EQ(key, RegistryKey(77));
  EXPECT_EQ(machine.registry.RegSetValueExA(kCurrentUser, "a", kRegBinary, data),
            kRegistryCallNotImplemented);
  EXPECT_EQ(machine.registry.RegQueryValueExA(kCurrentUser, "a", number, data, number),
            kRegistryCallNotImplemented);
  EXPECT_EQ(machine.registry.RegEnumKeyExA(kCurrentUser, 0, name), kRegistryCallNotImplemented);
  EXPECT_EQ(machine.registry.RegDeleteKeyA(kCurrentUser, "Software"), kRegistryCallNotImplemented);
  EXPECT_EQ(machine.registry.RegDeleteValueA(kCurrentUser, "a"), kRegistryCallNotImplemented);
  EXPECT_EQ(machine.registry.RegCloseKey(kCurrentUser), kRegistryCallNotImplemented);
  EXPECT_EQ(number, 77u);
  EXPECT_EQ(name, "before");
}

TEST_F(UnavailableFamilies, The_internet_cache_has_no_walk_and_deletes_nothing) {
  UrlCacheEntry entry;
  std::uint32_t size = 77;
  EXPECT_EQ(machine.urlCache.FindFirstUrlCacheEntryA("0", nullptr, size), kNoUrlCacheWalk);
  EXPECT_EQ(machine.urlCache.GetLastError(), UrlCache::kErrorCallNotImplemented);
  EXPECT_FALSE(machine.urlCache.FindNextUrlCacheEntryA(UrlCacheWalk(4), &entry, size));
  EXPECT_FALSE(machine.urlCache.LocalAlloc(entry, 80));
  EXPECT_FALSE(machine.urlCache.FindCloseUrlCache(UrlCacheWalk(4)));
  EXPECT_FALSE(machine.urlCache.DeleteUrlCacheEntryA("http://www.example.com/"));
  EXPECT_EQ(size, 77u);
}

TEST_F(UnavailableFamilies, No_echo_can_be_sent_for_want_of_a_handle) {
  std::array<std::uint8_t, 28> reply{};
  reply.fill(0xEE);
  const auto before = reply;
  EXPECT_EQ(machine.icmp.IcmpCreateFile(), kNoIcmp);
  EXPECT_EQ(machine.icmp.IcmpSendEcho(kNoIcmp, {}, reply, 1000), 0u);
  EXPECT_EQ(reply, before);
  EXPECT_FALSE(machine.icmp.IcmpCloseHandle(kNoIcmp));
  EXPECT_EQ(machine.icmp.MissingRight(), "");
}

TEST_F(UnavailableFamilies, There_is_no_Windows_directory_no_folder_to_write_into_and_no_product) {
  std::string buffer = "before";
  EXPECT_EQ(machine.files.GetWindowsDirectoryA(buffer), 0u);
  try {
    machine.files.Output("C:\\WINDOWS\\name", "text");
    ADD_FAILURE() << "written";
  } catch (const Fault& fault) {
    EXPECT_EQ(fault.number, 76);
  }
  EXPECT_EQ(machine.installedProducts.MsiEnumProductsA(0, buffer), 259u);
  EXPECT_EQ(buffer, "before");
}

TEST_F(UnavailableFamilies, The_keyboard_layout_has_no_name) {
  EXPECT_FALSE(machine.keyboardLayout.GetKeyboardLayoutNameA());
}

TEST_F(UnavailableFamilies, The_phone_book_cannot_be_opened_for_want_of_remote_access) {
  std::array<std::uint8_t, 1060> record{};
  record.fill(0xEE);
  const auto before = record;
  std::uint32_t bytes = 77;
  std::uint32_t count = 77;
  EXPECT_EQ(machine.phoneBook.RasEnumEntriesA(nullptr, record, bytes, count), kRasManagerCannotStart);
  EXPECT_EQ(count, 0u);
  count = 77;
  EXPECT_EQ(machine.phoneBook.RasEnumDevicesA(record, bytes, count), kRasManagerCannotStart);
  EXPECT_EQ(count, 0u);
  EXPECT_EQ(machine.phoneBook.RasGetEntryPropertiesA(nullptr, "097", record, bytes), kRasManagerCannotStart);
  EXPECT_EQ(machine.phoneBook.RasSetEntryPropertiesA(nullptr, "097", record), kRasManagerCannotStart);
  EXPECT_EQ(machine.phoneBook.RasDeleteEntryA(nullptr, "097"), kRasManagerCannotStart);
  EXPECT_EQ(bytes, 77u);
  EXPECT_EQ(record, before);
}

TEST_F(UnavailableFamilies, What_dials_are_made_with_cannot_be_read_or_kept_for_want_of_remote_access) {
  std::array<std::uint8_t, 1060> params{};
  bool hasPassword = true;
  EXPECT_EQ(machine.phoneBook.RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasManagerCannotStart);
  EXPECT_FALSE(hasPassword);
  EXPECT_EQ(machine.phoneBook.RasSetEntryDialParamsA(nullptr, params, false), kRasManagerCannotStart);
}

TEST_F(UnavailableFamilies, Nothing_is_dialled_nor_hung_up_and_no_failure_has_a_text) {
  std::array<std::uint8_t, 692> record{};
  RasConnection connection(77);
  std::uint32_t bytes = 4;
  std::uint32_t count = 77;
  std::array<char, 512> text{};
  EXPECT_EQ(machine.dialling.RasDialA({}, nullptr, record, {}, connection), kRasManagerCannotStart);
  EXPECT_EQ(connection, RasConnection(77));
  EXPECT_EQ(machine.dialling.RasHangUpA(connection), kRasManagerCannotStart);
  EXPECT_EQ(machine.dialling.RasEnumConnectionsA(record, bytes, count), kRasManagerCannotStart);
  EXPECT_EQ(count, 0u);
  EXPECT_EQ(machine.dialling.RasGetErrorStringA(kRasManagerCannotStart, text), kCallNotImplemented);
}

TEST_F(UnavailableFamilies, Network_cards_have_no_management) {
  try {
    machine.adapters.GetObject(Adapters::kMoniker);
    ADD_FAILURE();
  } catch (const Fault& fault) {
    EXPECT_EQ(fault.number, Fault::kCannotCreateObject);
  }
}

TEST_F(UnavailableFamilies, An_error_of_the_system_has_no_text) {
  std::array<char, 512> text{};
  EXPECT_EQ(machine.system.FormatMessageA(System::kFromSystem, 5, 0, text), 0u);
}

} // namespace

} // namespace quendra::platform::unavailable
