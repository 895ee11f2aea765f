#include "platform/linux/remote_access/DialTable.h"

#include "platform/linux/remote_access/RasErrorTexts.h"
#include "platform/remote_access/RemoteAccessNumbers.h"

#include <gtest/gtest.h>

namespace quendra::platform::linux_ {

namespace {

struct Row {
  std::uint64_t theirs;
  std::uint32_t ours;
};

} // namespace

TEST(DialTable, States_of_a_device_become_states_of_a_dial) {
  for (const Row& row : {Row{40, 1}, {50, 2}, {70, 14}, {80, 18}, {90, 18}, {100, 8192}})
    EXPECT_EQ(RasStateOfDevice(row.theirs), row.ours) << row.theirs;
  for (const std::uint64_t other : {0U, 10U, 20U, 30U, 60U, 110U, 120U, 4'000'000'000U})
    EXPECT_FALSE(RasStateOfDevice(other)) << other;
}

TEST(DialTable, A_device_without_its_line_tells_why_and_one_that_waits_for_a_secret_does_not) {
  for (const std::uint64_t state : {10U, 20U, 30U, 110U, 120U}) EXPECT_TRUE(EndsLine(state)) << state;
  for (const std::uint64_t state : {0U, 40U, 50U, 60U, 70U, 100U, 4'000'000'000U})
    EXPECT_FALSE(EndsLine(state)) << state;
}

TEST(DialTable, States_of_a_VPN_become_states_of_a_dial) {
  for (const Row& row : {Row{1, 1}, {3, 2}, {4, 5}, {5, 8192}})
    EXPECT_EQ(RasStateOfVpn(row.theirs), row.ours) << row.theirs;
  for (const std::uint64_t other : {0U, 2U, 6U, 7U, 4'000'000'000U})
    EXPECT_FALSE(RasStateOfVpn(other)) << other;
}

TEST(DialTable, Reasons_of_a_device_become_error_numbers) {
  for (const Row& row : {Row{3, 633},
                         {4, 720},
                         {5, 720},
                         {6, 720},
                         {7, 691},
                         {12, 633},
                         {13, 691},
                         {14, 678},
                         {35, 633},
                         {36, 633},
                         {37, 631},
                         {38, 631},
                         {39, 631},
                         {40, 678},
                         {60, 631}})
    EXPECT_EQ(RasErrorOfDevice(row.theirs, KernelPpp::There), row.ours) << row.theirs;
  for (const std::uint64_t other : {0U, 1U, 99U, 4'000'000'000U})
    EXPECT_EQ(RasErrorOfDevice(other, KernelPpp::There), 678U) << other;
}

TEST(DialTable, A_kernel_without_PPP_changes_the_meaning_of_its_failure_alone) {
  EXPECT_EQ(RasErrorOfDevice(14, KernelPpp::Missing), 633U);
  EXPECT_EQ(RasErrorOfDevice(13, KernelPpp::Missing), 691U);
  EXPECT_EQ(RasErrorOfDevice(40, KernelPpp::Missing), 678U);
  for (const std::uint64_t reason : {0U, 1U, 4U, 6U})
    EXPECT_EQ(RasErrorOfActive(reason, KernelPpp::Missing), 633U) << reason;
  EXPECT_EQ(RasErrorOfActive(2, KernelPpp::Missing), 631U);
  EXPECT_EQ(RasErrorOfActive(10, KernelPpp::Missing), 691U);
}

TEST(DialTable, Reasons_of_a_connection_become_error_numbers) {
  for (const Row& row : {Row{2, 631},
                         {3, 628},
                         {4, 678},
                         {5, 720},
                         {6, 678},
                         {7, 633},
                         {8, 633},
                         {9, 691},
                         {10, 691},
                         {11, 631},
                         {12, 633},
                         {13, 633},
                         {14, 633}})
    EXPECT_EQ(RasErrorOfActive(row.theirs, KernelPpp::There), row.ours) << row.theirs;
  for (const std::uint64_t other : {0U, 1U, 15U, 4'000'000'000U})
    EXPECT_EQ(RasErrorOfActive(other, KernelPpp::There), 678U) << other;
}

TEST(DialTable, A_line_that_stood_was_disconnected_by_the_user_or_otherwise) {
  EXPECT_EQ(RasErrorOfDrop(631), 631U);
  EXPECT_EQ(RasErrorOfDrop(711), 711U);
  for (const std::uint32_t error : {678U, 691U, 633U, 720U}) EXPECT_EQ(RasErrorOfDrop(error), 628U) << error;
}

TEST(DialTable, Every_number_that_can_come_has_a_text) {
  for (std::uint64_t reason = 0; reason < 100; ++reason) {
    for (const KernelPpp kernel : {KernelPpp::There, KernelPpp::Missing}) {
      EXPECT_NE(RasErrorText(RasErrorOfDevice(reason, kernel)), "") << reason;
      EXPECT_NE(RasErrorText(RasErrorOfActive(reason, kernel)), "") << reason;
      EXPECT_NE(RasErrorText(RasErrorOfDrop(RasErrorOfActive(reason, kernel))), "") << reason;
    }
  }
  EXPECT_EQ(RasErrorText(691), "Access denied because username and/or password is invalid on the domain.");
  EXPECT_EQ(RasErrorText(600), "");
}

} // namespace quendra::platform::linux_
