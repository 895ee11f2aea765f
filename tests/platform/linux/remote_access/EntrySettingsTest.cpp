#include "platform/linux/remote_access/EntrySettings.h"

#include "platform/linux/remote_access/DialSettings.h"
#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

NetworkSettings LineSettingsOf(const char* type, const TextMap& userData) {
  NetworkSettings settings;
  PutText(settings, "connection", "type", type);
  PutText(settings, "vpn", "service-type", "org.freedesktop.NetworkManager.pptp");
  PutTexts(settings, "user", "data", userData);
  return settings;
}

std::vector<std::uint8_t> ImageFor(std::string_view deviceType) {
  std::vector<std::uint8_t> image(RasEntry::kBytes);
  PutLittle32(image, 0, RasEntry::kBytes);
  PutFieldText(image, RasEntry::kDeviceType, RasEntry::kDeviceTypeBytes, deviceType);
  return image;
}

} // namespace

TEST(EntrySettings, User_data_that_others_have_spoilt_gives_an_entry_all_the_same) {
  const auto image =
      EntryImageOf(LineSettingsOf("pppoe", {{"quendra.entry.version", "1"},
                                            {"quendra.entry.options", "99999999999999999999"},
                                            {"quendra.entry.country-id", "-1"},
                                            {"quendra.entry.guid", "zz"},
                                            {"quendra.entry.addresses", std::string(5000, 'a')},
                                            {"quendra.entry.script", std::string(8000, 'x')},
                                            {"quendra.entry.alternate-numbers", "3"}}),
                   LineKind::Pppoe);
  EXPECT_EQ(image.size(), RasEntry::kBytes);
  EXPECT_EQ(Little32(image, 0), RasEntry::kBytes);
  EXPECT_EQ(Little32(image, RasEntry::kOptions), 0U);
  EXPECT_EQ(Little32(image, RasEntry::kCountryId), 0U);
  EXPECT_EQ(Little32(image, RasEntry::kAddresses), 0xAAAAAAAAU);
  EXPECT_EQ(Little32(image, RasEntry::kFrameSize), 0U) << "which follows the addresses";
  EXPECT_EQ(FieldText(image, RasEntry::kScript, RasEntry::kPathBytes), std::string(259, 'x'));
  EXPECT_EQ(Little32(image, RasEntry::kAlternateOffset), 0U);
}

TEST(EntrySettings, A_device_of_no_kind_changes_nothing) {
  for (const char* type : {"", "modem", "PPPoE", "vpn "}) {
    NetworkSettings settings = LineSettingsOf("pppoe", {});
    const NetworkSettings before = settings;
    EXPECT_FALSE(PutEntryImage(settings, ImageFor(type))) << type;
    EXPECT_EQ(settings, before);
  }
}

TEST(EntrySettings, Alternate_numbers_longer_than_user_data_may_be_are_refused) {
  NetworkSettings settings = LineSettingsOf("pppoe", {});
  auto image = ImageFor("pppoe");
  PutLittle32(image, RasEntry::kAlternateOffset, RasEntry::kBytes);
  image.resize(RasEntry::kBytes + 4000, '1');
  EXPECT_TRUE(PutEntryImage(settings, image));
  image.push_back('1');
  EXPECT_FALSE(PutEntryImage(settings, image));
}

TEST(EntrySettings, Alternate_numbers_read_and_written_again_do_not_grow) {
  const std::string numbers("03-1\0"
                            "03-2\0\0",
                            11);
  auto image = ImageFor("pppoe");
  PutLittle32(image, RasEntry::kAlternateOffset, RasEntry::kBytes);
  image.insert(image.end(), numbers.begin(), numbers.end());
  const auto once = image;
  NetworkSettings settings;
  for (int round = 0; round < 3; ++round) {
    image.push_back(0); // as whoever writes a text with its end does
    ASSERT_TRUE(PutEntryImage(settings, image));
    image = EntryImageOf(settings, LineKind::Pppoe);
    EXPECT_EQ(image, once) << round;
  }
}

TEST(EntrySettings, An_offset_within_the_record_is_no_place_of_alternate_numbers) {
  auto image = ImageFor("pppoe");
  PutLittle32(image, RasEntry::kAlternateOffset, 4);
  NetworkSettings settings;
  ASSERT_TRUE(PutEntryImage(settings, image));
  EXPECT_EQ(Little32(EntryImageOf(settings, LineKind::Pppoe), RasEntry::kAlternateOffset), 0U);
}

