#include "platform/net/AddressList.h"

#include <gtest/gtest.h>

#include <vector>

namespace quendra::platform {

namespace {

using Bytes = std::vector<std::uint8_t>;

const std::vector<Ipv4Address> kTwo = {Ipv4Address::FromHost(0x0A000007), Ipv4Address::FromHost(0x7F000001)};

TEST(AddressList, Holds_the_count_and_the_addresses_as_they_lie_in_memory) {
  Bytes buffer(14, 0xEE);
  PutAddressList(buffer, kTwo);
  EXPECT_EQ(buffer, (Bytes{2, 0, 0, 0, 10, 0, 0, 7, 127, 0, 0, 1, 0xEE, 0xEE}));
}

TEST(AddressList, Leaves_out_what_finds_no_room) {
  Bytes buffer(11, 0xEE);
  PutAddressList(buffer, kTwo);
  EXPECT_EQ(buffer, (Bytes{1, 0, 0, 0, 10, 0, 0, 7, 0xEE, 0xEE, 0xEE}));
}

TEST(AddressList, Leaves_a_buffer_without_room_for_the_count_as_it_is) {
  Bytes buffer(3, 0xEE);
  PutAddressList(buffer, kTwo);
  EXPECT_EQ(buffer, Bytes(3, 0xEE));
}

TEST(AddressList, Gives_its_first_address) {
  Bytes buffer(12);
  PutAddressList(buffer, kTwo);
  EXPECT_EQ(FirstOfAddressList(buffer), Ipv4Address::FromHost(0x0A000007));
}

TEST(AddressList, Has_no_first_address_when_it_is_empty_or_cut_short) {
  EXPECT_FALSE(FirstOfAddressList(Bytes{0, 0, 0, 0, 10, 0, 0, 7}));
  EXPECT_FALSE(FirstOfAddressList(Bytes{1, 0, 0, 0, 10, 0, 0}));
  EXPECT_FALSE(FirstOfAddressList(Bytes{}));
}

} // namespace

} // namespace quendra::platform
