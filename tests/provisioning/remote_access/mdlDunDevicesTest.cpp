#include "provisioning/remote_access/MdlDunFixture.h"

namespace quendra::provisioning {
namespace {

struct MdlDunDevices : MdlDunFixture {
  MdlDunDevices() {
    ras.Devices = {
        {"modem", "Some modem"}, {"vpn", "WAN Miniport (PPTP)"}, {"pppoe", "WAN Miniport (PPPOE)"}};
  }
};

TEST_F(MdlDunDevices, A_device_is_found_by_its_type) {
  EXPECT_EQ(dun.FindDeviceName(u"pppoe", kTrue16), u"WAN Miniport (PPPOE)");
  EXPECT_EQ(dun.FindDeviceName(u"vpn", 1), u"WAN Miniport (PPTP)") << "any flag but 0";
}

TEST_F(MdlDunDevices, A_device_is_found_by_its_name_without_the_flag) {
  EXPECT_EQ(dun.FindDeviceName(u"PPPOE"), u"WAN Miniport (PPPOE)");
  EXPECT_EQ(dun.FindDeviceName(u"vpn"), u"");
}

TEST_F(MdlDunDevices, The_first_that_holds_the_text_anywhere_is_taken) {
  EXPECT_EQ(dun.FindDeviceName(u"Miniport"), u"WAN Miniport (PPTP)");
  EXPECT_EQ(dun.FindDeviceName(u"p", kTrue16), u"WAN Miniport (PPTP)");
}

TEST_F(MdlDunDevices, The_search_minds_the_case) {
  EXPECT_EQ(dun.FindDeviceName(u"PPPOE", kTrue16), u"");
  EXPECT_EQ(dun.FindDeviceName(u"miniport"), u"");
}

TEST_F(MdlDunDevices, Hebrew_names_are_searched_by_their_bytes) {
  ras.Devices = {{"modem", "\xEE\xE5\xE3\xED"}};

  EXPECT_EQ(dun.FindDeviceName(u"\u05d5\u05d3"), u"\u05de\u05d5\u05d3\u05dd");
}

TEST_F(MdlDunDevices, No_device_gives_an_empty_text) {
  EXPECT_EQ(dun.FindDeviceName(u"isdn", kTrue16), u"");
  ras.Devices.clear();
  EXPECT_EQ(dun.FindDeviceName(u"pppoe", kTrue16), u"");
}

TEST_F(MdlDunDevices, A_system_that_does_not_list_its_devices_gives_an_empty_text_without_a_box) {
  ras.Refuse("RasEnumDevicesA", 711);
  EXPECT_EQ(dun.FindDeviceName(u"pppoe", kTrue16), u"");
  ras.Refuse("RasEnumDevicesA", 711, 1);
  EXPECT_EQ(dun.FindDeviceName(u"pppoe", kTrue16), u"");

  EXPECT_TRUE(desktop.Boxes.empty());
}

} // namespace
} // namespace quendra::provisioning
