#include "platform/process/VersionBlock.h"

#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <random>

namespace quendra::platform {
namespace {

using Bytes = std::vector<std::uint8_t>;

void Pad(Bytes& bytes) { bytes.resize((bytes.size() + 3) / 4 * 4); }
void AppendText(Bytes& bytes, TextView text) {
  for (const char16_t unit : text) {
    bytes.push_back(static_cast<std::uint8_t>(unit));
    bytes.push_back(static_cast<std::uint8_t>(unit >> 8));
  }
}

/// A node with a value of bytes, or of a text and its NUL, and nodes of its own.
Bytes Node(TextView name, const Bytes& value, bool isText, const std::vector<Bytes>& nodes) {
  Bytes bytes(6);
  AppendText(bytes, Text(name) + u'\0');
  Pad(bytes);
  bytes.insert(bytes.end(), value.begin(), value.end());
  for (const Bytes& node : nodes) {
    Pad(bytes);
    bytes.insert(bytes.end(), node.begin(), node.end());
  }
  PutLittle16(bytes, 0, static_cast<std::uint16_t>(bytes.size()));
  PutLittle16(bytes, 2, static_cast<std::uint16_t>(value.size() / (isText ? 2 : 1)));
  PutLittle16(bytes, 4, isText);
  return bytes;
}
Bytes String(TextView name, TextView text) {
  Bytes value;
  AppendText(value, Text(text) + u'\0');
  return Node(name, value, true, {});
}

const Bytes kTranslation{0x0D, 0x04, 0xB0, 0x04};

Bytes Block() {
  const Bytes strings =
      Node(u"StringFileInfo", {}, true,
           {Node(u"040D04B0", {}, true,
                 {String(u"CompanyName", u"a"), String(u"ProductName", u"\u05E9\u05DC\u05D5\u05DD 1"),
                  String(u"Comments", u"")})});
  const Bytes variables = Node(u"VarFileInfo", {}, true, {Node(u"Translation", kTranslation, false, {})});
  return Node(u"VS_VERSION_INFO", Bytes(52, 7), false, {strings, variables});
}

std::optional<std::string> TextIn(const Bytes& block, TextView path) {
  const auto value = ValueOfVersionBlock(block, path);
  if (!value) return {};
  return std::string(value->begin(), value->end());
}

using namespace std::literals;

TEST(VersionBlockTest, A_text_is_found_by_its_path_and_given_in_the_code_page_with_its_NUL) {
  EXPECT_EQ(TextIn(Block(), u"\\StringFileInfo\\040D04B0\\ProductName"), "\xF9\xEC\xE5\xED 1\0"s);
  EXPECT_EQ(TextIn(Block(), u"\\StringFileInfo\\040D04B0\\CompanyName"), "a\0"s);
  EXPECT_EQ(TextIn(Block(), u"\\StringFileInfo\\040D04B0\\Comments"), "\0"s);
}

TEST(VersionBlockTest, Other_values_are_their_bytes) {
  EXPECT_EQ(ValueOfVersionBlock(Block(), u"\\VarFileInfo\\Translation"), kTranslation);
  EXPECT_EQ(ValueOfVersionBlock(Block(), u"\\"), Bytes(52, 7));
}

TEST(VersionBlockTest, Names_have_no_case) {
  EXPECT_EQ(TextIn(Block(), u"\\stringfileinfo\\040d04B0\\PRODUCTNAME"), "\xF9\xEC\xE5\xED 1\0"s);
}

TEST(VersionBlockTest, A_path_that_is_not_there_has_no_value) {
  for (const TextView path :
       {u"\\StringFileInfo\\040904B0\\ProductName"sv, u"\\StringFileInfo\\040D04B0\\Product"sv,
        u"\\VarFileInfo\\Translation\\Below"sv, u"\\ProductName"sv,
        u"\\StringFileInfo\\040D04B0\\ProductName1"sv})
    EXPECT_FALSE(ValueOfVersionBlock(Block(), path)) << ToUtf8(path);
}

TEST(VersionBlockTest, A_text_whose_tool_counted_bytes_ends_at_its_NUL) {
  Bytes block = Node(u"B", {}, false, {String(u"Name", u"ab"), String(u"Next", u"c")});
  PutLittle16(block, 8 + 4 + 2, 6); // the length of the value of "Name", of 3 characters
  ASSERT_EQ(TextIn(block, u"\\Name"), "ab\0"s);
  EXPECT_EQ(TextIn(block, u"\\Next"), "c\0"s);
}

TEST(VersionBlockTest, A_block_that_is_cut_anywhere_is_read_to_its_end_alone) {
  const Bytes whole = Block();
  for (std::size_t size = 0; size < whole.size(); ++size) {
    const Bytes cut(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size));
    EXPECT_FALSE(ValueOfVersionBlock(cut, u"\\VarFileInfo\\Translation")) << size;
  }
}

TEST(VersionBlockTest, Lengths_that_lie_lead_neither_outside_nor_round_in_a_circle) {
  std::mt19937 random(7);
  const Bytes whole = Block();
  for (int round = 0; round < 20'000; ++round) {
    Bytes block = whole;
    for (int change = 0; change < 3; ++change)
      block[random() % block.size()] = static_cast<std::uint8_t>(random() % 4 == 0 ? random() : random() % 8);
    const auto value = ValueOfVersionBlock(block, u"\\StringFileInfo\\040D04B0\\ProductName");
    EXPECT_LE(value.value_or(Bytes()).size(), block.size());
  }
}

} // namespace
} // namespace quendra::platform
