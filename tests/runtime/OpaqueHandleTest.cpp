#include "runtime/OpaqueHandle.h"

#include <gtest/gtest.h>

#include <sstream>
#include <type_traits>
#include <unordered_set>

namespace quendra {
namespace {

using Door = OpaqueHandle<struct DoorKind>;
using Key = OpaqueHandle<struct KeyKind>;

TEST(OpaqueHandle, Does_not_mix_with_other_kinds_or_with_numbers) {
  EXPECT_FALSE((std::is_convertible_v<Key, Door>));
  EXPECT_FALSE((std::is_constructible_v<Door, Key>));
  EXPECT_FALSE((std::is_convertible_v<std::uint32_t, Door>));
  EXPECT_FALSE((std::is_convertible_v<Door, std::uint32_t>));
  EXPECT_FALSE((std::is_convertible_v<Door, bool>));
  EXPECT_TRUE((std::is_constructible_v<Door, std::uint32_t>));
}

TEST(OpaqueHandle, Costs_what_its_number_costs) {
  EXPECT_EQ(sizeof(Door), sizeof(std::uint32_t));
  EXPECT_TRUE(std::is_trivially_copyable_v<Door>);
}

TEST(OpaqueHandle, Starts_as_0_and_keeps_its_value) {
  EXPECT_EQ(Door().Value(), 0u);
  EXPECT_EQ(Door(0xFFFFFFFF).Value(), 0xFFFFFFFFu);
  EXPECT_EQ(Door(7), Door(7));
  EXPECT_NE(Door(7), Door(8));
  EXPECT_LT(Door(7), Door(8));
}

TEST(OpaqueHandle, Can_be_a_key_and_be_printed) {
  const std::unordered_set<Door> doors{Door(1), Door(2)};
  std::ostringstream printed;
  printed << Door(42);

  EXPECT_TRUE(doors.contains(Door(2)));
  EXPECT_FALSE(doors.contains(Door(3)));
  EXPECT_EQ(printed.str(), "42");
}

} // namespace
} // namespace quendra
