#include "platform/net/Ipv4Address.h"

#include <gtest/gtest.h>

#include <sstream>
#include <unordered_set>

namespace quendra::platform {
namespace {

TEST(Ipv4Address, Reads_the_same_whichever_way_it_was_made) {
  const auto address = Ipv4Address::FromHost(0x0A00008A);

  EXPECT_EQ(address.AsText(), u"10.0.0.138");
  EXPECT_EQ(address.AsAscii(), "10.0.0.138");
  EXPECT_EQ(address.InHost(), 0x0A00008AU);
  EXPECT_EQ(address.InMemory(), 0x8A00000AU);
  EXPECT_EQ(Ipv4Address::FromMemory(0x8A00000A), address);
  EXPECT_EQ(Ipv4Address::FromText(u"10.0.0.138"), address);
  EXPECT_EQ(Ipv4Address::FromText("10.0.0.138"), address);
}

TEST(Ipv4Address, Starts_as_no_address) {
  EXPECT_TRUE(Ipv4Address().IsAny());
  EXPECT_EQ(Ipv4Address().AsText(), u"0.0.0.0");
  EXPECT_FALSE(Ipv4Address::FromHost(1).IsAny());
}

TEST(Ipv4Address, Reads_back_every_text_that_it_writes) {
  for (const std::uint32_t number : {0U, 1U, 0x01020304U, 0x7F000001U, 0xC0A80A64U, 0xFFFFFFFFU}) {
    const auto address = Ipv4Address::FromHost(number);
    EXPECT_EQ(Ipv4Address::FromText(address.AsText()), address) << address;
  }
}

TEST(Ipv4Address, A_text_that_is_not_exactly_four_plain_parts_is_no_address) {
  for (const char* text :
       {"",          "0",          "1.2.3",     "1.2.3.",   ".1.2.3",   "1.2.3.4.", "1.2.3.4.5", "1..2.3",
        "1.2.3.256", "1.2.3.0004", "01.2.3.4",  "1.2.3.04", "00.0.0.0", " 1.2.3.4", "1.2.3.4 ",  "-1.2.3.4",
        "+1.2.3.4",  "1.2.3.4x",   "0x1.2.3.4", "1,2,3,4",  "a.b.c.d",  "localhost"})
    EXPECT_FALSE(Ipv4Address::FromText(std::string_view(text))) << text;
  EXPECT_FALSE(Ipv4Address::FromText(u"1.2.3.\u0661"));
  EXPECT_FALSE(Ipv4Address::FromText(TextView(u"1.2.3.4\0", 8)));
}

TEST(Ipv4Address, Addresses_are_ordered_by_their_parts_the_first_one_first) {
  EXPECT_LT(Ipv4Address::FromHost(0x0A0000FF), Ipv4Address::FromHost(0x0B000001));
  EXPECT_GT(Ipv4Address::FromHost(0x0A000100), Ipv4Address::FromHost(0x0A0000FF));
}

TEST(Ipv4Address, The_loopback_network_is_known_by_its_first_part) {
  EXPECT_TRUE(Ipv4Address::FromHost(0x7F123456).IsLoopback());
  EXPECT_FALSE(Ipv4Address::FromMemory(0x7F000001).IsLoopback());
}

TEST(Ipv4Address, Can_be_a_key_and_be_printed) {
  const std::unordered_set<Ipv4Address> known{Ipv4Address::FromHost(1), Ipv4Address::FromHost(2)};
  std::ostringstream printed;
  printed << Ipv4Address::FromHost(0x7F000001);

  EXPECT_TRUE(known.contains(Ipv4Address::FromHost(2)));
  EXPECT_FALSE(known.contains(Ipv4Address::FromHost(3)));
  EXPECT_EQ(printed.str(), "127.0.0.1");
}

} // namespace
} // namespace quendra::platform
