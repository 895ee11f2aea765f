#include "monitor/TcpOwnerEntry.h"

#include <gtest/gtest.h>

namespace quendra::monitor {

namespace {

platform::IpHelper::TcpTable TableOf(std::uint32_t count, const std::vector<std::uint32_t>& fields,
                                     std::size_t extraBytes = 0) {
  std::vector<std::uint8_t> bytes(4 + fields.size() * 4 + extraBytes, 0xAA);
  PutLittle32(bytes, 0, count);
  for (std::size_t i = 0; i < fields.size(); ++i) PutLittle32(bytes, 4 + 4 * i, fields[i]);
  return std::make_shared<const std::vector<std::uint8_t>>(std::move(bytes));
}

} // namespace

TEST(TcpOwnerEntry, The_six_fields_stand_in_their_order) {
  const auto entry = TcpEntryAt(TableOf(1, {1, 2, 3, 4, 5, 6}), 0);
  EXPECT_EQ(entry.state, 1u);
  EXPECT_EQ(entry.localAddress, 2u);
  EXPECT_EQ(entry.localPort, 3u);
  EXPECT_EQ(entry.remoteAddress, 4u);
  EXPECT_EQ(entry.remotePort, 5u);
  EXPECT_EQ(entry.owner, 6u);
}

TEST(TcpOwnerEntry, The_next_entry_stands_24_bytes_on) {
  const auto table = TableOf(2, {1, 2, 3, 4, 5, 6, 11, 12, 13, 14, 15, 16});
  EXPECT_EQ(TcpEntryAt(table, 24).owner, 16u);
}

TEST(TcpOwnerEntry, One_entry_past_the_table_is_all_zero) {
  const auto entry = TcpEntryAt(TableOf(1, {1, 2, 3, 4, 5, 6}), 24);
  EXPECT_EQ(entry.state, 0u);
  EXPECT_EQ(entry.owner, 0u);
  EXPECT_TRUE(entry.IsBlank());
}

TEST(TcpOwnerEntry, An_entry_that_the_table_cuts_short_is_all_zero) {
  EXPECT_TRUE(TcpEntryAt(TableOf(2, {1, 2, 3, 4, 5, 6}, 23), 24).IsBlank());
}

TEST(TcpOwnerEntry, An_entry_of_no_table_is_all_zero) { EXPECT_TRUE(TcpEntryAt(nullptr, 0).IsBlank()); }

TEST(TcpOwnerEntry, A_count_beyond_the_bytes_is_cut_to_what_is_there) {
  EXPECT_EQ(TcpEntryCount(TableOf(0xFFFFFFFF, {1, 2, 3, 4, 5, 6}, 10)), 1);
}

TEST(TcpOwnerEntry, A_count_below_the_bytes_stands) {
  EXPECT_EQ(TcpEntryCount(TableOf(1, {1, 2, 3, 4, 5, 6, 1, 2, 3, 4, 5, 6})), 1);
}

TEST(TcpOwnerEntry, A_table_too_short_for_its_count_is_empty) {
  EXPECT_EQ(TcpEntryCount(std::make_shared<const std::vector<std::uint8_t>>(3)), 0);
  EXPECT_EQ(TcpEntryCount(nullptr), 0);
}

TEST(TcpOwnerEntry, The_port_is_in_network_order_in_the_low_16_bits) {
  TcpOwnerEntry entry;
  entry.localPort = 0xABCD5000;
  EXPECT_EQ(entry.LocalPortNumber(), 80u);
}

TEST(TcpOwnerEntry, A_port_over_32767_comes_out_positive) {
  TcpOwnerEntry entry;
  entry.localPort = 0xFEFF;
  EXPECT_EQ(entry.LocalPortNumber(), 65534u);
}

TEST(TcpOwnerEntry, Only_an_entry_without_remote_side_and_local_port_is_blank) {
  TcpOwnerEntry entry;
  entry.state = 2;
  entry.localAddress = 0x0100007F;
  entry.owner = 5;
  EXPECT_TRUE(entry.IsBlank());
  for (std::uint32_t TcpOwnerEntry::*field :
       {&TcpOwnerEntry::localPort, &TcpOwnerEntry::remoteAddress, &TcpOwnerEntry::remotePort}) {
    TcpOwnerEntry other = entry;
    other.*field = 1;
    EXPECT_FALSE(other.IsBlank());
  }
}

} // namespace quendra::monitor
