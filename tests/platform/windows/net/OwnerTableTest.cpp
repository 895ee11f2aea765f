#include "platform/windows/net/OwnerTable.h"

#include "platform/net/TcpTableEntry.h"

#include <gtest/gtest.h>

namespace quendra::platform::windows {

namespace {

std::vector<std::uint8_t> Table(std::uint32_t count, std::initializer_list<TcpTableEntry> entries) {
  std::vector<std::uint8_t> table(TcpTableEntry::kFirstOffset + entries.size() * TcpTableEntry::kBytes);
  PutLittle32(table, 0, count);
  std::size_t at = TcpTableEntry::kFirstOffset;
  for (const TcpTableEntry& entry : entries) {
    entry.WriteTo(table, at);
    at += TcpTableEntry::kBytes;
  }
  return table;
}

TEST(OwnerTable, What_lies_behind_the_last_entry_is_left_out) {
  const TcpTableEntry entry{kTcpEstablished, 1, 2, 3, 4, 5};
  auto table = Table(1, {entry});
  table.resize(table.size() + 1000, 0xA5);
  EXPECT_EQ(CleanOwnerTable(table), Table(1, {entry}));
}

TEST(OwnerTable, A_count_above_what_is_there_is_not_believed) {
  const TcpTableEntry entry{kTcpEstablished, 1, 2, 3, 4, 5};
  EXPECT_EQ(CleanOwnerTable(Table(0xFFFFFFFF, {entry})), Table(1, {entry}));
}

TEST(OwnerTable, Bytes_too_few_for_a_count_are_an_empty_table) {
  for (const std::size_t size : {0u, 3u})
    EXPECT_EQ(CleanOwnerTable(std::vector<std::uint8_t>(size, 0xFF)), Table(0, {}));
}

TEST(OwnerTable, Ports_lose_what_the_system_leaves_in_their_upper_half) {
  EXPECT_EQ(CleanOwnerTable(Table(1, {{kTcpEstablished, 1, 0xABCD1234, 3, 0xABCD5678, 5}})),
            Table(1, {{kTcpEstablished, 1, 0x1234, 3, 0x5678, 5}}));
}

TEST(OwnerTable, A_socket_that_listens_has_no_port_at_its_far_end) {
  EXPECT_EQ(CleanOwnerTable(Table(1, {{kTcpListening, 1, 0x1234, 0, 0x5678, 5}})),
            Table(1, {{kTcpListening, 1, 0x1234, 0, 0, 5}}));
}

} // namespace

} // namespace quendra::platform::windows
