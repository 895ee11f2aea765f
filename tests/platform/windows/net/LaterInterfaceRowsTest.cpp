#include "platform/windows/net/LaterInterfaceRows.h"

#include "platform/windows/net/WindowsIpHelper.h"

#include <gtest/gtest.h>

#include <cstring>
#include <utility>

namespace quendra::platform::windows {

namespace {

InterfaceRow LaterRow(std::uint32_t index, std::uint32_t kind = kEthernetInterface, std::uint32_t speed = 1) {
  InterfaceRow row;
  row.Set(InterfaceRow::kIndex, index);
  row.Set(InterfaceRow::kType, kind);
  row.Set(InterfaceRow::kSpeed, speed);
  return row;
}

ListedCard CardOfIndex(std::uint32_t index) {
  ListedCard card;
  card.index = index;
  return card;
}

std::vector<std::uint32_t> Indexes(const std::vector<InterfaceRow>& rows) {
  std::vector<std::uint32_t> indexes;
  for (const InterfaceRow& row : rows) indexes.push_back(row.Get(InterfaceRow::kIndex));
  return indexes;
}

TEST(LaterInterfaceRows, Cards_and_the_loopback_are_listed_by_their_indexes_and_filters_are_not) {
  const std::vector<InterfaceRow> rows{LaterRow(12), LaterRow(13), LaterRow(1, kLoopbackInterface),
                                       LaterRow(14), LaterRow(5)};
  const std::vector<ListedCard> cards{CardOfIndex(12), CardOfIndex(5)};
  EXPECT_EQ(Indexes(AsOnXp(rows, cards)), (std::vector<std::uint32_t>{1, 5, 12}));
}

TEST(LaterInterfaceRows, There_are_no_more_than_can_be_read) {
  std::vector<InterfaceRow> rows;
  std::vector<ListedCard> cards;
  for (std::uint32_t index = 1; index <= 50; ++index) {
    rows.push_back(LaterRow(index));
    cards.push_back(CardOfIndex(index));
  }
  EXPECT_EQ(AsOnXp(rows, cards).size(), kMostInterfaceRows);
}

TEST(LaterInterfaceRows, A_speed_is_one_that_can_be_reckoned_with) {
  const std::vector<ListedCard> cards{CardOfIndex(1)};
  const auto speed = [&](std::uint32_t told) {
    const std::vector<InterfaceRow> rows{LaterRow(1, kEthernetInterface, told)};
    return AsOnXp(rows, cards).at(0).Get(InterfaceRow::kSpeed);
  };
  EXPECT_EQ(speed(0), 10'000'000u);
  EXPECT_EQ(speed(0xFFFFFFFF), 10'000'000u);
  EXPECT_EQ(speed(2'500'000'000u), 0x7FFFFFFFu);
  EXPECT_EQ(speed(1'000'000'000u), 1'000'000'000u);
}

// In place of the library's: a card, one of its filters and the loopback.

constexpr DWORD kCard = 5;

template <typename Content> DWORD Fill(void* room, DWORD& size, const Content& content) {
  const DWORD had = std::exchange(size, sizeof content);
  if (had < sizeof content) return ERROR_INSUFFICIENT_BUFFER;
  std::memcpy(room, &content, sizeof content);
  return 0;
}

DWORD WINAPI TellCard(IP_ADAPTER_INFO* room, ULONG* size) {
  IP_ADAPTER_INFO card{};
  card.Index = kCard;
  return Fill(room, *size, card);
}

DWORD WINAPI TellRows(MIB_IFTABLE* room, ULONG* size, BOOL) {
  struct {
    DWORD count = 3;
    MIB_IFROW rows[3]{};
  } table;
  for (DWORD i = 0; i < 3; ++i) table.rows[i].dwIndex = kCard + i;
  table.rows[2].dwType = kLoopbackInterface;
  return Fill(room, *size, table);
}

std::uint32_t RowsToldBy(WindowsIpHelper ipHelper) {
  std::vector<std::uint8_t> buffer(8192);
  auto size = static_cast<std::uint32_t>(buffer.size());
  EXPECT_EQ(ipHelper.GetIfTable(buffer, size, false), 0u);
  return Little32(buffer, 0);
}

TEST(LaterInterfaceRows, On_XP_the_table_is_the_systems_own) {
  IpHelperLibrary library;
  library.GetAdaptersInfo = TellCard;
  library.GetIfTable = TellRows;
  EXPECT_EQ(RowsToldBy(WindowsIpHelper(library, false)), 3u);
  EXPECT_EQ(RowsToldBy(WindowsIpHelper(library, true)), 2u);
}

} // namespace

} // namespace quendra::platform::windows
