#include "platform/BehaviourFixture.h"

namespace quendra::platform {

TEST_P(BehaviourTest, The_version_is_of_the_family_with_an_owner_table) {
  OsVersion version;

  ASSERT_TRUE(machine.system.GetVersionExA(version));

  EXPECT_EQ(version.platformId, 2U);
  EXPECT_EQ(version.majorVersion, 5U);
  EXPECT_EQ(version.minorVersion, 1U);
}

TEST_P(BehaviourTest, Ticks_never_go_back_and_waiting_moves_them_on) {
  const auto first = machine.system.GetTickCount();
  const auto second = machine.system.GetTickCount();
  machine.system.Sleep(25);
  const auto third = machine.system.GetTickCount();

  EXPECT_LT(second - first, 60000U);
  // Ticks may move in steps of 10 ms, as the system's own do.
  EXPECT_GE(third - second, 10U);
  EXPECT_LT(third - second, 60000U);
}

TEST_P(BehaviourTest, The_day_number_is_one_of_this_century) {
  EXPECT_GT(machine.system.DayNumber(), 36526);
  EXPECT_LT(machine.system.DayNumber(), 73050);
}

TEST_P(BehaviourTest, The_second_of_the_day_lies_between_midnight_and_midnight) {
  EXPECT_GE(machine.system.SecondOfDay(), 0);
  EXPECT_LT(machine.system.SecondOfDay(), 86400);
}

} // namespace quendra::platform
