#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <array>
#include <vector>

namespace quendra {
namespace {

using Bytes = std::vector<std::uint8_t>;

const Bytes kBytes{0xEE, 0x81, 0x02, 0x03, 0x04, 0x05, 0x06, 0x07, 0xF8, 0xEE};

TEST(ByteFields, A_little_field_has_its_low_byte_first) {
  EXPECT_EQ(Little16(kBytes, 1), 0x0281U);
  EXPECT_EQ(Little32(kBytes, 1), 0x04030281U);
  EXPECT_EQ(Little64(kBytes, 1), 0xF807060504030281U);
}

TEST(ByteFields, A_big_field_has_its_high_byte_first) {
  EXPECT_EQ(Big16(kBytes, 1), 0x8102U);
  EXPECT_EQ(Big32(kBytes, 1), 0x81020304U);
  EXPECT_EQ(Big64(kBytes, 1), 0x81020304050607F8U);
}

TEST(ByteFields, What_was_put_is_read_again_and_nothing_beside_it_changes) {
  for (const std::size_t at : {0, 1, 3}) {
    Bytes bytes(12, 0xEE);
    PutLittle64(bytes, at, 0x8877665544332211U);
    EXPECT_EQ(Little64(bytes, at), 0x8877665544332211U);
    PutBig64(bytes, at, 0x8877665544332211U);
    EXPECT_EQ(Big64(bytes, at), 0x8877665544332211U);
    PutLittle32(bytes, at, 0x84332211U);
    EXPECT_EQ(Little32(bytes, at), 0x84332211U);
    PutBig32(bytes, at, 0x84332211U);
    EXPECT_EQ(Big32(bytes, at), 0x84332211U);
    PutLittle16(bytes, at, 0x8211U);
    EXPECT_EQ(Little16(bytes, at), 0x8211U);
    PutBig16(bytes, at, 0x8211U);
    EXPECT_EQ(Big16(bytes, at), 0x8211U);
    for (std::size_t i = 0; i < bytes.size(); ++i)
      if (i < at || i >= at + 8) {
        EXPECT_EQ(bytes[i], 0xEE) << i;
      }
  }
}

TEST(ByteFields, A_narrow_field_leaves_its_neighbours) {
  std::array<std::uint8_t, 6> bytes{1, 2, 3, 4, 5, 6};

  PutBig16(bytes, 1, 0xAABB);
  PutLittle16(bytes, 3, 0xAABB);

  EXPECT_EQ(bytes, (std::array<std::uint8_t, 6>{1, 0xAA, 0xBB, 0xBB, 0xAA, 6}));
}

} // namespace
} // namespace quendra
