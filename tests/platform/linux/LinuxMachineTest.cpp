#include "platform/linux/LinuxMachine.h"

#include "forms/headless/posix/PolledDesktop.h"
#include "platform/linux/LinuxFixture.h"
#include "platform/net/HostNames.h"
#include "platform/net/IpHelper.h"
#include "platform/net/Sockets.h"
#include "platform/process/Handles.h"
#include "platform/registry/Registry.h"

#include <gtest/gtest.h>
#include <unistd.h>

namespace quendra::platform::linux_ {

namespace {

struct LinuxMachineTest : testing::Test {
  forms::headless::PolledDesktop desktop;
  LinuxMachine machine{desktop, desktop};
  Machine operations = machine.Operations();
};

TEST_F(LinuxMachineTest, Operations_that_this_system_lacks_answer_that_they_are_not_available) {
  std::uint8_t buffer[64] = {};
  std::uint32_t returned = 1;
  EXPECT_EQ(operations.handles.NtQuerySystemInformation(16, buffer, returned),
            Handles::kStatusNotImplemented);
  EXPECT_EQ(operations.handles.NtQueryObject(Handle(4), 1, buffer, returned), Handles::kStatusNotImplemented);
  EXPECT_EQ(operations.handles.NtDeviceIoControlFile(Handle(4), Handle(), 0x210012, buffer, buffer),
            Handles::kStatusNotImplemented);
  Handle duplicate;
  EXPECT_FALSE(operations.handles.DuplicateHandle(Handle(4), Handle(4), Handle(4), duplicate, 0, false, 0));
  EXPECT_EQ(operations.sockets.recv(SocketHandle(4), buffer, 0), -1);
  EXPECT_EQ(operations.sockets.WSAAsyncSelect(SocketHandle(4), WindowHandle(1), 1, 1), -1);
  EXPECT_EQ(operations.sockets.closesocket(SocketHandle(4)), -1);
  EXPECT_FALSE(operations.sockets.WSAIsBlocking());
}

TEST_F(LinuxMachineTest, The_own_process_is_in_the_snapshot_under_its_file_name) {
  const Handle snapshot = operations.processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0);
  ASSERT_NE(snapshot, kInvalidHandle);
  Processes::Entry entry;
  std::string name = "(none)";
  for (bool more = operations.processes.Process32First(snapshot, entry); more;
       more = operations.processes.Process32Next(snapshot, entry))
    if (entry.processId == static_cast<std::uint32_t>(::getpid())) name = entry.exeFile.data();
  EXPECT_EQ(name, "platform_test");
  EXPECT_TRUE(operations.processes.CloseHandle(snapshot));
}

TEST(LinuxMachineRegistryTest, A_damaged_file_of_the_users_registry_is_told_of_when_it_is_found) {
  const TemporaryFolder folder;
  Environment environment;
  environment.Set("XDG_DATA_HOME", folder.Path());
  const std::string file = folder.Write("quendra/registry.sqlite", "no registry, " + std::string(5000, 'x'));
  std::vector<std::string> told;
  forms::headless::PolledDesktop loop;
  LinuxMachine machine(loop, loop, [&](const std::string& keptAs) { told.push_back(keptAs); });
  EXPECT_TRUE(told.empty());
  RegistryKey key;

  for (int i = 0; i < 2; ++i)
    EXPECT_EQ(machine.Operations().registry.RegCreateKeyA(kCurrentUser, "One", key), kRegistrySuccess);

  EXPECT_EQ(told, std::vector{file + ".damaged-1"});
}

TEST_F(LinuxMachineTest, A_user_without_rights_gets_snapshot_table_and_host_addresses) {
  if (::geteuid() != 0) GTEST_SKIP() << "needs the administrator to become another user";
  const Child user([] {
    if (::setgid(65534) != 0 || ::setuid(65534) != 0) return std::string("no other user");
    forms::headless::PolledDesktop loop;
    LinuxMachine limited(loop, loop);
    const Machine machine = limited.Operations();
    std::string text;
    Processes::Entry entry;
    const Handle snapshot = machine.processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0);
    for (bool more = machine.processes.Process32First(snapshot, entry); more;
         more = machine.processes.Process32Next(snapshot, entry))
      if (entry.processId == 1) text += entry.exeFile.data();
    const Handle first = machine.processes.OpenProcess(1040, false, 1);
    ModuleHandle modules[50] = {};
    if (!machine.processes.EnumProcessModules(first, modules)) text += ", no path";
    IpHelper::TcpTable table;
    if (machine.ipHelper.AllocateAndGetTcpExTableFromStack(table) == 0) text += ", a table";
    if (machine.hostNames.gethostname()) text += ", a name";
    return text;
  });
  EXPECT_EQ(user.Answer(), "services.exe, no path, a table, a name");
}

} // namespace

} // namespace quendra::platform::linux_
