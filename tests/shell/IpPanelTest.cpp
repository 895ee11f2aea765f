#include "shell/IpPanel.h"

#include "shell/MenuFixture.h"

namespace quendra::shell {
namespace {

class IpPanelBox : public MenuTest {};

TEST_F(IpPanelBox, Ctrl_with_I_tells_the_addresses) {
  machine.hostNames.Addresses = {"192.168.1.7", "10.0.0.5"};
  machine.ipHelper.Adapters = {{"eth0", "Network card", {"10.0.0.5"}, {"", "10.0.0.138"}}};
  ComeHome();
  EXPECT_TRUE(menu.KeyPreview);
  EXPECT_TRUE(desktop.KeyDown(menu, u'I', forms::kCtrl));
  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_EQ(desktop.Boxes[0].text, u"נתוני IP:\r\n1: 10.0.0.5\r\n2: 10.0.0.138\r\n3: 192.168.1.7");
  EXPECT_EQ(desktop.Boxes[0].flags, 0x180040);
  EXPECT_EQ(desktop.Boxes[0].title, u"זלמר בינלאומי@נט");
}

TEST_F(IpPanelBox, Ctrl_with_the_key_of_a_small_i_or_of_the_Hebrew_layout_tells_the_addresses_too) {
  ComeHome();
  desktop.KeyDown(menu, u'i', forms::kCtrl);
  desktop.KeyDown(menu, u'ן', forms::kCtrl);
  EXPECT_EQ(desktop.Boxes.size(), 2U);
}

TEST_F(IpPanelBox, The_same_keys_without_Ctrl_alone_do_nothing) {
  ComeHome();
  for (const int shift : {0, 1, 3, 4, 6, 7})
    for (const int key : {int{u'I'}, int{u'i'}, int{u'ן'}}) desktop.KeyDown(menu, key, shift);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(IpPanelBox, Ctrl_with_any_other_key_does_nothing) {
  ComeHome();
  for (const int key : {int{u'H'}, int{u'J'}, int{u'ו'}, 0, 0xD9}) desktop.KeyDown(menu, key, forms::kCtrl);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(IpPanelBox, Addresses_that_cannot_be_read_are_empty_in_the_panel) {
  machine.hostNames.FailName = true;
  ComeHome();
  desktop.KeyDown(menu, u'I', forms::kCtrl);
  EXPECT_EQ(desktop.Boxes.at(0).text, u"נתוני IP:\r\n1: \r\n2: \r\n3: ");
}

TEST_F(IpPanelBox, A_host_with_one_address_has_none_before_it) {
  machine.hostNames.Addresses = {"10.0.0.5"};
  ComeHome();
  desktop.KeyDown(menu, u'I', forms::kCtrl);
  EXPECT_EQ(desktop.Boxes.at(0).text, u"נתוני IP:\r\n1: 10.0.0.5\r\n2: \r\n3: ");
}

} // namespace
} // namespace quendra::shell
