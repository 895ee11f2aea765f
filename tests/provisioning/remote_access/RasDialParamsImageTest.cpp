#include "provisioning/remote_access/RasDialParamsImage.h"

#include "provisioning/remote_access/FullRecords.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra::provisioning {
namespace {

/// The texts behind a name of that width follow each other without gaps.
Bytes PlainDialParams(std::uint32_t size) {
  PlainImage image(size);
  image.Number(0, size).Words(4, "Home");
  const std::size_t texts = size == 816 ? 25 : 261;
  image.Words(texts, "10.0.0.138").Words(texts + 129, "222").Words(texts + 258, "user@097");
  image.Words(texts + 515, "secret").Words(texts + 772, "domain");
  if (size == 1060) image.Number(1052, 11).Number(1056, 12);
  return image.Image();
}

struct DialParamsSizes : testing::TestWithParam<std::uint32_t> {};

TEST_P(DialParamsSizes, Have_every_field_of_the_table_at_its_place) {
  Bytes image(GetParam());

  PutRasDialParams(FullDialParams(), image);

  EXPECT_EQ(image, PlainDialParams(GetParam()));
}

TEST_P(DialParamsSizes, Give_back_every_field_that_they_hold) {
  RasDialParamsRecord record;

  EXPECT_TRUE(TakeRasDialParams(record, PlainDialParams(GetParam())));

  RasDialParamsRecord expected = FullDialParams();
  expected.size = GetParam();
  if (GetParam() < 1060) expected.subEntry = expected.callbackId = 0;
  EXPECT_EQ(record, expected);
}

TEST_P(DialParamsSizes, Cut_each_text_so_that_it_ends_in_a_NUL) {
  const Text longest(300, u'x');
  Bytes image(GetParam());
  PutRasDialParams({.entryName = longest,
                    .phoneNumber = longest,
                    .callbackNumber = longest,
                    .userName = longest,
                    .password = longest,
                    .domain = longest},
                   image);
  RasDialParamsRecord read;

  TakeRasDialParams(read, image);

  EXPECT_EQ(read.entryName.size(), GetParam() == 816 ? 20U : 256U);
  EXPECT_EQ(read.phoneNumber.size(), 128U);
  EXPECT_EQ(read.callbackNumber.size(), 128U);
  EXPECT_EQ(read.userName.size(), 256U);
  EXPECT_EQ(read.password.size(), 256U);
  EXPECT_EQ(read.domain.size(), 15U);
}

TEST_P(DialParamsSizes, Of_an_image_that_was_cut_are_a_fault_of_bounds) {
  const Bytes whole = PlainDialParams(GetParam());
  for (const std::size_t size : {std::size_t{4}, std::size_t{815}, whole.size() - 1}) {
    RasDialParamsRecord record;
    try {
      TakeRasDialParams(record, std::span(whole).first(size));
      ADD_FAILURE() << size;
    } catch (const Fault& fault) {
      EXPECT_EQ(fault.number, Fault::kSubscript);
    }
    EXPECT_EQ(record, RasDialParamsRecord()) << size;
  }
}

TEST_P(DialParamsSizes, Are_asked_for_by_an_image_with_nothing_but_size_and_name) {
  Bytes expected(GetParam());
  expected[0] = GetParam() & 0xFF;
  expected[1] = static_cast<std::uint8_t>(GetParam() >> 8);
  const std::size_t longest = GetParam() == 816 ? 20 : 256;
  std::fill_n(expected.begin() + 4, longest, 'x');

  EXPECT_EQ(EmptyRasDialParams(GetParam(), Text(300, u'x')), expected);
}

INSTANTIATE_TEST_SUITE_P(Published, DialParamsSizes, testing::Values(1060, 1052, 816),
                         [](const auto& tested) { return std::to_string(tested.param); });

TEST(RasDialParamsImage, Of_another_size_fails) {
  for (const std::uint32_t size : {0U, 4U, 815U, 1053U, 1061U, 0xFFFFFFFFU}) {
    RasDialParamsRecord record;
    EXPECT_FALSE(TakeRasDialParams(record, PlainImage(2000).Number(0, size).Image())) << size;
    EXPECT_EQ(record, RasDialParamsRecord());
  }
}

TEST(RasDialParamsImage, May_be_longer_than_its_record) {
  Bytes image = PlainDialParams(816);
  image.resize(3000, 0xEE);
  RasDialParamsRecord record;

  EXPECT_TRUE(TakeRasDialParams(record, image));

  EXPECT_EQ(record.domain, u"domain");
}

TEST(RasDialParamsImage, Is_too_short_for_its_size_word) {
  for (const std::size_t size : {0U, 3U}) {
    RasDialParamsRecord record;
    EXPECT_THROW(TakeRasDialParams(record, Bytes(size)), Fault);
  }
}

} // namespace
} // namespace quendra::provisioning
