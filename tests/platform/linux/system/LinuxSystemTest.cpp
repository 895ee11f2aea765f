#include "platform/linux/system/LinuxSystem.h"

#include "platform/linux/LinuxFixture.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <ctime>

namespace quendra::platform::linux_ {
namespace {

TEST(LinuxSystemTest, The_version_is_of_the_family_with_a_TCP_owner_table) {
  LinuxSystem system;
  OsVersion version;
  ASSERT_TRUE(system.GetVersionExA(version));
  EXPECT_EQ(version.platformId, 2u);
  EXPECT_EQ(version.majorVersion, 5u);
  EXPECT_EQ(version.minorVersion, 1u);
}

TEST(LinuxSystemTest, The_tick_is_in_milliseconds) {
  std::uint64_t now = 777;
  LinuxSystem system([&] { return now; });
  const std::uint32_t before = system.GetTickCount();
  now += 1500;
  EXPECT_EQ(system.GetTickCount() - before, 1500u);
}

TEST(LinuxSystemTest, The_first_tick_lies_far_above_any_day_number_and_below_the_sign_whatever_the_uptime) {
  for (const std::uint64_t uptime :
       {0ull, 5'000ull, 0x7FFFFFFFull, 0x80000000ull, 0xFFFFFFFFull, 0x1'2345'6789ull}) {
    LinuxSystem system([=] { return uptime; });
    EXPECT_GT(system.GetTickCount(), 1'000'000u) << uptime;
    EXPECT_LT(system.GetTickCount(), 0x40000000u) << uptime;
  }
}

TEST(LinuxSystemTest, The_tick_of_this_machine_does_not_go_back) {
  LinuxSystem system;
  const std::uint32_t before = system.GetTickCount();
  EXPECT_LT(system.GetTickCount() - before, 1000u);
}

TEST(LinuxSystemTest, The_day_is_counted_so_that_day_1_is_31_December_1899) {
  const Child child([] {
    ::setenv("TZ", "UTC", 1);
    ::tzset();
    LinuxSystem system;
    const std::time_t before = std::time(nullptr) / 86400;
    const std::int32_t day = system.DayNumber();
    const std::time_t after = std::time(nullptr) / 86400;
    // 1 January 1970 is day 25569.
    return std::string(day - 25569 >= before && day - 25569 <= after ? "right" : "wrong");
  });
  EXPECT_EQ(child.Answer(), "right");
}

} // namespace
} // namespace quendra::platform::linux_
