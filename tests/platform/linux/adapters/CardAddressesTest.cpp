#include "platform/linux/adapters/CardAddresses.h"

#include "platform/adapters/AdapterNumbers.h"

#include <gtest/gtest.h>

namespace quendra::platform::linux_ {

namespace {

std::uint32_t ResultOfAddress(const std::string& address, const std::string& mask) {
  std::vector<CardAddress> read;
  return ReadCardAddresses({address}, {mask}, read);
}

std::uint32_t ResultOfGateway(const std::string& gateway) {
  CardGateway read;
  return ReadCardGateway({gateway}, {1}, read);
}

} // namespace

TEST(CardAddresses, An_address_and_its_mask_become_an_address_and_a_prefix) {
  std::vector<CardAddress> read;
  EXPECT_EQ(ReadCardAddresses({"10.200.1.1", "192.168.0.5"}, {"255.0.0.0", "255.255.255.252"}, read),
            kCardChanged);
  ASSERT_EQ(read.size(), 2U);
  EXPECT_EQ(read[0], (CardAddress{Ipv4Address::FromHost(0x0AC80101), 8}));
  EXPECT_EQ(read[1].prefix, 30U);
}

TEST(CardAddresses, What_is_no_address_of_a_host_is_refused) {
  for (const char* address : {"", "10.0.0", "10.0.0.256", "0.0.0.0", "127.0.0.1", "224.0.0.1",
                              "255.255.255.255", "10.0.0.1 ", "10.0.0.1/8", "x"})
    EXPECT_EQ(ResultOfAddress(address, "255.0.0.0"), kCardInvalidAddress) << address;
}

TEST(CardAddresses, What_is_no_mask_is_refused) {
  for (const char* mask : {"", "0.0.0.0", "255.0.255.0", "0.0.0.255", "8", "255.255.255.253"})
    EXPECT_EQ(ResultOfAddress("10.0.0.1", mask), kCardInvalidSubnetMask) << mask;
  EXPECT_EQ(ResultOfAddress("10.0.0.1", "255.255.255.255"), kCardChanged);
}

TEST(CardAddresses, No_address_and_one_without_a_mask_are_refused) {
  std::vector<CardAddress> read;
  EXPECT_EQ(ReadCardAddresses({}, {}, read), kCardInvalidParameter);
  EXPECT_EQ(ReadCardAddresses({"10.0.0.1", "10.0.0.2"}, {"255.0.0.0"}, read), kCardInvalidParameter);
}

TEST(CardAddresses, A_gateway_is_one_address_of_a_host) {
  CardGateway read;
  EXPECT_EQ(ReadCardGateway({"10.0.0.138"}, {5}, read), kCardChanged);
  EXPECT_EQ(read.address.AsAscii(), "10.0.0.138");
  EXPECT_EQ(read.metric, 5U);
  EXPECT_EQ(ReadCardGateway({"10.0.0.138"}, {}, read), kCardChanged);
  EXPECT_EQ(read.metric, 1U);
  EXPECT_EQ(ResultOfGateway("0.0.0.0"), kCardInvalidGateway);
  EXPECT_EQ(ResultOfGateway("gateway"), kCardInvalidGateway);
  EXPECT_EQ(ReadCardGateway({}, {1}, read), kCardInvalidParameter);
  EXPECT_EQ(ReadCardGateway({"10.0.0.1", "10.0.0.2"}, {1}, read), kCardInvalidParameter);
}

} // namespace quendra::platform::linux_
