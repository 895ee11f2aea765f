#include "forms/view/png/PngReader.h"

#include "forms/view/png/PngBytes.h"

#include <gtest/gtest.h>

namespace quendra::forms {

namespace {

enum Kind : std::uint8_t { kGrey = 0, kColour = 2, kPalette = 3, kGreyAlpha = 4, kColourAlpha = 6 };

using Argb = std::vector<std::uint32_t>;

/// Empty where there are none.
Argb PixelsIn(const Bytes& file) {
  const auto pixels = ReadPng(file);
  return pixels ? pixels->argb : Argb{};
}

} // namespace

TEST(PngReader, Reads_each_kind_of_pixels) {
  EXPECT_EQ(PixelsIn(Png(2, 1, kGrey, {0, 0x10, 0x20})), (Argb{0xFF101010, 0xFF202020}));
  EXPECT_EQ(PixelsIn(Png(1, 1, kColour, {0, 1, 2, 3})), (Argb{0xFF010203}));
  EXPECT_EQ(PixelsIn(Png(1, 1, kGreyAlpha, {0, 0x10, 0x80})), (Argb{0x80101010}));
  EXPECT_EQ(PixelsIn(Png(1, 1, kColourAlpha, {0, 1, 2, 3, 4})), (Argb{0x04010203}));
}

TEST(PngReader, Looks_colours_up_in_the_palette_with_their_alpha) {
  Bytes chunks = Chunk("PLTE", Bytes{1, 2, 3, 4, 5, 6});
  Append(chunks, Chunk("tRNS", Bytes{0x80}));

  EXPECT_EQ(PixelsIn(Png(2, 1, kPalette, {0, 1, 0}, chunks)), (Argb{0xFF040506, 0x80010203}));
}

TEST(PngReader, A_place_outside_the_palette_is_seen_through) {
  EXPECT_EQ(PixelsIn(Png(1, 1, kPalette, {0, 9}, Chunk("PLTE", Bytes{1, 2, 3}))), (Argb{0}));
}

TEST(PngReader, One_colour_may_be_seen_through) {
  EXPECT_EQ(PixelsIn(Png(2, 1, kGrey, {0, 7, 8}, Chunk("tRNS", Bytes{0, 7}))), (Argb{0, 0xFF080808}));
  EXPECT_EQ(PixelsIn(Png(2, 1, kColour, {0, 1, 2, 3, 1, 2, 4}, Chunk("tRNS", Bytes{0, 1, 0, 2, 0, 3}))),
            (Argb{0, 0xFF010204}));
}

TEST(PngReader, Undoes_each_filter) {
  const Bytes plain{0, 10, 20, 30};
  const Argb second{0xFF0B0B0B, 0xFF161616, 0xFF212121}; // 11, 22, 33
  const std::vector<Bytes> rows{{1, 11, 11, 11}, {2, 1, 2, 3}, {3, 6, 7, 7}, {4, 1, 2, 3}};
  for (const Bytes& row : rows) {
    Bytes both = plain;
    Append(both, row);
    const Argb pixels = PixelsIn(Png(3, 2, kGrey, both));
    ASSERT_EQ(pixels.size(), 6U);
    EXPECT_EQ(Argb(pixels.begin() + 3, pixels.end()), second) << int{row[0]};
  }
}

TEST(PngReader, Filters_count_by_whole_pixels_and_wrap_round) {
  EXPECT_EQ(PixelsIn(Png(2, 1, kColour, {1, 0xFF, 2, 3, 2, 0xFF, 1})), (Argb{0xFFFF0203, 0xFF010104}));
}

TEST(PngReader, The_left_neighbour_comes_first_where_two_are_as_near) {
  // Left 4, above 7, left above 6: 5 is meant.
  EXPECT_EQ(PixelsIn(Png(2, 2, kGrey, {0, 6, 7, 4, 0xFE, 0}))[3], 0xFF040404);
}

TEST(PngReader, Refuses_an_unknown_filter) { EXPECT_FALSE(ReadPng(Png(1, 1, kGrey, {5, 0}))); }

TEST(PngReader, Reads_a_file_that_a_renderer_wrote) {
  const auto pixels = ReadPng(FromHex("89504e470d0a1a0a0000000d4948445200000008000000080806000000c40fbe8b0000"
                                      "0006624b474400ff00ff00ffa0bda7930000"
                                      "002149444154189563fcdfc0f09f010f60c227491d058c0c0cff1bd08450f874700300"
                                      "8dd6048d4be297e50000000049454e44ae42"
                                      "6082"));

  ASSERT_TRUE(pixels);
  EXPECT_EQ(pixels->width, 8);
  EXPECT_EQ(pixels->height, 8);
  EXPECT_EQ(pixels->argb[0], 0xFFFF8000);
  EXPECT_EQ(pixels->argb[8 * 4], 0x800000FFU);
  EXPECT_EQ(pixels->argb[63], 0U);
}

TEST(PngReader, Data_may_come_in_several_chunks) {
  const Bytes packed = Stored(Bytes{0, 1, 2, 3});
  const std::span<const std::uint8_t> all(packed);

  EXPECT_EQ(
      PixelsIn(PngOfChunks({Chunk("IHDR", HeaderData(1, 1, kColour)), Chunk("IDAT", all.first(4)),
                            Chunk("tIME", Bytes(7)), Chunk("IDAT", all.subspan(4)), Chunk("IEND", {})})),
      (Argb{0xFF010203}));
}

TEST(PngReader, Sizes_of_2048_pixels_are_taken_and_of_2049_refused) {
  EXPECT_TRUE(ReadPng(Png(2048, 1, kGrey, Bytes(2049))));
  EXPECT_TRUE(ReadPng(Png(1, 2048, kGrey, Bytes(4096))));
  EXPECT_FALSE(ReadPng(Png(2049, 1, kGrey, Bytes(2050))));
  EXPECT_FALSE(ReadPng(Png(1, 2049, kGrey, Bytes(4098))));
  EXPECT_FALSE(ReadPng(Png(0, 1, kGrey, Bytes(1))));
  EXPECT_FALSE(ReadPng(Png(0x7FFFFFFF, 0xFFFFFFFF, kGrey, Bytes(9))));
}

TEST(PngReader, Refuses_other_depths_kinds_and_interlacing) {
  for (const Bytes& header : {HeaderData(1, 1, kGrey, 16), HeaderData(1, 1, kGrey, 1), HeaderData(1, 1, 1),
                              HeaderData(1, 1, 7), HeaderData(1, 1, kGrey, 8, 1), Bytes(12), Bytes{}})
    EXPECT_FALSE(
        ReadPng(PngOfChunks({Chunk("IHDR", header), Chunk("IDAT", Stored(Bytes(20))), Chunk("IEND", {})})));
}

TEST(PngReader, Refuses_a_file_whose_bytes_do_not_have_their_check_sum) {
  Bytes file = PngOf(2, 2, 0xFF112233);
  file[50] ^= 1;

  EXPECT_FALSE(ReadPng(file));
}

TEST(PngReader, Refuses_what_it_must_know_and_passes_over_the_rest) {
  EXPECT_TRUE(ReadPng(Png(1, 1, kGrey, {0, 1}, Chunk("abCD", Bytes{1, 2}))));
  EXPECT_FALSE(ReadPng(Png(1, 1, kGrey, {0, 1}, Chunk("ABCD", Bytes{1, 2}))));
}

TEST(PngReader, Refuses_palettes_of_too_many_colours_or_of_parts_of_one) {
  EXPECT_FALSE(ReadPng(Png(1, 1, kPalette, {0, 1}, Chunk("PLTE", Bytes(257 * 3)))));
  EXPECT_FALSE(ReadPng(Png(1, 1, kPalette, {0, 1}, Chunk("PLTE", Bytes(4)))));
}

TEST(PngReader, Refuses_too_few_rows_and_bytes_that_are_no_such_file) {
  EXPECT_FALSE(ReadPng(Png(2, 2, kGrey, {0, 1, 2, 0, 1})));
  EXPECT_FALSE(ReadPng({}));
  EXPECT_FALSE(ReadPng(Signature()));
  EXPECT_FALSE(ReadPng(PngOfChunks({Chunk("IDAT", Bytes(3)), Chunk("IEND", {})})));
  EXPECT_FALSE(ReadPng(PngOfChunks({Chunk("IHDR", HeaderData(1, 1, kGrey)), Chunk("IEND", {})})));
}

TEST(PngReader, Every_cut_of_a_file_is_refused) {
  const Bytes whole = PngOf(3, 3, 0x80FF0000);
  const std::span<const std::uint8_t> file(whole);
  for (std::size_t length = 0; length < whole.size(); ++length)
    EXPECT_FALSE(ReadPng(file.first(length))) << length;
  EXPECT_TRUE(ReadPng(file));
}

} // namespace quendra::forms
