#include "provisioning/remote_access/RasEntryImage.h"

#include "provisioning/remote_access/FullRecords.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra::provisioning {
namespace {

/// What stands before the device name and is the same in every size.
PlainImage StartOfEntry(std::uint32_t size, std::size_t behind) {
  PlainImage image(size + behind);
  image.Number(0, size).Number(4, 0x81828384).Number(8, 972).Number(12, 973);
  image.Words(16, "04").Words(27, "10.0.0.138").Number(156, size).Words(size, "111");
  image.Counted(160, 1, 20);
  image.Number(180, 1006).Number(184, 4).Number(188, 1);
  image.Words(192, "C:\\a.scp").Words(452, "C:\\a.dll").Words(712, "Dial");
  image.Words(972, "vpn").Words(989, "\xE7\xE9\xE9\xE2\xEF");
  return image;
}

PlainImage LongEntry(std::uint32_t size) {
  PlainImage image = StartOfEntry(size, 4);
  image.Words(1118, "pad").Words(1151, "address").Words(1352, "facilities").Words(1553, "data");
  image.Number(1756, 2);
  return image;
}

Bytes PlainEntry(std::uint32_t size) {
  if (size == 1672) {
    PlainImage image = StartOfEntry(size, 4);
    image.Words(1022, "pad").Words(1055, "address").Words(1256, "facilities").Words(1457, "data");
    return image.Number(1660, 2).Image();
  }
  PlainImage image = LongEntry(size);
  if (size > 1768)
    image.Number(1768, 3).Number(1772, 5).Number(1776, 75).Number(1780, 120).Number(1784, 121).Number(1788,
                                                                                                      122);
  if (size > 1768) image.Number(1792, 123);
  if (size > 1796)
    image.Number(1796, 6).Number(1800, 7).Number(1804, 8).Counted(1808, 0xA0, 16).Words(1824, "C:\\b.dll");
  if (size > 1796) image.Number(2084, 9);
  return image.Image();
}

/// What is left of the full entry on a system with records of that size.
RasEntryRecord EntryOfSize(std::uint32_t size) {
  RasEntryRecord entry = FullEntry();
  entry.alternateNumbers.push_back(u'\0'); // which stands in the image, too
  const RasEntryRecord cleared;
  if (size <= 1768) {
    entry.subEntries = cleared.subEntries;
    entry.dialMode = entry.dialExtraPercent = entry.dialExtraSampleSeconds = 0;
    entry.hangUpExtraPercent = entry.hangUpExtraSampleSeconds = entry.idleDisconnectSeconds = 0;
  }
  if (size <= 1796) {
    entry.entryType = entry.encryptionType = entry.customAuthenticationKey = entry.vpnStrategy = 0;
    entry.guid = cleared.guid;
    entry.customDialLibrary.clear();
  }
  return entry;
}

struct EntrySizes : testing::TestWithParam<std::uint32_t> {};

TEST_P(EntrySizes, Have_every_field_of_the_table_at_its_place) {
  EXPECT_EQ(RasEntryImageOf(FullEntry(), GetParam()), PlainEntry(GetParam()));
}

TEST_P(EntrySizes, Give_back_every_field_that_they_hold) {
  RasEntryRecord entry;

  TakeRasEntryImage(entry, PlainEntry(GetParam()), GetParam());

  EXPECT_EQ(entry, EntryOfSize(GetParam()));
}

TEST_P(EntrySizes, Cut_each_text_so_that_it_ends_in_a_NUL) {
  const Text longest(300, u'x');
  RasEntryRecord entry;
  for (Text RasEntryRecord::*text :
       {&RasEntryRecord::areaCode, &RasEntryRecord::localPhoneNumber, &RasEntryRecord::script,
        &RasEntryRecord::autodialLibrary, &RasEntryRecord::autodialFunction, &RasEntryRecord::deviceType,
        &RasEntryRecord::deviceName, &RasEntryRecord::x25PadType, &RasEntryRecord::x25Address,
        &RasEntryRecord::x25Facilities, &RasEntryRecord::x25UserData, &RasEntryRecord::customDialLibrary})
    entry.*text = longest;
  RasEntryRecord read;

  TakeRasEntryImage(read, RasEntryImageOf(entry, GetParam()), GetParam());

  EXPECT_EQ(read.areaCode.size(), 10U);
  EXPECT_EQ(read.localPhoneNumber.size(), 128U);
  EXPECT_EQ(read.script.size(), 259U);
  EXPECT_EQ(read.autodialLibrary.size(), 259U);
  EXPECT_EQ(read.autodialFunction.size(), 259U);
  EXPECT_EQ(read.deviceType.size(), 16U);
  EXPECT_EQ(read.deviceName.size(), GetParam() == 1672 ? 32U : 128U);
  EXPECT_EQ(read.x25PadType.size(), 32U);
  EXPECT_EQ(read.x25Address.size(), 200U);
  EXPECT_EQ(read.x25Facilities.size(), 200U);
  EXPECT_EQ(read.x25UserData.size(), 200U);
  EXPECT_EQ(read.customDialLibrary.size(), GetParam() > 1796 ? 259U : 0U);
}

TEST_P(EntrySizes, Give_texts_without_a_NUL_as_wide_as_their_fields) {
  Bytes image(GetParam(), 'x');
  RasEntryRecord entry;

  TakeRasEntryImage(entry, image, GetParam());

  EXPECT_EQ(entry.areaCode.size(), 11U);
  EXPECT_EQ(entry.deviceType.size(), 17U);
  EXPECT_EQ(entry.deviceName.size(), GetParam() == 1672 ? 33U : 129U);
  EXPECT_EQ(entry.alternateNumbers, u"") << "whose offset lies outside";
}

TEST_P(EntrySizes, Of_an_image_that_was_cut_give_the_whole_fields_alone) {
  const Bytes whole = PlainEntry(GetParam());
  for (std::size_t size = 0; size < whole.size(); size += 3) {
    RasEntryRecord entry;
    TakeRasEntryImage(entry, Bytes(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size)),
                      GetParam());
    EXPECT_EQ(entry.options, size >= 8 ? 0x81828384 : 0U);
    EXPECT_EQ(entry.script, size >= 452 ? u"C:\\a.scp" : u"");
  }
}

