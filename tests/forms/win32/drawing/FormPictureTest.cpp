#include "forms/win32/drawing/FormPicture.h"

#include <gtest/gtest.h>

namespace quendra::forms::win32 {

namespace {

constexpr Extent kSize{100, 80};
constexpr Area kWhole{{}, kSize};

class FormPictureTest : public testing::Test {
 protected:
  /// What was painted when a part was asked for.
  std::vector<Area> Painted(Area part, Extent size = kSize) {
    std::vector<Area> painted;
    picture.Bring(part, size, [&](const Drawing& drawing) { painted.push_back(drawing.Clip()); });
    return painted;
  }

  FormPicture picture;
};

} // namespace

TEST_F(FormPictureTest, Is_painted_whole_the_first_time_and_whenever_its_size_changes) {
  EXPECT_EQ(Painted({{5, 5}, {1, 1}}), std::vector<Area>{kWhole});
  EXPECT_TRUE(Painted(kWhole).empty());

  EXPECT_EQ(Painted({{5, 5}, {1, 1}}, {50, 40}), (std::vector<Area>{{{}, {50, 40}}}));
}

TEST_F(FormPictureTest, Is_painted_once_for_all_windows_that_lie_where_something_changed) {
  Painted(kWhole);

  picture.Forget({{10, 10}, {40, 20}});

  EXPECT_TRUE(Painted({{60, 10}, {10, 10}}).empty());
  EXPECT_EQ(Painted({{45, 25}, {50, 50}}), (std::vector<Area>{{{10, 10}, {40, 20}}}));
  EXPECT_TRUE(Painted(kWhole).empty());
}

TEST_F(FormPictureTest, Leaves_out_what_changed_beyond_its_edge) {
  Painted(kWhole);

  picture.Forget({{-50, 70}, {60, 60}});
  EXPECT_EQ(Painted({{0, 0}, {100, 100}}), (std::vector<Area>{{{0, 70}, {10, 10}}}));

  picture.Forget({{200, 0}, {10, 10}});
  EXPECT_TRUE(Painted({{0, 0}, {300, 100}}).empty());
}

} // namespace quendra::forms::win32
