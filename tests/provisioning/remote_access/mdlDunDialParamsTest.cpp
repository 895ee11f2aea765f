#include "provisioning/remote_access/MdlDunFixture.h"
#include "provisioning/remote_access/RasDialParamsImage.h"

namespace quendra::provisioning {
namespace {

struct MdlDunDialParams : MdlDunFixture {
  MdlDunDialParams() { ras.AddEntry("Home").SetLogin("user", "secret"); }
  Bytes image{1, 2, 3};
  Boolean16 hasPassword = 77;
};

struct SystemsBySize : MdlDunDialParams, testing::WithParamInterface<std::uint32_t> {};

TEST_P(SystemsBySize, Give_what_is_saved_in_the_size_that_they_have) {
  ras.DialParamsSizes = {GetParam()};

  EXPECT_EQ(dun.GetDialParamsBytes(image, none, home, hasPassword), 0U);
  EXPECT_EQ(dun.DialParamsFromBytes(image, params), kTrue16);

  EXPECT_EQ(image.size(), GetParam());
  EXPECT_EQ(params.size, GetParam());
  EXPECT_EQ(params.entryName, u"Home");
  EXPECT_EQ(params.userName, u"user");
  EXPECT_EQ(params.password, u"secret");
  EXPECT_EQ(hasPassword, kTrue16);
}

TEST_P(SystemsBySize, Take_what_is_saved_in_the_size_that_they_have) {
  ras.DialParamsSizes = {GetParam()};

  EXPECT_EQ(dun.DialParamsToBytes(FullDialParams(), image), kTrue16);
  EXPECT_EQ(dun.SetDialParamsBytes(none, image, kFalse16), 0U);

  EXPECT_EQ(image.size(), GetParam());
  EXPECT_EQ(ras.Entry("Home")->userName, "user@097");
  EXPECT_EQ(ras.Entry("Home")->subEntry, GetParam() == 1060 ? 11U : 0U);
}

INSTANTIATE_TEST_SUITE_P(Published, SystemsBySize, testing::Values(1060, 1052, 816),
                         [](const auto& tested) { return std::to_string(tested.param); });

TEST_F(MdlDunDialParams, The_longest_size_that_a_system_has_is_taken) {
  dun.GetDialParamsBytes(image, none, home, hasPassword);
  EXPECT_EQ(image.size(), 1060U);
  EXPECT_EQ(ras.Count("RasGetEntryDialParamsA"), 1);

  ras.DialParamsSizes = {816, 1052};
  dun.DialParamsToBytes(params, image);
  EXPECT_EQ(image.size(), 1052U);
}

TEST_F(MdlDunDialParams, The_last_failure_is_given_when_no_size_gives_anything) {
  Text nobody = u"Nobody";
  EXPECT_EQ(dun.GetDialParamsBytes(image, none, nobody, hasPassword), 623U);
  EXPECT_EQ(ras.Count("RasGetEntryDialParamsA"), 3);
  EXPECT_EQ(hasPassword, kFalse16);

  ras.DialParamsSizes = {1060};
  EXPECT_EQ(dun.GetDialParamsBytes(image, none, nobody, hasPassword), 632U);
}

TEST_F(MdlDunDialParams, No_password_is_told_by_the_flag) {
  ras.Entry("Home")->password.clear();

  dun.GetDialParamsBytes(image, none, home, hasPassword);

  EXPECT_EQ(hasPassword, kFalse16);
}

TEST_F(MdlDunDialParams, The_phone_book_goes_to_the_system_as_it_is) {
  machine.system.Version = {1, 4, 0, 0};

  dun.GetDialParamsBytes(image, book, home, hasPassword);

  EXPECT_EQ(ras.PhoneBookOf["RasGetEntryDialParamsA"], "C:\\a.pbk");
  EXPECT_EQ(book, u"C:\\a.pbk");
}

TEST_F(MdlDunDialParams, A_saved_password_is_removed_by_the_flag) {
  dun.GetDialParamsBytes(image, none, home, hasPassword);

  EXPECT_EQ(dun.SetDialParamsBytes(none, image, kTrue16), 0U);

  EXPECT_EQ(ras.Entry("Home")->password, "");
  EXPECT_EQ(ras.Entry("Home")->userName, "user");
}

TEST_F(MdlDunDialParams, Without_a_size_that_the_system_takes_nothing_is_written) {
  ras.DialParamsSizes = {};

  EXPECT_EQ(dun.DialParamsToBytes(params, image), kFalse16);

  EXPECT_EQ(image, (Bytes{1, 2, 3}));
  EXPECT_EQ(ras.Count("RasGetEntryDialParamsA"), 3);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(MdlDunDialParams, A_size_is_proved_by_the_missing_entry_alone) {
  ras.Refuse("RasGetEntryDialParamsA", 0);
  ras.IsThere = false;

  EXPECT_EQ(dun.DialParamsToBytes(params, image), kFalse16);
}

TEST_F(MdlDunDialParams, An_image_of_another_size_fails_without_a_box) {
  image.assign(1060, 0);
  image[0] = 77;

  EXPECT_EQ(dun.DialParamsFromBytes(image, params), kFalse16);

  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(MdlDunDialParams, An_image_shorter_than_its_size_is_told_as_a_fault) {
  image = EmptyRasDialParams(1060, home);
  image.pop_back();

  EXPECT_EQ(dun.DialParamsFromBytes(image, params), kFalse16);

  ExpectOneBox(FaultBox(u"DialParamsFromBytes", u"9", u"Subscript out of range"));
}

} // namespace
} // namespace quendra::provisioning