INSTANTIATE_TEST_SUITE_P(Published, EntrySizes, testing::Values(1672, 1768, 1796, 2088),
                         [](const auto& tested) { return std::to_string(tested.param); });

TEST(RasEntryImage, Without_alternate_numbers_has_no_offset_of_them) {
  RasEntryRecord entry = FullEntry();
  entry.alternateNumbers.clear();

  const Bytes image = RasEntryImageOf(entry, 2088);

  EXPECT_EQ(image.size(), 2089U);
  EXPECT_EQ(Bytes(image.begin() + 156, image.begin() + 160), Bytes(4));
}

TEST(RasEntryImage, Takes_alternate_numbers_from_their_offset_to_the_end_of_the_image) {
  PlainImage image(2100);
  image.Number(156, 2090).Words(2090, std::string("111\0"
                                                  "22",
                                                  6));
  RasEntryRecord entry;

  TakeRasEntryImage(entry, image.Image(), 2088);

  EXPECT_EQ(entry.alternateNumbers, Text(u"111\0"
                                         u"22\0\0\0\0",
                                         10));
}

TEST(RasEntryImage, Has_no_alternate_numbers_where_their_offset_lies_outside) {
  for (const std::uint32_t offset : {2088U, 2089U, 0x7FFFFFFFU, 0xFFFFFFFFU}) {
    RasEntryRecord entry;
    TakeRasEntryImage(entry, PlainImage(2088).Number(156, offset).Image(), 2088);
    EXPECT_EQ(entry.alternateNumbers, u"") << offset;
  }
}

TEST(RasEntryImage, Of_a_record_that_no_system_has_holds_what_lies_inside_it) {
  const Bytes shorter = RasEntryImageOf(FullEntry(), 1000);
  EXPECT_EQ(shorter.size(), 1004U);
  EXPECT_EQ(std::string(shorter.begin() + 972, shorter.begin() + 975), "vpn");
  EXPECT_EQ(shorter[989], 0);

  const Bytes longer = RasEntryImageOf(FullEntry(), 3000);
  EXPECT_EQ(longer[2084], 9);
}

TEST(RasEntryImage, Of_a_record_without_room_for_its_offsets_or_of_no_sane_size_is_a_fault) {
  for (const std::uint32_t size : {0U, 4U, 159U, 0xFFFFFFFFU})
    EXPECT_THROW(RasEntryImageOf(FullEntry(), size), Fault) << size;
}

} // namespace
} // namespace quendra::provisioning
