#include "platform/BehaviourFixture.h"
#include "platform/system/KeyboardLayout.h"

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

// Memory.

TEST_P(BehaviourTest, The_image_of_the_memory_has_its_length_and_no_more_available_than_there_is) {
  MemoryStatus status;
  status.Set(MemoryStatus::kLength, MemoryStatus::kBytes);

  machine.system.GlobalMemoryStatus(status);

  EXPECT_EQ(status.Get(MemoryStatus::kLength), 32U);
  EXPECT_LE(status.Get(MemoryStatus::kMemoryLoad), 100U);
  using Field = MemoryStatus::Field;
  for (const auto& [total, available] : {std::pair(Field::kTotalPhys, Field::kAvailPhys),
                                         std::pair(Field::kTotalPageFile, Field::kAvailPageFile),
                                         std::pair(Field::kTotalVirtual, Field::kAvailVirtual)}) {
    EXPECT_GT(status.Get(available), 0U) << available;
    EXPECT_LE(status.Get(available), status.Get(total)) << available;
    EXPECT_LE(status.Get(total), 0x7FFFFFFFU) << total;
  }
}

// Keyboard.

TEST_P(BehaviourTest, The_layout_is_told_as_the_user_has_it_or_not_at_all) {
  EXPECT_EQ(machine.keyboardLayout.GetKeyboardLayoutNameA(), backend->Layout());
}

} // namespace quendra::platform
