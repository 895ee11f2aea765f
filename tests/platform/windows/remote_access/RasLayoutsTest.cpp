#include "platform/windows/remote_access/RasEntryForms.h"

#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

namespace quendra::platform::windows {
namespace {

using RecordBytes = std::vector<std::uint8_t>;

RecordBytes BlankRecord(std::uint32_t bytes) {
  RecordBytes record(bytes);
  PutLittle32(record, 0, bytes);
  return record;
}

template <typename Wide> Wide WideOf(RasLayout layout, const RecordBytes& narrow) {
  Wide wide{};
  Widen(layout, narrow, {reinterpret_cast<std::uint8_t*>(&wide), WideBytes(layout, narrow.size())});
  return wide;
}

TEST(RasLayouts, Records_of_each_system_have_their_own_size_in_either_form) {
  EXPECT_EQ(WideBytes(kRasEntryName, RasEntryName::kBytes), 520U);
  EXPECT_EQ(WideBytes(kRasDialParams, RasDialParams::kBytesWithoutNumbers),
            offsetof(RASDIALPARAMSW, dwSubEntry));
  EXPECT_EQ(WideBytes(kRasConnection, RasConnectionRecord::kBytes), offsetof(RASCONNW, dwFlags));
  EXPECT_EQ(WideBytes(kRasConnection, RasConnectionRecord::kBytesWithoutGuid), offsetof(RASCONNW, guidEntry));
  EXPECT_EQ(WideBytes(kRasEntry, RasEntry::kBytes), offsetof(RASENTRYW, dwfOptions2));
  EXPECT_EQ(WideBytes(kRasEntry, RasEntry::kBytesWithoutEntryType), offsetof(RASENTRYW, dwType));
  EXPECT_EQ(WideBytes(kRasEntry, RasEntry::kBytesWithoutSubEntries), offsetof(RASENTRYW, dwSubEntries));
}

TEST(RasLayouts, A_size_that_no_system_has_is_none) {
  for (const std::size_t size : {0U, 3U, 4U, 1056U, 5000U})
    EXPECT_EQ(WideBytes(kRasDialParams, size), 0U) << size;
}

TEST(RasLayouts, Each_field_of_an_entry_finds_its_place) {
  RASENTRYA entry{};
  entry.dwSize = sizeof entry;
  entry.dwCountryCode = 972;
  entry.ipaddrWinsAlt.d = 7;
  entry.dwChannels = 1;
  entry.dwIdleDisconnectSeconds = 2;
  entry.guidId.Data1 = 3;
  entry.dwVpnStrategy = 4;
  entry.dwRedialPause = 5;
  ::strcpy(entry.szAreaCode, "04");
  ::strcpy(entry.szDeviceName, "\xEE\xE5\xE3\xED");
  ::strcpy(entry.szX25UserData, "x25");
  ::strcpy(entry.szPrerequisiteEntry, "\xE1\xE9\xFA");
  const auto* const bytes = reinterpret_cast<const std::uint8_t*>(&entry);

  const auto wide = WideOf<RASENTRYW>(kRasEntry, RecordBytes(bytes, bytes + sizeof entry));

  EXPECT_EQ(wide.dwSize, sizeof wide);
  EXPECT_EQ(wide.dwCountryCode, 972U);
  EXPECT_EQ(wide.ipaddrWinsAlt.d, 7);
  EXPECT_EQ(wide.dwChannels, 1U);
  EXPECT_EQ(wide.dwIdleDisconnectSeconds, 2U);
  EXPECT_EQ(wide.guidId.Data1, 3U);
  EXPECT_EQ(wide.dwVpnStrategy, 4U);
  EXPECT_EQ(wide.dwRedialPause, 5U);
  EXPECT_EQ(winapi::TextOf(wide.szAreaCode), u"04");
  EXPECT_EQ(winapi::TextOf(wide.szDeviceName), u"\u05DE\u05D5\u05D3\u05DD");
  EXPECT_EQ(winapi::TextOf(wide.szX25UserData), u"x25");
  EXPECT_EQ(winapi::TextOf(wide.szPrerequisiteEntry), u"\u05D1\u05D9\u05EA");
}

TEST(RasLayouts, A_text_without_an_end_ends_with_its_field) {
  RecordBytes narrow = BlankRecord(sizeof(RASDEVINFOA));
  std::fill(narrow.begin() + 4, narrow.end(), std::uint8_t{'x'});

  const auto wide = WideOf<RASDEVINFOW>(kRasDevice, narrow);

  EXPECT_EQ(winapi::TextOf(wide.szDeviceType), Text(16, u'x'));
  EXPECT_EQ(winapi::TextOf(wide.szDeviceName), Text(128, u'x'));
}

TEST(RasLayouts, A_text_of_the_system_without_an_end_ends_with_its_field_and_foreign_letters_are_questions) {
  RASDEVINFOW wide{};
  std::fill(std::begin(wide.szDeviceType), std::end(wide.szDeviceType), L'x');
  std::fill(std::begin(wide.szDeviceName), std::end(wide.szDeviceName), L'\u0634');
  RecordBytes narrow = BlankRecord(sizeof(RASDEVINFOA));

  Narrow(kRasDevice, {reinterpret_cast<const std::uint8_t*>(&wide), sizeof wide}, narrow);

  EXPECT_STREQ(reinterpret_cast<const char*>(&narrow[RasDeviceInfo::kType]), std::string(16, 'x').c_str());
  EXPECT_STREQ(reinterpret_cast<const char*>(&narrow[RasDeviceInfo::kName]), std::string(128, '?').c_str());
}

TEST(RasLayouts, Alternate_numbers_go_over_and_come_back_as_letters) {
  RecordBytes entry = BlankRecord(RasEntry::kBytes);
  PutLittle32(entry, RasEntry::kAlternateOffset, RasEntry::kBytes);
  for (const char sign : std::string("1\xE1\0"
                                     "22\0\0rest",
                                     10))
    entry.push_back(static_cast<std::uint8_t>(sign));

  const RecordBytes wide = WideEntryOf(entry);
  RecordBytes back = NarrowEntryOf(wide, RasEntry::kBytes);

  const std::uint32_t offset = Little32(wide, offsetof(RASENTRYW, dwAlternateOffset));
  ASSERT_EQ(wide.size(), offset + 7 * sizeof(wchar_t));
  EXPECT_EQ(winapi::TextOf(reinterpret_cast<const wchar_t*>(&wide[offset])), u"1\u05D1");
  entry.resize(entry.size() - 3);
  EXPECT_EQ(back, entry);
}

TEST(RasLayouts, Alternate_numbers_outside_an_image_are_none) {
  for (const std::uint32_t offset : {std::uint32_t{RasEntry::kBytes}, 0x7FFFFFFFU, 0xFFFFFFFFU}) {
    RecordBytes entry = BlankRecord(RasEntry::kBytes);
    PutLittle32(entry, RasEntry::kAlternateOffset, offset);
    RecordBytes wide = WideEntryOf(entry);
    EXPECT_EQ(Little32(wide, offsetof(RASENTRYW, dwAlternateOffset)), 0U);
    PutLittle32(wide, offsetof(RASENTRYW, dwAlternateOffset),
                offset + static_cast<std::uint32_t>(wide.size()));
    EXPECT_EQ(Little32(NarrowEntryOf(wide, RasEntry::kBytes), RasEntry::kAlternateOffset), 0U);
  }
}

} // namespace
} // namespace quendra::platform::windows
