#include "platform/capture/LinkForm.h"

#include <gtest/gtest.h>
#include <string>

namespace quendra::platform {
namespace {

/// The numbers are those of the registry of link-layer header types, told here once more on purpose.
TEST(LinkFormTest, Each_type_of_link_that_can_be_shown_as_Ethernet_has_its_form) {
  EXPECT_EQ(LinkFormOf(1), LinkForm::Ethernet);
  for (const int rawIp : {12, 228, 229}) EXPECT_EQ(LinkFormOf(rawIp), LinkForm::RawIp) << rawIp;
  for (const int family : {0, 108}) EXPECT_EQ(LinkFormOf(family), LinkForm::Family) << family;
  EXPECT_EQ(LinkFormOf(113), LinkForm::LinuxCooked);
  EXPECT_EQ(LinkFormOf(276), LinkForm::LinuxCooked2);
  for (const int ppp : {9, 50}) EXPECT_EQ(LinkFormOf(ppp), LinkForm::Ppp) << ppp;
}

TEST(LinkFormTest, Other_types_of_link_have_none) {
  for (const int other : {-1, 2, 8, 10, 51, 105, 127, 227, 230, 275, 277})
    EXPECT_FALSE(LinkFormOf(other)) << other;
}

TEST(LinkFormTest, The_filter_lets_TCP_and_tunnels_through_and_tagged_frames_of_Ethernet_not) {
  EXPECT_EQ(CaptureFilterOf(LinkForm::Ethernet), std::string("(ip proto 6 or ip proto 47) and not vlan"));
  for (const LinkForm form :
       {LinkForm::RawIp, LinkForm::Family, LinkForm::LinuxCooked, LinkForm::LinuxCooked2})
    EXPECT_EQ(CaptureFilterOf(form), std::string("ip proto 6 or ip proto 47"));
}

TEST(LinkFormTest, A_link_of_PPP_has_no_filter) { EXPECT_EQ(CaptureFilterOf(LinkForm::Ppp), std::string()); }

} // namespace
} // namespace quendra::platform
