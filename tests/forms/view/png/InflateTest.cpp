#include "forms/view/png/Inflate.h"

#include "forms/view/png/HuffmanCode.h"
#include "forms/view/png/PngBytes.h"

#include <gtest/gtest.h>

#include <string>

namespace quendra::forms {

namespace {

/// Packed by zlib with codes of its own.
constexpr std::string_view kSquares = "78da3dd2318e04210c04c0dcafd82760b7f1c0832ed8e0a2bdffeb8c4d6f32528f1054"
                                      "1bf4f5f7fefdf9bcf4f5ce8fd88d76a20b6ec4"
                                      "895bfc46afc521f3e679b24d899be364843c373fb5db9675f33a395cf6cdfbe4a5a283"
                                      "9a51278c21aafcd542cb55446a29d55d945045"
                                      "d3b628b1dada1da2f46a8353ac246b74875c45b516db56ee45b8961c9627d2aebbcbe6"
                                      "eca8b7d27bea8d7a2bbd7baefa8eb867bc5c8c"
                                      "7a2bfdb42d46bd957e3e2146bd953e526fd45be9e3aca2de4aff9cbda8b7d23fe744ea"
                                      "ad479f2e508fd2efd4837a947e6747508f9efd"
                                      "c851e0fb4a7af8232706fad1d3d71c2c5800b3af321b800d10fd2faf09ac80aaa0c8db"
                                      "043b60dd3bcf735902554267be0d670bef1714"
                                      "59e31f0687c184";

std::string Squares() {
  std::string text;
  for (int i = 1; i <= 40; ++i)
    text += std::to_string(i) + " times " + std::to_string(i) + " is " + std::to_string(i * i) + "\n";
  return text;
}

/// What is unpacked of it; empty where that fails.
std::string Unpacked(const Bytes& packed, std::size_t length) {
  Bytes unpacked(length);
  if (!Inflate(packed, unpacked)) return {};
  return {unpacked.begin(), unpacked.end()};
}

} // namespace

TEST(Inflate, Copies_what_was_stored) {
  EXPECT_EQ(Unpacked(FromHex("7801010500faff706c61696e"), 5), "plain");
}

TEST(Inflate, Unpacks_the_fixed_code_and_copies_that_reach_into_themselves) {
  EXPECT_EQ(Unpacked(FromHex("7801cbcf4b55c847c225e5f9303600871009a7"), 27), "one one one one two one one");
}

TEST(Inflate, Unpacks_codes_that_the_data_tells) {
  EXPECT_EQ(Unpacked(FromHex(kSquares), Squares().size()), Squares());
}

TEST(Inflate, Stops_where_as_much_as_wanted_is_there) {
  EXPECT_EQ(Unpacked(FromHex(kSquares), 100), Squares().substr(0, 100));
}

TEST(Inflate, Fails_where_the_data_has_less) {
  EXPECT_EQ(Unpacked(FromHex(kSquares), Squares().size() + 1), "");
}

TEST(Inflate, Fails_at_every_cut) {
  const Bytes whole = FromHex(kSquares);
  constexpr std::size_t kUnread = 6; // the end of the block and the check sum
  for (std::size_t length = 0; length + kUnread < whole.size(); ++length)
    EXPECT_EQ(
        Unpacked({whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length)}, Squares().size()), "")
        << length;
}

TEST(Inflate, Fails_for_other_methods_dictionaries_and_broken_headers) {
  for (const char* header : {"7701", "7820", "7802", "78", ""})
    EXPECT_EQ(Unpacked(FromHex(std::string(header) + "010500faff706c61696e"), 5), "") << header;
}

TEST(Inflate, Fails_for_a_stored_length_that_does_not_match_its_complement) {
  EXPECT_EQ(Unpacked(FromHex("7801010500fbff706c61696e"), 5), "");
}

TEST(Inflate, Fails_for_a_block_of_an_unknown_kind) { EXPECT_EQ(Unpacked(FromHex("780107"), 1), ""); }

// A fixed block that begins with a copy: there is nothing before it.
TEST(Inflate, Fails_for_a_copy_of_what_lies_before_the_beginning) {
  EXPECT_EQ(Unpacked(FromHex("7801030200"), 3), "");
}

TEST(HuffmanCode, Reads_codes_of_up_to_15_bits) {
  std::vector<std::uint8_t> lengths;
  for (std::uint8_t length = 1; length <= 15; ++length) lengths.push_back(length);
  lengths.push_back(15);
  HuffmanCode code;
  ASSERT_TRUE(code.Build(lengths));
  // Fourteen ones and a zero; fifteen ones; a zero.
  const Bytes data{0xFF, 0xBF, 0xFF, 0x3F};
  BitReader bits(data);

  EXPECT_EQ(code.Read(bits), 14);
  EXPECT_EQ(code.Read(bits), 15);
  EXPECT_EQ(code.Read(bits), 0);
  EXPECT_FALSE(bits.RanOut());
}

TEST(HuffmanCode, Takes_no_lengths_of_more_codes_than_there_are) {
  HuffmanCode code;

  EXPECT_FALSE(code.Build(Bytes{1, 1, 1}));
  EXPECT_FALSE(code.Build(Bytes{1, 2, 2, 15}));
  EXPECT_FALSE(code.Build(Bytes{16}));
}

TEST(HuffmanCode, Reads_nothing_where_a_code_is_unfinished) {
  HuffmanCode code;
  ASSERT_TRUE(code.Build(Bytes{1}));
  const Bytes data{0xFF, 0xFF};
  BitReader bits(data);

  EXPECT_EQ(code.Read(bits), -1);
}

TEST(BitReader, Tells_when_more_was_taken_than_there_was) {
  const Bytes data{0xA5};
  BitReader bits(data);

  EXPECT_EQ(bits.Peek(15), 0xA5U);
  EXPECT_EQ(bits.Take(8), 0xA5U);
  EXPECT_FALSE(bits.RanOut());
  EXPECT_EQ(bits.Take(1), 0U);
  EXPECT_TRUE(bits.RanOut());
}

} // namespace quendra::forms
