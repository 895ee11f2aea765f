#include "platform/windows/WindowsLoopFixture.h"
#include "platform/windows/net/NetworkEndsFixture.h"
#include "platform/windows/net/RelayWindow.h"
#include "platform/windows/net/WindowsIpHelper.h"
#include "platform/windows/net/WindowsSockets.h"

#include <gtest/gtest.h>

#include <stdexcept>

namespace quendra::platform::windows {

namespace {

constexpr UINT kMessage = RelayWindow::kFirstMessage;

TEST(RelayWindowTest, It_hears_its_own_messages_and_no_others) {
  WindowsLoop loop;
  std::vector<UINT> heard;
  const RelayWindow relay([&](UINT message, WPARAM, LPARAM) { heard.push_back(message); });
  ASSERT_TRUE(relay.Get());
  for (const UINT message :
       {kMessage, UINT{WM_USER}, RelayWindow::kLastMessage, RelayWindow::kLastMessage + 1})
    ::PostMessageW(relay.Get(), message, 0, 0);
  loop.PumpOnce();
  EXPECT_EQ(heard, (std::vector<UINT>{kMessage, RelayWindow::kLastMessage}));
}

TEST(RelayWindowTest, A_fault_of_its_handler_ends_there) {
  WindowsLoop loop;
  int heard = 0;
  const RelayWindow relay([&](UINT, WPARAM, LPARAM) {
    ++heard;
    throw std::runtime_error("of the test");
  });
  ::PostMessageW(relay.Get(), kMessage, 0, 0);
  EXPECT_NO_THROW(loop.PumpOnce());
  EXPECT_EQ(heard, 1);
}

TEST(RelayWindowTest, Each_relay_hears_for_itself_and_nobody_hears_what_comes_after_it_has_gone) {
  WindowsLoop loop;
  int first = 0;
  int second = 0;
  const RelayWindow one([&](auto...) { ++first; });
  {
    const RelayWindow two([&](auto...) { ++second; });
    ::PostMessageW(two.Get(), kMessage, 0, 0);
  }
  ::PostMessageW(one.Get(), kMessage, 0, 0);
  loop.PumpOnce();
  EXPECT_EQ(first, 1);
  EXPECT_EQ(second, 0);
}

/// As a machine that lacks calls.
struct BareIpHelper : testing::Test {
  IpHelper::TcpTable Table() {
    IpHelper::TcpTable table;
    EXPECT_EQ(WindowsIpHelper(library).AllocateAndGetTcpExTableFromStack(table), 0u);
    return table;
  }
  bool Lists(const IpHelper::TcpTable& table, std::uint16_t localPort) {
    bool found = false;
    for (std::size_t at = TcpTableEntry::kFirstOffset; table && at < table->size();
         at += TcpTableEntry::kBytes) {
      const auto entry = TcpTableEntry::ReadFrom(*table, at);
      found = found || (entry.localPort == PortInMemory(localPort) &&
                        entry.owner == ::GetCurrentProcessId() && entry.state == kTcpListening);
    }
    return found;
  }

  IpHelperLibrary library;
  NetworkEnds network;
};

TEST_F(BareIpHelper, The_owner_table_comes_from_the_newer_call_and_without_it_from_the_older_one) {
  const std::uint16_t port = network.Listen();
  ASSERT_TRUE(library.GetExtendedTcpTable && library.AllocateAndGetTcpExTableFromStack);
  const auto older = std::exchange(library.AllocateAndGetTcpExTableFromStack, nullptr);
  EXPECT_TRUE(Lists(Table(), port));
  library.AllocateAndGetTcpExTableFromStack = older;
  library.GetExtendedTcpTable = nullptr;
  EXPECT_TRUE(Lists(Table(), port));
}

TEST_F(BareIpHelper, Calls_that_the_library_lacks_fail_and_leave_what_they_were_given) {
  library.AllocateAndGetTcpExTableFromStack = nullptr;
  library.GetExtendedTcpTable = nullptr;
  library.GetAdaptersInfo = nullptr;
  library.GetIfTable = nullptr;
  library.SetTcpEntry = nullptr;
  WindowsIpHelper ipHelper(library);
  IpHelper::TcpTable table;
  std::vector<AdapterRecord> adapters(1);
  std::uint32_t size = 7;
  EXPECT_EQ(ipHelper.AllocateAndGetTcpExTableFromStack(table), IpHelper::kErrorNotSupported);
  EXPECT_EQ(ipHelper.GetAdaptersInfo(adapters, size), IpHelper::kErrorNotSupported);
  EXPECT_EQ(ipHelper.GetIfTable({}, size, true), IpHelper::kErrorNotSupported);
  const std::array<std::uint8_t, TcpTableEntry::kBytesWithoutOwner> entry{};
  EXPECT_EQ(ipHelper.SetTcpEntry(entry), IpHelper::kErrorNotSupported);
  EXPECT_FALSE(table);
  EXPECT_EQ(adapters.size(), 1u);
  EXPECT_EQ(size, 7u);
}

MIB_TCPROW changed{};
DWORD WINAPI KeepRow(MIB_TCPROW* row) {
  changed = *row;
  return 0;
}

TEST_F(BareIpHelper, A_connection_to_be_ended_is_handed_over_as_it_lies_in_the_record) {
  library.SetTcpEntry = KeepRow;
  std::array<std::uint8_t, TcpTableEntry::kBytes> record{};
  TcpTableEntry{kTcpDelete, 0x0100007F, PortInMemory(1025), 0x0200007F, PortInMemory(80), 0}.WriteTo(record,
                                                                                                     0);
  EXPECT_EQ(
      WindowsIpHelper(library).SetTcpEntry(std::span(record).first<TcpTableEntry::kBytesWithoutOwner>()), 0u);
  EXPECT_EQ(changed.dwState, kTcpDelete);
  EXPECT_EQ(changed.dwLocalAddr, 0x0100007Fu);
  EXPECT_EQ(changed.dwLocalPort, 0x0104u);
  EXPECT_EQ(changed.dwRemoteAddr, 0x0200007Fu);
  EXPECT_EQ(changed.dwRemotePort, 0x5000u);
}

} // namespace

} // namespace quendra::platform::windows
