#include "capture/LocalAddress.h"

#include "capture/mod_functions.h"

#include <array>
#include <bit>
#include <gtest/gtest.h>

namespace quendra::capture {
namespace {

platform::Ipv4Address InMemory(std::array<std::uint8_t, 4> bytes) {
  return platform::Ipv4Address::FromMemory(std::bit_cast<std::uint32_t>(bytes));
}

TEST(LocalAddress, Equals_the_address_that_reads_as_its_text) {
  LocalAddress local;
  EXPECT_TRUE(local.Equals(u"10.0.0.138", InMemory({10, 0, 0, 138})));
  EXPECT_FALSE(local.Equals(u"10.0.0.138", InMemory({138, 0, 0, 10})));
}

TEST(LocalAddress, Blanks_at_the_ends_do_not_count) {
  LocalAddress local;
  EXPECT_TRUE(local.Equals(u"  10.0.0.138 ", InMemory({10, 0, 0, 138})));
}

TEST(LocalAddress, Follows_its_text) {
  LocalAddress local;
  EXPECT_TRUE(local.Equals(u"10.0.0.1", InMemory({10, 0, 0, 1})));
  EXPECT_FALSE(local.Equals(u"10.0.0.2", InMemory({10, 0, 0, 1})));
  EXPECT_TRUE(local.Equals(u"10.0.0.2", InMemory({10, 0, 0, 2})));
  EXPECT_FALSE(local.Equals(u"", InMemory({10, 0, 0, 2})));
}

TEST(LocalAddress, A_text_that_no_decoded_address_reads_as_equals_none) {
  const Text texts[] = {u"",
                        u"0",
                        u"10.0.0",
                        u"010.0.0.138",
                        u"10.0.0.138.",
                        u"10.0.0.0138",
                        u"10 .0.0.138",
                        u"10..0.138",
                        u"266.0.0.138",
                        u"localhost",
                        u"...",
                        u"1.2.3.4.5",
                        u"-1.0.0.1",
                        u"10.0.0.\u0661"};
  for (const Text& text : texts) {
    LocalAddress local;
    for (const auto& bytes :
         {std::array<std::uint8_t, 4>{10, 0, 0, 138}, {0, 0, 0, 0}, {10, 0, 0, 0}, {1, 2, 3, 4}})
      EXPECT_FALSE(local.Equals(text, InMemory(bytes))) << ToUtf8(text);
  }
}

TEST(LocalAddress, Answers_as_a_comparison_of_texts_does) {
  LocalAddress local;
  const Text addresses[] = {u"0.0.0.0", u"255.255.255.255", u"10.0.0.138",
                            u"1.2.3.4", u" 1.2.3.4",        u"1.2.3.04"};
  for (const Text& address : addresses)
    for (const platform::Ipv4Address decoded :
         {InMemory({0, 0, 0, 0}), InMemory({255, 255, 255, 255}), InMemory({1, 2, 3, 4})})
      EXPECT_EQ(local.Equals(address, decoded),
                Trimmed(address) == mod_functions::IpFromLong(decoded.InMemory()));
}

} // namespace
} // namespace quendra::capture
