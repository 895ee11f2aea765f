#pragma once

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

#include <optional>
#include <vector>

namespace quendra::platform {

/// What every machine must answer alike, real or simulated.
struct BehaviourTest : BackendTest {
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

inline constexpr std::uint32_t kLoopbackInMemory = 0x0100007F;

} // namespace quendra::platform
