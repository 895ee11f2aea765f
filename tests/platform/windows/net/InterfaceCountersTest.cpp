#include "platform/windows/net/InterfaceCounters.h"

#include "platform/windows/net/WindowsIpHelper.h"

#include <gtest/gtest.h>

#include <cstring>
#include <utility>

namespace quendra::platform::windows {

namespace {

InterfaceRow RowWithOctets(std::uint32_t index, std::uint32_t in, std::uint32_t out = 0) {
  InterfaceRow row;
  row.Set(InterfaceRow::kIndex, index);
  row.Set(InterfaceRow::kInOctets, in);
  row.Set(InterfaceRow::kOutOctets, out);
  return row;
}

TEST(InterfaceCountersTest, Count_from_the_start_and_from_0_where_they_began_later) {
  InterfaceCounters counters(std::vector{RowWithOctets(1, 3'000'000'000u, 500)});
  InterfaceRow now = RowWithOctets(1, 3'000'000'100u, 520);
  InterfaceRow newcomer = RowWithOctets(2, 7);

  counters.CountFromStart(now);
  counters.CountFromStart(newcomer);

  EXPECT_EQ(now.Get(InterfaceRow::kInOctets), 100u);
  EXPECT_EQ(now.Get(InterfaceRow::kOutOctets), 20u);
  EXPECT_EQ(newcomer.Get(InterfaceRow::kInOctets), 7u);
}

TEST(InterfaceCountersTest, One_that_passes_its_32_bits_goes_on) {
  InterfaceCounters counters(std::vector{RowWithOctets(1, 4'294'967'290u, 500)});
  InterfaceRow now = RowWithOctets(1, 4, 510);

  counters.CountFromStart(now);

  EXPECT_EQ(now.Get(InterfaceRow::kInOctets), 10u);
  EXPECT_EQ(now.Get(InterfaceRow::kOutOctets), 10u);
}

TEST(InterfaceCountersTest, Those_that_began_anew_do_not_fall_back_when_they_pass_their_old_start) {
  InterfaceCounters counters(std::vector{RowWithOctets(1, 100)});
  std::vector<std::uint32_t> told;
  for (const std::uint32_t octets : {150u, 20u, 99u, 101u}) {
    InterfaceRow now = RowWithOctets(1, octets);
    counters.CountFromStart(now);
    told.push_back(now.Get(InterfaceRow::kInOctets));
  }
  EXPECT_EQ(told, (std::vector<std::uint32_t>{50, 20, 99, 101}));
}

// In place of the library's: a card that has carried more than can be reckoned with.

DWORD octetsOfTheCard = 0;

DWORD WINAPI TellOctets(MIB_IFTABLE* room, ULONG* size, BOOL) {
  MIB_IFTABLE table{};
  table.dwNumEntries = 1;
  table.table[0].dwIndex = 1;
  table.table[0].dwInOctets = octetsOfTheCard;
  const DWORD had = std::exchange(*size, sizeof table);
  if (had < sizeof table) return ERROR_INSUFFICIENT_BUFFER;
  std::memcpy(room, &table, sizeof table);
  return 0;
}

TEST(InterfaceCountersTest, The_table_tells_what_was_carried_since_the_program_began) {
  IpHelperLibrary library;
  library.GetIfTable = TellOctets;
  octetsOfTheCard = 3'000'000'000u;
  WindowsIpHelper ipHelper(library, false);
  octetsOfTheCard += 1500;
  std::vector<std::uint8_t> buffer(8192);
  auto size = static_cast<std::uint32_t>(buffer.size());

  ASSERT_EQ(ipHelper.GetIfTable(buffer, size, false), 0u);

  EXPECT_EQ(Little32(buffer, InterfaceRow::kFirstOffset + InterfaceRow::kInOctets), 1500u);
}

} // namespace

} // namespace quendra::platform::windows
