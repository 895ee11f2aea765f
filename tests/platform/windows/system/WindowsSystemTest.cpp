#include "platform/windows/system/WindowsSystem.h"

#include "winapi/Winapi.h"

#include <gtest/gtest.h>

#include <array>
#include <chrono>
#include <ctime>

namespace quendra::platform::windows {
namespace {

struct WindowsSystemTest : testing::Test {
  std::string Message(std::uint32_t flags, std::uint32_t number, std::size_t room = 512) {
    std::string buffer(room, 'x');
    const std::uint32_t length = system.FormatMessageA(flags, number, 0, buffer);
    if (length == 0) return {};
    EXPECT_EQ(buffer.at(length), '\0');
    return buffer.substr(0, length);
  }

  WindowsSystem system;
};

bool IsToldAsXp(const OsVersion& told) {
  const OsVersion known = AsKnown(told);
  return known.platformId == 2 && known.majorVersion == 5 && known.minorVersion == 1 &&
         known.buildNumber == told.buildNumber;
}

TEST_F(WindowsSystemTest, A_system_later_than_XP_is_told_as_XP) {
  for (const OsVersion later : {OsVersion{2, 5, 2, 3790}, OsVersion{2, 6, 0, 6002}, OsVersion{2, 6, 1, 7601},
                                OsVersion{2, 6, 2, 9200}, OsVersion{2, 10, 0, 19045}})
    EXPECT_TRUE(IsToldAsXp(later)) << later.majorVersion << "." << later.minorVersion;
}

TEST_F(WindowsSystemTest, XP_and_what_was_before_it_are_told_as_they_are) {
  EXPECT_TRUE(IsToldAsXp({2, 5, 1, 2600}));
  for (const OsVersion before :
       {OsVersion{2, 5, 0, 2195}, OsVersion{2, 4, 0, 1381}, OsVersion{2, 3, 51, 1057},
        OsVersion{1, 4, 90, 3000}, OsVersion{0, 6, 0, 1}}) {
    const OsVersion known = AsKnown(before);
    EXPECT_EQ(known.platformId, before.platformId);
    EXPECT_EQ(known.majorVersion, before.majorVersion);
    EXPECT_EQ(known.minorVersion, before.minorVersion);
  }
}

TEST_F(WindowsSystemTest, A_message_is_the_systems_own_in_the_code_page) {
  wchar_t* told = nullptr;
  const DWORD length = ::FormatMessageW(FORMAT_MESSAGE_FROM_SYSTEM | FORMAT_MESSAGE_ALLOCATE_BUFFER, nullptr,
                                        5, 0, reinterpret_cast<wchar_t*>(&told), 0, nullptr);
  ASSERT_GT(length, 0U);
  EXPECT_EQ(Message(System::kFromSystem, 5), ToCodePage(winapi::TextOf(told, length)));
  ::LocalFree(told);
}

TEST_F(WindowsSystemTest, A_number_without_a_message_has_none) {
  EXPECT_EQ(Message(System::kFromSystem, 0x12345678), "");
}

TEST_F(WindowsSystemTest, A_message_that_finds_no_room_for_its_NUL_is_not_told) {
  const std::size_t length = Message(System::kFromSystem, 5).size();
  EXPECT_EQ(Message(System::kFromSystem, 5, length), "");
  EXPECT_EQ(Message(System::kFromSystem, 5, length + 1).size(), length);
}

TEST_F(WindowsSystemTest, Flags_that_would_have_the_system_take_the_buffer_for_something_else_are_refused) {
  EXPECT_EQ(Message(System::kFromSystem | FORMAT_MESSAGE_ALLOCATE_BUFFER, 5), "");
  EXPECT_EQ(Message(FORMAT_MESSAGE_FROM_STRING, 5), "");
}

TEST_F(WindowsSystemTest, Day_and_second_are_those_of_the_local_clock) {
  const std::time_t before = std::time(nullptr);
  const std::int32_t day = system.DayNumber();
  const std::int32_t second = system.SecondOfDay();
  const std::tm local = *std::localtime(&before);
  if (local.tm_hour == 23 && local.tm_min == 59) GTEST_SKIP() << "midnight may fall between the questions";

  using namespace std::chrono;
  const sys_days date = year{local.tm_year + 1900} / (local.tm_mon + 1) / local.tm_mday;
  EXPECT_EQ(day, (date - sys_days{year{1899} / 12 / 30}).count());
  EXPECT_LT(second - ((local.tm_hour * 60 + local.tm_min) * 60 + local.tm_sec), 5);
}

TEST_F(WindowsSystemTest, A_moment_becomes_a_number_and_one_that_is_none_does_not) {
  std::uint64_t number = 7;
  std::array<std::uint8_t, 16> moment{0x41, 0x06, 1, 0, 1, 0, 2}; // 2 January 1601
  EXPECT_TRUE(system.SystemTimeToFileTime(moment, number));
  EXPECT_EQ(number, 864'000'000'000U);
  moment[2] = 13;
  EXPECT_FALSE(system.SystemTimeToFileTime(moment, number));
}

} // namespace
} // namespace quendra::platform::windows
