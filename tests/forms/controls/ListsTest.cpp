#include "RecordingViewFixture.h"
#include "forms/controls/ComboBox.h"
#include "forms/controls/ImageList.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

struct ComboBoxTest : testing::Test {
  BareForm form;
  ComboBox combo{form, u"main_cmbAdapters"};
  int clicks = 0;
  RecordingView view;

  ComboBoxTest() {
    combo.AddItem(u"first");
    combo.AddItem(u"second");
    combo.Click = [this] { ++clicks; };
  }
};

TEST_F(ComboBoxTest, Nothing_is_selected_at_first) {
  EXPECT_EQ(combo.ListIndex(), -1);
  EXPECT_EQ(combo.SelectedText(), u"");
}

TEST_F(ComboBoxTest, Selecting_raises_a_click) {
  combo.SelectItem(1);

  EXPECT_EQ(combo.SelectedText(), u"second");
  EXPECT_EQ(clicks, 1);
}

TEST_F(ComboBoxTest, Selecting_the_selected_item_raises_a_click_and_tells_no_view) {
  combo.SelectItem(1);
  combo.Attach(&view);
  view.told.clear();

  combo.SelectItem(1);

  EXPECT_EQ(clicks, 2);
  EXPECT_TRUE(view.told.empty());
}

TEST_F(ComboBoxTest, An_index_that_the_list_lacks_selects_nothing_and_raises_nothing) {
  combo.SelectItem(0);
  clicks = 0;

  combo.SelectItem(2);
  EXPECT_EQ(combo.ListIndex(), -1);
  combo.SelectItem(-1);

  EXPECT_EQ(combo.ListIndex(), -1);
  EXPECT_EQ(clicks, 0);
}

TEST_F(ComboBoxTest, Clearing_takes_items_and_selection_and_tells_once) {
  combo.SelectItem(0);
  combo.Attach(&view);
  view.told.clear();

  combo.Clear();
  combo.Clear();

  EXPECT_EQ(combo.ListCount(), 0);
  EXPECT_EQ(combo.ListIndex(), -1);
  EXPECT_EQ(view.told, std::vector{Aspect::Items});
}

TEST_F(ComboBoxTest, An_item_outside_the_list_is_out_of_range) {
  for (const int index : {-1, 2}) {
    try {
      (void)combo.List(index);
      FAIL() << "item " << index << " was there";
    } catch (const Fault& fault) {
      EXPECT_EQ(fault.number, Fault::kSubscript);
    }
  }
}

TEST(ImageList, Images_are_numbered_from_1_and_keep_their_tags) {
  BareForm form;
  ImageList images{form, u"main_ImList"};

  EXPECT_EQ(images.Add(Picture::Artwork("process")), 1);
  EXPECT_EQ(images.Add(Picture::Artwork("other"), u"C:\\a.exe"), 2);

  EXPECT_EQ(images.Count(), 2);
  EXPECT_EQ(images.Item(1).Tag, u"");
  EXPECT_EQ(images.Item(2).Tag, u"C:\\a.exe");
}

TEST(ImageList, An_image_outside_the_list_is_out_of_range) {
  BareForm form;
  ImageList images{form, u"main_ImList"};
  images.Add(Picture::Artwork("process"));

  for (const int index : {0, 2}) {
    try {
      (void)images.Item(index);
      FAIL() << "image " << index << " was there";
    } catch (const Fault& fault) {
      EXPECT_EQ(fault.number, Fault::kSubscript);
    }
  }
}

TEST(ImageList, The_first_image_with_a_Tag_is_found_until_the_list_is_cleared) {
  BareForm form;
  ImageList images{form, u"main_ImList"};
  images.Add(Picture::Artwork("process"));
  images.Add(Picture::Artwork("a"), u"C:\\a.exe");
  images.Add(Picture::Artwork("a"), u"C:\\a.exe");

  EXPECT_EQ(images.IndexOfTag(u"C:\\a.exe"), 2);
  EXPECT_EQ(images.IndexOfTag(u""), 1);
  EXPECT_EQ(images.IndexOfTag(u"c:\\a.exe"), 0);
  images.Clear();
  EXPECT_EQ(images.IndexOfTag(u"C:\\a.exe"), 0);
}

TEST(ImageList, Adding_and_clearing_tell_the_view) {
  BareForm form;
  ImageList images{form, u"main_ImList"};
  RecordingView view;
  images.Attach(&view);
  view.told.clear();

  images.Add(Picture::Artwork("process"));
  images.Clear();

  EXPECT_EQ(images.Count(), 0);
  EXPECT_EQ(view.told, (std::vector{Aspect::Items, Aspect::Items}));
}

} // namespace
} // namespace quendra::forms
