#include "platform/system/SystemTime.h"

#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

namespace quendra::platform {
namespace {

SystemTimeImage ImageOf(const std::array<std::uint16_t, 8>& fields) {
  SystemTimeImage image{};
  for (std::size_t i = 0; i < fields.size(); ++i) PutLittle16(image, 2 * i, fields[i]);
  return image;
}

TEST(SystemTime, Counts_hundreds_of_nanoseconds_from_the_start_of_1601) {
  std::uint64_t time = 0;
  ASSERT_TRUE(FileTimeOf(ImageOf({1970, 1, 4, 1, 0, 0, 0, 0}), time));
  EXPECT_EQ(time, 116'444'736'000'000'000U);
  ASSERT_TRUE(FileTimeOf(ImageOf({1601, 1, 1, 1, 0, 0, 0, 1}), time));
  EXPECT_EQ(time, 10'000U);
}

TEST(SystemTime, Of_a_file_time_leads_back_to_it) {
  constexpr std::uint64_t kMoment = 127'515'264'123'450'000; // a leap year's day, with milliseconds
  std::uint64_t time = 0;
  ASSERT_TRUE(FileTimeOf(SystemTimeOf(kMoment), time));
  EXPECT_EQ(time, kMoment);
}

TEST(SystemTime, Holds_the_day_of_the_week_from_Sunday) {
  EXPECT_EQ(Little16(SystemTimeOf(116'444'736'000'000'000U), 4), 4); // a Thursday
}

TEST(SystemTime, That_is_no_moment_is_refused) {
  std::uint64_t time = 7;
  for (const auto& fields : {std::array<std::uint16_t, 8>{2004, 13, 0, 1, 0, 0, 0, 0},
                             {2005, 2, 0, 29, 0, 0, 0, 0},
                             {2005, 2, 0, 1, 24, 0, 0, 0},
                             {2005, 2, 0, 1, 0, 0, 0, 1000},
                             {1600, 2, 0, 1, 0, 0, 0, 0},
                             {0, 0, 0, 0, 0, 0, 0, 0}})
    EXPECT_FALSE(FileTimeOf(ImageOf(fields), time)) << fields[0] << " " << fields[1];
  EXPECT_EQ(time, 7U);
}

} // namespace
} // namespace quendra::platform
