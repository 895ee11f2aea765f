#include "platform/linux/programs/LinuxProgramsFixture.h"

#include <sys/stat.h>

#include <filesystem>

namespace quendra::platform::linux_ {

TEST_F(LinuxPrograms, An_icon_comes_as_the_bytes_of_the_file_that_the_entry_names) {
  const auto path = Program("bin/office");
  AddEntry("a.desktop", "Name=Office\nExec=office\nIcon=" + AddIcon("pictures/office.png") + "\n");
  EXPECT_EQ(IconOf(path), kPng);
  EXPECT_EQ(icons.ExtractIconExA(path, 1), kNoHandle);
  EXPECT_EQ(icons.ExtractIconExA(path, -1), kNoHandle);
}

TEST_F(LinuxPrograms, A_destroyed_icon_is_none_any_more) {
  const auto path = Program("bin/office");
  AddEntry("a.desktop", "Name=Office\nExec=office\nIcon=" + AddIcon("pictures/office.png") + "\n");
  const Handle icon = icons.ExtractIconExA(path, 0);
  EXPECT_FALSE(icons.ImageOf(icon).empty());
  EXPECT_TRUE(icons.DestroyIcon(icon));
  EXPECT_TRUE(icons.ImageOf(icon).empty());
  EXPECT_FALSE(icons.DestroyIcon(icon));
}

TEST_F(LinuxPrograms, SVG_and_XPM_are_images_and_anything_else_is_none) {
  const auto path = Program("bin/office");
  const std::vector<std::pair<std::string, bool>> cases = {
      {"<svg xmlns='x'/>", true},
      {"\xEF\xBB\xBF<?xml version='1.0'?>\n<!-- c --><svg/>", true},
      {"/* XPM */\nstatic", true},
      {"root:x:0:0", false},
      {"", false},
      {"<html>", false},
      {"\x89PN", false}};
  for (const auto& [content, isImage] : cases) {
    AddEntry("a.desktop", "Name=Office\nExec=office\nIcon=" + folder.Write("picture.png", content) + "\n");
    folder.Write("share/applications/changed" + std::to_string(clock.now), "");
    clock.now += FolderWatch::kLookMilliseconds;
    EXPECT_EQ(IconOf(path), isImage ? content : "") << content;
  }
}

TEST_F(LinuxPrograms, An_icon_over_1_MB_and_one_that_is_no_file_is_none) {
  const auto path = Program("bin/office");
  AddEntry("a.desktop", "Name=Office\nExec=office\nIcon=" +
                            folder.Write("big.png", kPng + std::string(1 << 20, 'x')) + "\n");
  EXPECT_EQ(IconOf(path), "");
  const auto pipe = Program("bin/pipe"), zero = Program("bin/zero");
  ASSERT_EQ(::mkfifo((folder / "pipe.png").c_str(), 0644), 0);
  AddEntry("p.desktop", "Name=P\nExec=pipe\nIcon=" + (folder / "pipe.png") + "\n");
  AddEntry("z.desktop", "Name=Z\nExec=zero\nIcon=/dev/zero\n");
  clock.now += FolderWatch::kLookMilliseconds;
  EXPECT_EQ(IconOf(pipe), "");
  EXPECT_EQ(IconOf(zero), "");
}

TEST_F(LinuxPrograms, An_icons_name_leads_nowhere_but_into_the_themes) {
  AddTheme("hicolor", "", {"32x32"});
  AddIcon("share/icons/hicolor/32x32/apps/ok.png");
  AddIcon("share/secret.png");
  EXPECT_EQ(Found("ok"), "share/icons/hicolor/32x32/apps/ok.png");
  EXPECT_EQ(Found("../../../../secret"), "(none)");
  EXPECT_EQ(Found("apps/ok"), "(none)");
  EXPECT_EQ(Found(""), "(none)");
  EXPECT_EQ(Found(".."), "(none)");
  EXPECT_EQ(Found(std::string(4096, 'x')), "(none)");
  EXPECT_EQ(Found(std::string("ok\0x", 4)), "(none)");
}

TEST_F(LinuxPrograms,
       Icons_of_32_then_48_then_64_pixels_then_scalable_then_larger_then_smaller_ones_are_taken) {
  const std::vector<std::string> order = {"32x32", "48x48",   "64x64", "scalable",
                                          "96x96", "256x256", "24x24", "16x16"};
  std::vector<std::string> sizes(order.rbegin(), order.rend());
  AddTheme("hicolor", "", sizes);
  for (const auto& size : order) AddIcon("share/icons/hicolor/" + size + "/apps/app.png");
  for (const auto& size : order) {
    EXPECT_EQ(Found("app"), "share/icons/hicolor/" + size + "/apps/app.png");
    std::filesystem::remove(folder / ("share/icons/hicolor/" + size + "/apps/app.png"));
  }
  EXPECT_EQ(Found("app"), "(none)");
}

TEST_F(LinuxPrograms,
       The_users_theme_goes_first_then_those_it_builds_on_then_hicolor_then_pictures_of_no_theme) {
  folder.Write("home/.config/gtk-3.0/settings.ini", "[Settings]\ngtk-icon-theme-name=Mine\n");
  AddTheme("Mine", "Inherits=hicolor,Base\n", {"32x32"});
  AddTheme("Base", "Inherits=Mine\n", {"32x32"}, "home/.local/share/icons");
  AddTheme("hicolor", "", {"32x32"});
  const std::vector<std::string> order = {"share/icons/Mine/32x32/apps/app.png",
                                          "home/.local/share/icons/Base/32x32/apps/app.png",
                                          "share/icons/hicolor/32x32/apps/app.png", "share2/pixmaps/app.xpm"};
  for (const auto& file : order) AddIcon(file);
  for (const auto& file : order) {
    EXPECT_EQ(Found("app"), file);
    std::filesystem::remove(folder / file);
  }
}

TEST_F(LinuxPrograms, The_users_theme_is_read_from_the_settings_of_either_desktop) {
  AddTheme("Kde", "", {"32x32"});
  AddIcon("share/icons/Kde/32x32/apps/app.svg");
  folder.Write("etc/kdeglobals", "[Icons]\nTheme=Kde\n");
  EXPECT_EQ(Found("app"), "share/icons/Kde/32x32/apps/app.svg");
}

TEST_F(LinuxPrograms, An_icon_of_a_theme_may_lie_in_the_users_own_folder) {
  AddTheme("hicolor", "", {"32x32"});
  AddIcon("home/.icons/hicolor/32x32/apps/app.png");
  EXPECT_EQ(Found("app"), "home/.icons/hicolor/32x32/apps/app.png");
}

TEST_F(LinuxPrograms, PNG_goes_before_SVG_and_SVG_before_XPM) {
  AddTheme("hicolor", "", {"32x32"});
  for (const std::string ending : {"png", "svg", "xpm"})
    AddIcon("share/icons/hicolor/32x32/apps/app." + ending);
  for (const std::string ending : {"png", "svg", "xpm"}) {
    EXPECT_EQ(Found("app"), "share/icons/hicolor/32x32/apps/app." + ending);
    std::filesystem::remove(folder / ("share/icons/hicolor/32x32/apps/app." + ending));
  }
}

TEST_F(LinuxPrograms, A_picture_of_no_theme_may_be_named_with_its_ending) {
  AddIcon("share/pixmaps/app.png");
  EXPECT_EQ(Found("app.png"), "share/pixmaps/app.png");
  EXPECT_EQ(Found("app"), "share/pixmaps/app.png");
}

TEST_F(LinuxPrograms, A_themes_list_leads_nowhere_but_into_the_theme) {
  folder.Write("share/icons/hicolor/index.theme", "[Icon "
                                                  "Theme]\nDirectories=../../secret,/etc,sub\n[../../"
                                                  "secret]\nSize=32\n[/etc]\nSize=32\n[sub]\nSize=32\n");
  AddIcon("share/secret/app.png");
  AddIcon("share/icons/hicolor/sub/other.png");
  EXPECT_EQ(Found("app"), "(none)");
  EXPECT_EQ(Found("other"), "share/icons/hicolor/sub/other.png");
}

TEST_F(LinuxPrograms, Themes_that_build_on_each_other_end) {
  folder.Write("home/.config/gtk-3.0/settings.ini", "[Settings]\ngtk-icon-theme-name=A\n");
  AddTheme("A", "Inherits=B,A\n", {"32x32"});
  AddTheme("B", "Inherits=A,../x,\n", {"32x32"});
  EXPECT_EQ(Found("app"), "(none)");
}

TEST_F(LinuxPrograms, An_icon_that_comes_with_its_entry_later_is_found_later) {
  const auto path = Program("bin/office");
  AddTheme("hicolor", "", {"32x32"});
  std::filesystem::create_directories(folder / "share/icons/hicolor/32x32/apps");
  EXPECT_EQ(IconOf(path), "");
  AddEntry("a.desktop", "Name=Office\nExec=office\nIcon=office\n");
  AddIcon("share/icons/hicolor/32x32/apps/office.png");
  clock.now += FolderWatch::kLookMilliseconds;
  EXPECT_EQ(IconOf(path), kPng);
}

TEST_F(LinuxPrograms, A_thousand_programs_without_icons_are_remembered_up_to_a_bound) {
  for (int i = 0; i < 1000; ++i) EXPECT_EQ(icons.ExtractIconExA("/x/" + std::to_string(i), 0), kNoHandle);
}

} // namespace quendra::platform::linux_