TEST(EntrySettings, A_line_that_changes_its_kind_keeps_nothing_of_the_former) {
  NetworkSettings settings;
  ASSERT_TRUE(PutEntryImage(settings, ImageFor("pppoe")));
  PutText(settings, "pppoe", "username", "dan");
  ASSERT_TRUE(PutEntryImage(settings, ImageFor("vpn")));
  EXPECT_FALSE(settings.contains("pppoe"));
  EXPECT_EQ(LineKindOf(settings), LineKind::Vpn);
  ASSERT_TRUE(PutEntryImage(settings, ImageFor("pppoe")));
  EXPECT_FALSE(settings.contains("vpn"));
  EXPECT_EQ(LineKindOf(settings), LineKind::Pppoe);
}

TEST(EntrySettings, A_tunnel_of_another_kind_is_no_entry) {
  NetworkSettings settings = LineSettingsOf("vpn", {});
  EXPECT_EQ(LineKindOf(settings), LineKind::Vpn);
  PutText(settings, "vpn", "service-type", "org.freedesktop.NetworkManager.openvpn");
  EXPECT_FALSE(LineKindOf(settings));
  EXPECT_FALSE(LineKindOf({}));
}

TEST(EntrySettings, A_text_that_a_field_cannot_show_in_full_stays_as_long_as_it_shows_the_same) {
  const std::string longServer(300, 's');
  EXPECT_EQ(Shown(longServer, 129).size(), 128U);
  EXPECT_EQ(Kept(longServer, Shown(longServer, 129), 129), longServer);
  EXPECT_EQ(Kept("\xE6\x97\xA5", "?", 129), "\xE6\x97\xA5") << "which the code page lacks";
  EXPECT_EQ(Kept(longServer, "other", 129), "other");
}

TEST(EntrySettings, Texts_of_every_byte_survive) {
  std::string bytes;
  for (int byte = 1; byte < 256; ++byte) bytes += static_cast<char>(byte);
  auto image = ImageFor("pppoe");
  PutFieldText(image, RasEntry::kScript, RasEntry::kPathBytes, bytes);
  NetworkSettings settings;
  ASSERT_TRUE(PutEntryImage(settings, image));
  EXPECT_EQ(EntryImageOf(settings, LineKind::Pppoe), image);
}

TEST(DialSettings, The_password_of_a_tunnel_leaves_its_other_secrets) {
  NetworkSettings settings, secrets;
  PutTexts(secrets, "vpn", "secrets", {{"password", "old"}, {"other", "kept"}});
  PutPassword(settings, LineKind::Vpn, secrets, "new");
  EXPECT_EQ(TextsIn(settings, "vpn", "secrets"), (TextMap{{"other", "kept"}, {"password", "new"}}));
}

TEST(DialSettings, A_password_that_goes_leaves_the_other_secrets_of_its_connection) {
  NetworkSettings tunnel, line, none, secrets;
  PutTexts(secrets, "vpn", "secrets", {{"password", "old"}, {"other", "kept"}});
  EXPECT_TRUE(PutOtherSecrets(tunnel, LineKind::Vpn, secrets));
  EXPECT_EQ(TextsIn(tunnel, "vpn", "secrets"), (TextMap{{"other", "kept"}}));

  NetworkSettings ofLine;
  PutText(ofLine, "pppoe", "password", "old");
  EXPECT_FALSE(PutOtherSecrets(none, LineKind::Pppoe, ofLine));
  EXPECT_TRUE(none.empty());
  PutText(ofLine, "802-1x", "password", "kept");
  EXPECT_TRUE(PutOtherSecrets(line, LineKind::Pppoe, ofLine));
  EXPECT_EQ(TextIn(line, "802-1x", "password"), "kept");
  EXPECT_EQ(TextIn(line, "pppoe", "password"), "");

  NetworkSettings emptied;
  PutPassword(emptied, LineKind::Vpn, secrets, "");
  EXPECT_EQ(emptied, tunnel);
}

TEST(DialSettings, Values_of_other_types_than_texts_are_none) {
  NetworkSettings settings;
  settings["pppoe"]["username"] = BusValue::Number(7);
  settings["user"]["data"] = BusValue::Array("s", {BusValue::Text("x")});
  std::vector<std::uint8_t> params(RasDialParams::kBytes, 0xFF);
  PutLittle32(params, 0, RasDialParams::kBytes);
  ShowDialParams(settings, LineKind::Pppoe, params);
  EXPECT_TRUE(std::all_of(params.begin() + 261, params.end() - 8 - 3, [](auto byte) { return byte == 0; }));
  EXPECT_EQ(Little32(params, RasDialParams::kSubEntry), 0U);
}

} // namespace quendra::platform::linux_
