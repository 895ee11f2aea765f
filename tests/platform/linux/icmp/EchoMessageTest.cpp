#include "platform/linux/icmp/EchoMessage.h"

#include "platform/icmp/IcmpNumbers.h"
#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <array>
#include <functional>
#include <string>

namespace quendra::platform::linux_ {

namespace {

using Bytes = std::vector<std::uint8_t>;

const Bytes kData(32, 'a');
const Ipv4Address kTarget = Ipv4Address::FromHost(0xC0000201);
const Ipv4Address kRouter = Ipv4Address::FromHost(0x0A000001);
const Ipv4Address kSelf = Ipv4Address::FromHost(0x0A000007);
const SentEcho kSent{kTarget, 0x1234, 7, kData};

void PutChecksum(Bytes& message) {
  PutBig16(message, 2, 0);
  std::uint32_t sum = 0;
  for (std::size_t at = 0; at < message.size(); at += 2)
    sum += static_cast<std::uint32_t>(message[at] << 8 | (at + 1 < message.size() ? message[at + 1] : 0));
  while (sum >> 16 != 0) sum = (sum & 0xFFFF) + (sum >> 16);
  PutBig16(message, 2, static_cast<std::uint16_t>(~sum));
}

Bytes Packet(Ipv4Address source, Ipv4Address target, const Bytes& payload, std::uint8_t protocol = 1) {
  Bytes packet(20);
  packet[0] = 0x45;
  packet[1] = 4;
  PutBig16(packet, 2, static_cast<std::uint16_t>(20 + payload.size()));
  packet[8] = 61;
  packet[9] = protocol;
  PutLittle32(packet, 12, source.InMemory());
  PutLittle32(packet, 16, target.InMemory());
  packet.insert(packet.end(), payload.begin(), payload.end());
  return packet;
}

Bytes ReplyMessage(const SentEcho& echo = kSent) {
  Bytes message = EchoMessage(echo);
  message[0] = 0;
  PutChecksum(message);
  return message;
}
Bytes ReplyPacket(const SentEcho& echo = kSent) { return Packet(kTarget, kSelf, ReplyMessage(echo)); }

/// An error that quotes a packet.
Bytes ErrorPacket(std::uint8_t type, std::uint8_t code, const Bytes& quoted) {
  Bytes message{type, code, 0, 0, 0, 0, 0, 0};
  message.insert(message.end(), quoted.begin(), quoted.end());
  PutChecksum(message);
  return Packet(kRouter, kSelf, message);
}
Bytes OwnPacket(const SentEcho& echo = kSent) { return Packet(kSelf, kTarget, EchoMessage(echo)); }
Bytes FirstOf(const Bytes& bytes, std::size_t count) {
  return {bytes.begin(), bytes.begin() + static_cast<std::ptrdiff_t>(count)};
}

/// With one thing about the echo changed.
SentEcho With(const std::function<void(SentEcho&)>& change) {
  SentEcho changed = kSent;
  change(changed);
  return changed;
}

TEST(EchoMessageTest, The_request_bears_its_numbers_its_data_and_a_checksum) {
  const Bytes data{'h', 'i', '!'};
  EXPECT_EQ(EchoMessage({kTarget, 0x1234, 0x0102, data}),
            (Bytes{8, 0, 0x5B, 0x60, 0x12, 0x34, 1, 2, 'h', 'i', '!'}));
}

TEST(EchoMessageTest, A_reply_is_told_with_its_sender_its_TTL_and_its_data) {
  const auto reply = ReadEchoPacket(ReplyPacket(), kSent);
  ASSERT_TRUE(reply);
  EXPECT_EQ(reply->address, kTarget);
  EXPECT_EQ(reply->status, kEchoSuccess);
  EXPECT_EQ(reply->ttl, 61);
  EXPECT_EQ(reply->tos, 4);
  EXPECT_EQ(reply->data, kData);
}

TEST(EchoMessageTest, A_router_that_quotes_the_echo_is_told_with_its_status) {
  const auto reply = ReadEchoPacket(ErrorPacket(11, 0, OwnPacket()), kSent);
  ASSERT_TRUE(reply);
  EXPECT_EQ(reply->address, kRouter);
  EXPECT_EQ(reply->status, kEchoTtlExpiredInTransit);
  EXPECT_TRUE(reply->data.empty());
}

TEST(EchoMessageTest, A_quote_of_eight_bytes_is_enough) {
  EXPECT_TRUE(ReadEchoPacket(ErrorPacket(11, 0, FirstOf(OwnPacket(), 28)), kSent));
  EXPECT_FALSE(ReadEchoPacket(ErrorPacket(11, 0, FirstOf(OwnPacket(), 27)), kSent));
}

TEST(EchoMessageTest, A_quote_may_be_padded_and_followed_by_what_routers_add) {
  Bytes quoted = OwnPacket();
  quoted.resize(140, 0x20);
  EXPECT_TRUE(ReadEchoPacket(ErrorPacket(11, 0, quoted), kSent));
}

TEST(EchoMessageTest, Headers_with_options_are_read_in_replies_and_quotes) {
  const auto withOptions = [](Bytes packet) {
    packet[0] = 0x46;
    PutBig16(packet, 2, static_cast<std::uint16_t>(Big16(packet, 2) + 4));
    packet.insert(packet.begin() + 20, 4, 1);
    return packet;
  };
  EXPECT_TRUE(ReadEchoPacket(withOptions(ReplyPacket()), kSent));
  EXPECT_TRUE(ReadEchoPacket(withOptions(ErrorPacket(11, 0, withOptions(OwnPacket()))), kSent));
}

TEST(EchoMessageTest, Answers_to_others_are_not_taken) {
  const Bytes otherData(32, 'b');
  const Bytes longerData(33, 'a');
  const Bytes shorterData(31, 'a');
  const std::vector<SentEcho> others{
      With([](SentEcho& echo) { echo.id = 0x1235; }),
      With([](SentEcho& echo) { echo.sequence = 6; }),
      With([&](SentEcho& echo) { echo.data = otherData; }),
      With([&](SentEcho& echo) { echo.data = longerData; }),
      With([&](SentEcho& echo) { echo.data = shorterData; }),
  };
  for (std::size_t i = 0; i < others.size(); ++i) {
    EXPECT_FALSE(ReadEchoPacket(ReplyPacket(others[i]), kSent)) << i;
    EXPECT_FALSE(ReadEchoPacket(ErrorPacket(11, 0, OwnPacket(others[i])), kSent)) << i;
    EXPECT_FALSE(IsReplyTo(ReplyMessage(others[i]), kSent)) << i;
    EXPECT_FALSE(IsBeginOf(EchoMessage(others[i]), kSent) && others[i].data.size() >= kData.size()) << i;
  }
}

TEST(EchoMessageTest, A_quote_of_an_echo_to_somebody_else_is_not_taken) {
  EXPECT_FALSE(ReadEchoPacket(ErrorPacket(11, 0, Packet(kSelf, kRouter, EchoMessage(kSent))), kSent));
}

TEST(EchoMessageTest, A_quote_of_another_protocol_or_of_a_later_fragment_is_not_taken) {
  EXPECT_FALSE(ReadEchoPacket(ErrorPacket(11, 0, Packet(kSelf, kTarget, EchoMessage(kSent), 17)), kSent));
  Bytes fragment = OwnPacket();
  PutBig16(fragment, 6, 3);
  EXPECT_FALSE(ReadEchoPacket(ErrorPacket(11, 0, fragment), kSent));
}

TEST(EchoMessageTest, The_own_request_on_its_way_is_no_reply) {
  EXPECT_FALSE(ReadEchoPacket(OwnPacket(), kSent));
}

TEST(EchoMessageTest, A_packet_cut_anywhere_is_not_taken) {
  for (const Bytes& packet : {ReplyPacket(), ErrorPacket(11, 0, OwnPacket())})
    for (std::size_t size = 0; size < packet.size(); ++size)
      EXPECT_FALSE(ReadEchoPacket(FirstOf(packet, size), kSent)) << size << " of " << packet.size();
}

TEST(EchoMessageTest, A_message_cut_anywhere_is_no_reply) {
  for (std::size_t size = 0; size < 40; ++size)
    EXPECT_FALSE(IsReplyTo(FirstOf(ReplyMessage(), size), kSent)) << size;
}

TEST(EchoMessageTest, Forged_lengths_are_not_believed) {
  for (const int headerWords : {0, 4, 15}) {
    Bytes packet = ReplyPacket();
    packet[0] = static_cast<std::uint8_t>(0x40 | headerWords);
    EXPECT_FALSE(ReadEchoPacket(packet, kSent)) << headerWords;
  }
  for (const std::uint16_t totalSize : {0, 19, 20, 27, 28, 59, 61, 65535}) {
    Bytes packet = ReplyPacket();
    PutBig16(packet, 2, totalSize);
    EXPECT_FALSE(ReadEchoPacket(packet, kSent)) << totalSize;
    Bytes quoted = OwnPacket();
    PutBig16(quoted, 2, totalSize);
    EXPECT_FALSE(ReadEchoPacket(ErrorPacket(11, 0, quoted), kSent)) << totalSize;
  }
}

TEST(EchoMessageTest, A_false_checksum_another_version_or_protocol_is_not_taken) {
  Bytes packet = ReplyPacket();
  packet[22] ^= 1;
  EXPECT_FALSE(ReadEchoPacket(packet, kSent));
  packet = ReplyPacket();
  packet[0] = 0x65;
  EXPECT_FALSE(ReadEchoPacket(packet, kSent));
  EXPECT_FALSE(ReadEchoPacket(Packet(kTarget, kSelf, ReplyMessage(), 17), kSent));
}

TEST(EchoMessageTest, Each_error_has_its_published_status) {
  struct Case {
    std::uint8_t type;
    std::uint8_t code;
    std::uint32_t status;
  };
  for (const Case& tested : {Case{3, 0, 11002}, Case{3, 1, 11003}, Case{3, 2, 11004}, Case{3, 3, 11005},
                             Case{3, 4, 11009}, Case{3, 6, 11002}, Case{3, 7, 11003}, Case{3, 13, 11003},
                             Case{11, 0, 11013}, Case{11, 1, 11014}, Case{12, 0, 11015}})
    EXPECT_EQ(EchoStatusOf(tested.type, tested.code), tested.status) << +tested.type << " " << +tested.code;
}

TEST(EchoMessageTest, Messages_that_end_no_echo_have_no_status) {
  for (const std::uint8_t type : {0, 4, 5, 8, 13, 255}) {
    EXPECT_FALSE(EchoStatusOf(type, 0)) << +type;
    EXPECT_FALSE(ReadEchoPacket(ErrorPacket(type, 0, OwnPacket()), kSent)) << +type;
  }
}

} // namespace

} // namespace quendra::platform::linux_
