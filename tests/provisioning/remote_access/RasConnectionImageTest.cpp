#include "provisioning/remote_access/RasConnectionImage.h"

#include "provisioning/remote_access/FullRecords.h"

#include <gtest/gtest.h>

namespace quendra::provisioning {
namespace {

Bytes PlainConnection(std::uint32_t size) {
  PlainImage image(size);
  image.Number(0, size).Number(4, 0x12345678).Words(8, "Home");
  if (size >= 412) image.Words(265, "vpn").Words(282, "device");
  if (size >= 676) image.Words(411, "C:\\a.pbk").Number(672, 3);
  if (size >= 692) image.Counted(676, 0xA0, 16);
  return image.Image();
}

struct ConnectionSizes : testing::TestWithParam<std::uint32_t> {};

TEST_P(ConnectionSizes, Give_the_fields_that_they_hold) {
  const RasConnectionFields connection = RasConnectionOf(PlainConnection(GetParam()));

  const std::uint32_t size = GetParam();
  EXPECT_EQ(connection.handle, 0x12345678U);
  EXPECT_EQ(connection.entryName, u"Home");
  EXPECT_EQ(connection.deviceType, size >= 412 ? u"vpn" : u"");
  EXPECT_EQ(connection.deviceName, size >= 412 ? u"device" : u"");
  EXPECT_EQ(connection.phoneBook, size >= 676 ? u"C:\\a.pbk" : u"");
  EXPECT_EQ(connection.subEntry, size >= 676 ? 3U : 0U);
  EXPECT_EQ(connection.guid[15], size >= 692 ? 0xAF : 0);
}

TEST_P(ConnectionSizes, Give_texts_without_a_NUL_as_wide_as_their_fields) {
  const RasConnectionFields connection = RasConnectionOf(Bytes(GetParam(), 'x'));

  EXPECT_EQ(connection.entryName.size(), GetParam() == 32 ? 21U : 257U);
  EXPECT_EQ(connection.deviceType.size(), GetParam() >= 412 ? 17U : 0U);
  EXPECT_EQ(connection.deviceName.size(), GetParam() >= 412 ? 129U : 0U);
  EXPECT_EQ(connection.phoneBook.size(), GetParam() >= 676 ? 260U : 0U);
}

INSTANTIATE_TEST_SUITE_P(Published, ConnectionSizes, testing::Values(692, 676, 412, 32),
                         [](const auto& tested) { return std::to_string(tested.param); });

TEST(RasConnectionImage, Is_tried_from_the_longest_to_the_shortest) {
  EXPECT_EQ(kRasConnectionSizes, (std::array<std::uint32_t, 4>{692, 676, 412, 32}));
}

} // namespace
} // namespace quendra::provisioning
