#include "platform/windows/process/WindowsIcons.h"

#include "platform/windows/process/IconBitmapsOf.h"

#include <gtest/gtest.h>

namespace quendra::platform::windows {
namespace {

/// An icon of two rows of 16 pixels whose colours have that depth, masked on the right half of its first row.
class Icon {
 public:
  Icon(int depth, const std::vector<std::uint8_t>& colours) {
    const std::vector<std::uint8_t> mask{0x00, 0xFF, 0x00, 0x00};
    icon_ = ::CreateIcon(::GetModuleHandleW(nullptr), 16, 2, 1, static_cast<BYTE>(depth), mask.data(),
                         colours.data());
  }
  ~Icon() { ::DestroyIcon(icon_); }
  Icon(const Icon&) = delete;

  HICON Handle() const { return icon_; }

 private:
  HICON icon_;
};

constexpr std::uint32_t kColour = 0xFFFFFF;

TEST(WindowsIconsTest, An_icon_of_two_colours_has_its_mask_above_its_colours) {
  const Icon icon(1, {0x0F, 0xF0, 0xFF, 0x00});

  const IconBitmaps bitmaps = IconBitmapsOf(icon.Handle());

  ASSERT_EQ(bitmaps.width, 16U);
  ASSERT_EQ(bitmaps.colours.size(), 32U);
  ASSERT_EQ(bitmaps.mask.size(), 32U);
  EXPECT_EQ(bitmaps.mask[7] & kColour, 0U);
  EXPECT_EQ(bitmaps.mask[8] & kColour, kColour);
  EXPECT_EQ(bitmaps.mask[24] & kColour, 0U);
  EXPECT_EQ(bitmaps.colours[3] & kColour, 0U);
  EXPECT_EQ(bitmaps.colours[4] & kColour, kColour);
  EXPECT_EQ(bitmaps.colours[16] & kColour, kColour);
  EXPECT_EQ(bitmaps.colours[31] & kColour, 0U);
}

TEST(WindowsIconsTest, An_icon_of_many_colours_has_them_and_its_mask) {
  std::vector<std::uint8_t> colours(16 * 2 * 4);
  colours[0] = 0x33, colours[1] = 0x22, colours[2] = 0x11; // blue, green and red of the first
  colours[16 * 4] = 0xFF;                                  // blue of the second row
  const Icon icon(32, colours);

  const IconBitmaps bitmaps = IconBitmapsOf(icon.Handle());

  ASSERT_EQ(bitmaps.colours.size(), 32U);
  EXPECT_EQ(bitmaps.colours[0] & kColour, 0x112233U);
  EXPECT_EQ(bitmaps.colours[16] & kColour, 0x0000FFU);
  EXPECT_EQ(bitmaps.mask[7] & kColour, 0U);
  EXPECT_EQ(bitmaps.mask[8] & kColour, kColour);
}

TEST(WindowsIconsTest, Looking_at_an_icon_leaves_nothing_behind) {
  const Icon icon(32, std::vector<std::uint8_t>(16 * 2 * 4, 0x7F));
  // More bitmaps than a process may have.
  for (int round = 0; round < 9'000; ++round) ASSERT_EQ(IconBitmapsOf(icon.Handle()).colours.size(), 32U);
}

TEST(WindowsIconsTest, What_is_no_icon_has_no_pixels) {
  EXPECT_TRUE(IconBitmapsOf(nullptr).colours.empty());
  EXPECT_TRUE(PngOf(IconBitmapsOf(reinterpret_cast<HICON>(std::uintptr_t{0x1234}))).empty());
}

TEST(WindowsIconsTest, A_programs_icon_has_an_image_until_it_is_destroyed) {
  WindowsIcons icons;
  const Handle icon = icons.ExtractIconExA("C:\\WINDOWS\\notepad.exe", 0);
  ASSERT_NE(icon, kNoHandle);

  const std::vector<std::uint8_t> image = icons.ImageOf(icon);

  EXPECT_GT(image.size(), 32U * 32U * 4U);
  EXPECT_EQ(std::string(image.begin() + 1, image.begin() + 4), "PNG");
  EXPECT_EQ(icons.ImageOf(icon), image);
  EXPECT_TRUE(icons.DestroyIcon(icon));
  EXPECT_TRUE(icons.ImageOf(icon).empty());
  EXPECT_FALSE(icons.DestroyIcon(icon));
}

TEST(WindowsIconsTest, A_program_without_an_icon_and_an_index_behind_the_last_give_none) {
  WindowsIcons icons;
  EXPECT_EQ(icons.ExtractIconExA("C:\\WINDOWS\\notepad.exe", 999), kNoHandle);
  EXPECT_EQ(icons.ExtractIconExA("C:\\WINDOWS\\system32\\ntdll.dll", 0), kNoHandle);
}

} // namespace
} // namespace quendra::platform::windows
