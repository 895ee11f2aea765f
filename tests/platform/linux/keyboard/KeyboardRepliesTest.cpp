#include "platform/linux/keyboard/KeyboardReplies.h"

#include <gtest/gtest.h>

#include <vector>

namespace quendra::platform::linux_ {
namespace {

using Bytes = std::vector<std::uint8_t>;

void Put(Bytes& bytes, std::size_t at, std::uint32_t value) {
  for (std::size_t i = 0; i < 4; ++i) bytes.at(at + i) = static_cast<std::uint8_t>(value >> 8 * i);
}

/// A reply that tells the names of the groups in `mask` by the numbers.
Bytes NamesReply(std::uint8_t mask, const std::vector<std::uint32_t>& numbers) {
  Bytes reply(32 + 4 * numbers.size());
  Put(reply, 8, 0x1000);
  reply[15] = mask;
  for (std::size_t i = 0; i < numbers.size(); ++i) Put(reply, 32 + 4 * i, numbers[i]);
  return reply;
}

Bytes AtomName(std::uint16_t length, const std::string& text) {
  Bytes reply(32);
  reply[8] = static_cast<std::uint8_t>(length);
  reply[9] = static_cast<std::uint8_t>(length >> 8);
  reply.insert(reply.end(), text.begin(), text.end());
  return reply;
}

TEST(KeyboardRepliesTest, The_active_group_is_one_of_four) {
  Bytes reply(32);
  for (const unsigned group : {0U, 1U, 3U}) {
    reply[12] = static_cast<std::uint8_t>(group);
    EXPECT_EQ(ActiveGroupOf(reply), group);
  }
  for (const unsigned group : {4U, 255U}) {
    reply[12] = static_cast<std::uint8_t>(group);
    EXPECT_FALSE(ActiveGroupOf(reply));
  }
}

TEST(KeyboardRepliesTest, A_groups_name_is_found_among_those_that_are_told) {
  EXPECT_EQ(NameNumberOf(NamesReply(0b0011, {70, 71}), 0), 70U);
  EXPECT_EQ(NameNumberOf(NamesReply(0b0011, {70, 71}), 1), 71U);
  // The second group has no name of its own.
  EXPECT_EQ(NameNumberOf(NamesReply(0b1101, {70, 72, 73}), 2), 72U);
  EXPECT_EQ(NameNumberOf(NamesReply(0b1101, {70, 72, 73}), 3), 73U);
}

TEST(KeyboardRepliesTest, A_group_without_a_name_or_beyond_the_fourth_has_none) {
  EXPECT_FALSE(NameNumberOf(NamesReply(0b0001, {70}), 1));
  EXPECT_FALSE(NameNumberOf(NamesReply(0, {}), 0));
  EXPECT_FALSE(NameNumberOf(NamesReply(0xFF, {70, 71, 72, 73, 74}), 4));
}

TEST(KeyboardRepliesTest, A_reply_that_tells_more_than_names_of_groups_is_not_read) {
  Bytes reply = NamesReply(1, {70});
  Put(reply, 8, 0x1001);
  EXPECT_FALSE(NameNumberOf(reply, 0));
}

TEST(KeyboardRepliesTest, Names_that_are_announced_and_not_there_are_not_read) {
  EXPECT_FALSE(NameNumberOf(NamesReply(0b1111, {70}), 3));
  Bytes cut = NamesReply(1, {70});
  cut.pop_back();
  EXPECT_FALSE(NameNumberOf(cut, 0));
}

TEST(KeyboardRepliesTest, A_name_ends_by_its_length_and_needs_no_NUL) {
  EXPECT_EQ(NameTextOf(AtomName(6, "Hebrew\xAA\xBB")), "Hebrew");
  EXPECT_EQ(NameTextOf(AtomName(0, "")), "");
  EXPECT_EQ(NameTextOf(AtomName(4, std::string("a\0b\0", 4))), std::string("a\0b\0", 4));
}

TEST(KeyboardRepliesTest, A_name_that_is_longer_than_its_reply_is_not_read) {
  EXPECT_FALSE(NameTextOf(AtomName(7, "Hebrew")));
  EXPECT_FALSE(NameTextOf(AtomName(0xFFFF, "Hebrew")));
}

TEST(KeyboardRepliesTest, No_reply_and_a_cut_off_head_tell_nothing) {
  for (std::size_t size = 0; size < 16; ++size) {
    const Bytes reply(size, 1);
    EXPECT_FALSE(NameNumberOf(reply, 0)) << size;
    EXPECT_FALSE(NameTextOf(reply)) << size;
    EXPECT_EQ(ActiveGroupOf(reply).has_value(), size > 12) << size;
  }
}

TEST(KeyboardRepliesTest, A_replys_size_is_that_of_its_head_and_the_words_behind_it) {
  std::vector<std::uint8_t> head(32);
  EXPECT_EQ(SizeOfReply(std::span<const std::uint8_t, 32>(head)), 32U);
  Put(head, 4, 3);
  EXPECT_EQ(SizeOfReply(std::span<const std::uint8_t, 32>(head)), 44U);
}

} // namespace
} // namespace quendra::platform::linux_
