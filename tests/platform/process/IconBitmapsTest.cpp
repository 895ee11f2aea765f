#include "platform/process/IconBitmaps.h"

#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <numeric>
#include <string>

namespace quendra::platform {
namespace {

using Bytes = std::vector<std::uint8_t>;

/// What a reader of PNG files would find, chunk by chunk.
struct Chunk {
  std::string type;
  Bytes data;
  std::uint32_t check;
};
std::vector<Chunk> ChunksOf(const Bytes& file) {
  std::vector<Chunk> chunks;
  for (std::size_t at = 8; at + 12 <= file.size();) {
    const std::size_t length = Big32(file, at);
    const auto data = file.begin() + static_cast<std::ptrdiff_t>(at + 8);
    chunks.push_back(
        {{data - 4, data}, {data, data + static_cast<std::ptrdiff_t>(length)}, Big32(file, at + 8 + length)});
    at += 12 + length;
  }
  return chunks;
}

/// The bytes of the rows, out of the blocks that are stored as they are.
Bytes RowsIn(const Bytes& stream) {
  Bytes rows;
  for (std::size_t at = 2; at + 5 <= stream.size() - 4;) {
    const std::size_t length = Little16(stream, at + 1);
    EXPECT_EQ(Little16(stream, at + 3), static_cast<std::uint16_t>(~length));
    const auto from = stream.begin() + static_cast<std::ptrdiff_t>(at + 5);
    rows.insert(rows.end(), from, from + static_cast<std::ptrdiff_t>(length));
    EXPECT_EQ(stream[at], at + 5 + length == stream.size() - 4 ? 1 : 0);
    at += 5 + length;
  }
  return rows;
}
Bytes RowsOf(const IconBitmaps& icon) {
  const auto chunks = ChunksOf(PngOf(icon));
  return chunks.size() == 3 ? RowsIn(chunks[1].data) : Bytes();
}

TEST(IconBitmapsTest, The_file_is_a_PNG_of_eight_bits_with_alpha) {
  const Bytes file = PngOf({2, {0, 0, 0, 0, 0, 0}, {0, 0, 0, 0, 0, 0}});

  EXPECT_EQ(Bytes(file.begin(), file.begin() + 8), (Bytes{0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n'}));
  const auto chunks = ChunksOf(file);
  ASSERT_EQ(chunks.size(), 3U);
  EXPECT_EQ(chunks[0].type + chunks[1].type + chunks[2].type, "IHDRIDATIEND");
  EXPECT_EQ(chunks[0].data, (Bytes{0, 0, 0, 2, 0, 0, 0, 3, 8, 6, 0, 0, 0}));
  EXPECT_EQ(chunks[2].check, 0xAE426082U); // as in every PNG
  EXPECT_EQ(Big16(chunks[1].data, 0) % 31, 0);
}

TEST(IconBitmapsTest, The_mask_tells_what_shows_where_colours_have_no_alpha) {
  EXPECT_EQ(RowsOf({2, {0x112233, 0x000000, 0x000000, 0xFF0000}, {0, 0xFFFFFF, 0, 0}}),
            (Bytes{0, 0x11, 0x22, 0x33, 255, 0, 0, 0, 0, //
                   0, 0, 0, 0, 255, 255, 0, 0, 255}));
}

TEST(IconBitmapsTest, A_colour_where_the_mask_is_set_is_the_opposite_of_white) {
  EXPECT_EQ(RowsOf({1, {0xFFFFFF}, {0xFFFFFF}}), (Bytes{0, 0, 0, 0, 255}));
  EXPECT_EQ(RowsOf({1, {0xFF0000}, {0xFFFFFF}}), (Bytes{0, 0, 255, 255, 255}));
}

TEST(IconBitmapsTest, Colours_with_alpha_need_no_mask) {
  EXPECT_EQ(RowsOf({2, {0x80112233, 0x00445566}, {0xFFFFFF, 0}}),
            (Bytes{0, 0x11, 0x22, 0x33, 0x80, 0x44, 0x55, 0x66, 0}));
}

TEST(IconBitmapsTest, An_icon_of_many_pixels_takes_several_blocks_and_a_right_check) {
  constexpr std::size_t kSide = 200;
  std::vector<std::uint32_t> colours(kSide * kSide);
  std::iota(colours.begin(), colours.end(), 0xFF000000U);
  const auto chunks = ChunksOf(PngOf({kSide, colours, std::vector<std::uint32_t>(colours.size())}));

  const Bytes rows = RowsIn(chunks.at(1).data);

  ASSERT_EQ(rows.size(), kSide * (4 * kSide + 1));
  EXPECT_EQ(rows[kSide * 4 + 1 + 3], kSide); // blue of the second row's first pixel
  std::uint32_t sum = 1, sums = 0;
  for (const std::uint8_t byte : rows) sums = (sums + (sum = (sum + byte) % 65521)) % 65521;
  EXPECT_EQ(Big32(chunks[1].data, chunks[1].data.size() - 4), sums << 16 | sum);
}

TEST(IconBitmapsTest, An_icon_without_pixels_or_with_too_little_mask_has_no_image) {
  EXPECT_TRUE(PngOf({}).empty());
  EXPECT_TRUE(PngOf({0, {1}, {1}}).empty());
  EXPECT_TRUE(PngOf({2, {1, 2, 3}, {1, 2, 3}}).empty());
  EXPECT_TRUE(PngOf({1, {1, 2}, {1}}).empty());
}

} // namespace
} // namespace quendra::platform
