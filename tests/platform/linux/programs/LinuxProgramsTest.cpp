#include "platform/linux/LinuxFixture.h"
#include "platform/linux/programs/LinuxIcons.h"
#include "platform/linux/programs/LinuxVersionInfo.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>

namespace quendra::platform::linux_ {

namespace {

const std::string kPng = std::string("\x89PNG\r\n\x1A\n") + "picture";

/// A session with folders of its own.
struct LinuxPrograms : testing::Test {
  TemporaryFolder folder;
  TestClock clock;
  SystemPaths paths;
  UserFolders folders{folder / "home",
                      folder / "home/.config",
                      {folder / "etc"},
                      {folder / "home/.local/share", folder / "share", folder / "share2"},
                      {folder / "bin", folder / "bin2"}};
  DesktopIndex index{folders, clock.AsClock()};
  IconTheme theme{folders, clock.AsClock()};
  LinuxVersionInfo versions{index, paths};
  LinuxIcons icons{index, theme, paths};

  std::string Program(const std::string& name) {
    return folder.Write(name,
                        "\x7F"
                        "ELF",
                        true);
  }
  void AddEntry(const std::string& name, const std::string& keys, const std::string& data = "share") {
    folder.Write(data + "/applications/" + name, "[Desktop Entry]\nType=Application\n" + keys);
  }
  void AddTheme(const std::string& name, const std::string& keys, const std::vector<std::string>& sizes,
                const std::string& base = "share/icons") {
    std::string text = "[Icon Theme]\nName=x\n" + keys + "Directories=";
    for (const auto& size : sizes) text += size + "/apps,";
    text += "\n";
    for (const auto& size : sizes)
      text +=
          "[" + size + "/apps]\n" +
          (size == "scalable" ? "Size=48\nType=Scalable\n" : "Size=" + size.substr(0, size.find('x')) + "\n");
    folder.Write(base + "/" + name + "/index.theme", text);
  }
  std::string AddIcon(const std::string& name) { return folder.Write(name, kPng); }

  /// The named field of the file's version record: "?" when the record lacks it, "" for a file without a
  /// record.
  std::string Field(const std::string& path, const std::string& name = "ProductName") {
    std::vector<std::uint8_t> block(versions.GetFileVersionInfoSizeA(path));
    if (block.empty() || !versions.GetFileVersionInfoA(path, block)) return "";
    const auto value = versions.VerQueryValueA(block, "\\StringFileInfo\\040D04E7\\" + name);
    return value ? std::string(value->begin(), value->end() - 1) : "?";
  }
  std::string IconOf(const std::string& path) {
    const Handle icon = icons.ExtractIconExA(path, 0);
    const auto& bytes = icons.ImageOf(icon);
    const std::string text(bytes.begin(), bytes.end());
    EXPECT_EQ(icons.DestroyIcon(icon), icon != kNoHandle);
    return text;
  }
  std::string Found(const std::string& icon) {
    return theme.Find(icon).value_or(folder / "(none)").substr(folder.Path().size() + 1);
  }
};

TEST_F(LinuxPrograms, The_entry_that_starts_a_file_gives_its_product_name) {
  const auto path = Program("bin/browser");
  AddEntry("b.desktop", "Name=Browser\nComment=For the web\nExec=browser %u\n");
  EXPECT_EQ(Field(path), "Browser");
  EXPECT_EQ(Field(path, "FileDescription"), "For the web");
}

TEST_F(LinuxPrograms, Fields_that_an_entry_lacks_are_not_in_the_record) {
  const auto path = Program("bin/browser");
  AddEntry("b.desktop", "Name=Browser\nExec=browser\n");
  for (const char* name : {"CompanyName", "FileDescription", "FileVersion", "InternalName", "LegalCopyright",
                           "OriginalFileName", "ProductVersion", "", "Product"})
    EXPECT_EQ(Field(path, name), "?") << name;
}

TEST_F(LinuxPrograms, A_file_that_no_entry_starts_has_no_record_and_no_icon) {
  const auto path = Program("bin/tool");
  EXPECT_EQ(versions.GetFileVersionInfoSizeA(path), 0u);
  EXPECT_EQ(versions.GetFileVersionInfoSizeA(""), 0u);
  EXPECT_EQ(icons.ExtractIconExA(path, 0), kNoHandle);
  EXPECT_EQ(icons.ExtractIconExA("", 0), kNoHandle);
}

TEST_F(LinuxPrograms, The_translation_is_Hebrew_in_code_page_1255) {
  const auto path = Program("bin/browser");
  AddEntry("b.desktop", "Name=Browser\nExec=browser\n");
  std::vector<std::uint8_t> block(versions.GetFileVersionInfoSizeA(path) + 10);
  ASSERT_TRUE(versions.GetFileVersionInfoA(path, block));
  EXPECT_EQ(versions.VerQueryValueA(block, "\\VarFileInfo\\Translation"),
            (std::vector<std::uint8_t>{0x0D, 0x04, 0xE7, 0x04}));
  EXPECT_FALSE(versions.VerQueryValueA(block, "\\VarFileInfo\\Other"));
  EXPECT_FALSE(versions.VerQueryValueA(block, "\\StringFileInfo\\040904E4\\ProductName"));
  EXPECT_FALSE(versions.VerQueryValueA(block, ""));
}

TEST_F(LinuxPrograms, A_buffer_too_small_and_a_block_that_is_none_give_nothing) {
  const auto path = Program("bin/browser");
  AddEntry("b.desktop", "Name=Browser\nExec=browser\n");
  std::vector<std::uint8_t> block(versions.GetFileVersionInfoSizeA(path) - 1);
  EXPECT_FALSE(versions.GetFileVersionInfoA(path, block));
  block.assign(100, 0x41);
  EXPECT_FALSE(versions.VerQueryValueA(block, "\\VarFileInfo\\Translation"));
  EXPECT_FALSE(versions.VerQueryValueA({}, "\\VarFileInfo\\Translation"));
}

TEST_F(LinuxPrograms, A_block_cut_at_any_length_is_read_no_further_than_it_goes) {
  const auto path = Program("bin/browser");
  AddEntry("b.desktop", "Name=Browser\nComment=C\nExec=browser\n");
  std::vector<std::uint8_t> block(versions.GetFileVersionInfoSizeA(path));
  ASSERT_TRUE(versions.GetFileVersionInfoA(path, block));
  for (std::size_t length = 0; length < block.size(); ++length) {
    const std::vector<std::uint8_t> cut(block.begin(), block.begin() + static_cast<std::ptrdiff_t>(length));
    versions.VerQueryValueA(cut, "\\StringFileInfo\\040D04E7\\CompanyName");
  }
}

TEST_F(LinuxPrograms, A_Hebrew_name_comes_in_the_code_page) {
  const auto path = Program("bin/browser");
  AddEntry("b.desktop", "Name=Browser\nName[he]=דפדפן\nExec=browser\n");
  EXPECT_EQ(Field(path), ToCodePage(u"דפדפן"));
}

TEST_F(LinuxPrograms, A_path_in_the_code_page_finds_the_entry_of_its_file) {
  const auto raw = Program("bin/דפדפן");
  AddEntry("b.desktop", "Name=Browser\nExec=דפדפן\n");
  EXPECT_EQ(Field(paths.ToSystem(raw)), "Browser");
}

TEST_F(LinuxPrograms, A_program_is_found_through_the_path_and_through_links) {
  const auto path = Program("opt/browser/browser-bin");
  Program("bin2/other");
  std::filesystem::create_directories(folder / "bin");
  std::filesystem::create_symlink(path, folder / "bin/web");
  AddEntry("b.desktop", "Name=Browser\nExec=web\n");
  AddEntry("o.desktop", "Name=Other\nExec=other\n");
  EXPECT_EQ(Field(path), "Browser");
  EXPECT_EQ(Field(folder / "bin2/other"), "Other");
}

/// A program "browser" of the session's packages that a script starts.
struct LinuxScriptedPrograms : LinuxPrograms {
  void SetUp() override {
    if (::geteuid() != 0) GTEST_SKIP() << "the folders must be the administrator's, as packages' are";
    folder.Write("bin/browser", "#!/bin/sh\nexec browser\n", true);
    AddEntry("b.desktop", "Name=Browser\nIcon=" + AddIcon("pictures/b.png") + "\nExec=browser %u\n");
  }
  /// What the file passes for: the entry's name when its icon is shown too.
  std::string Identity(const std::string& path) {
    const std::string name = Field(path);
    EXPECT_EQ(IconOf(path), name.empty() ? "" : kPng);
    return name;
  }
};

TEST_F(LinuxScriptedPrograms, The_program_of_a_scripts_package_is_found_behind_the_script) {
  for (const char* name :
       {"lib/browser/browser", "lib64/browser/browser", "libexec/browser/browser", "share/browser/browser"})
    EXPECT_EQ(Identity(Program(name)), "Browser") << name;
}

TEST_F(LinuxScriptedPrograms, The_program_of_a_folder_of_its_own_is_found_behind_the_script_in_it) {
  folder.Write("opt/editor/bin/editor", "#!/bin/sh\n", true);
  std::filesystem::create_symlink(folder / "opt/editor/bin/editor", folder / "bin/editor");
  AddEntry("e.desktop", "Name=Editor\nExec=editor\n");
  EXPECT_EQ(Field(Program("opt/editor/editor")), "Editor");
}

TEST_F(LinuxScriptedPrograms, A_foreign_file_of_the_scripts_name_is_not_that_program) {
  for (const char* name : {"home/browser", "home/of/browser/browser", "home/lib/browser/browser",
                           "bin2/browser", "lib/other/browser", "lib/browser/plugins/browser"})
    EXPECT_EQ(Identity(Program(name)), "") << name;
}

TEST_F(LinuxScriptedPrograms, A_file_that_an_ordinary_user_could_have_laid_there_is_not_that_program) {
  const auto path = Program("lib/browser/browser");
  const auto nameWith = [&](const std::string& file, mode_t mode, uid_t owner) {
    struct stat before {};
    EXPECT_EQ(::stat(file.c_str(), &before), 0);
    EXPECT_EQ(::chmod(file.c_str(), mode) + ::chown(file.c_str(), owner, 0), 0);
    const std::string name = Field(path);
    EXPECT_EQ(::chmod(file.c_str(), before.st_mode) + ::chown(file.c_str(), 0, 0), 0);
    return name;
  };
  for (const std::string& file : {path, folder / "lib/browser", folder / "lib", folder / "bin/browser"}) {
    EXPECT_EQ(nameWith(file, 0755, 0), "Browser") << file;
    EXPECT_EQ(nameWith(file, 0755, 4242), "") << file;
    EXPECT_EQ(nameWith(file, 0777, 0), "") << file;
    EXPECT_EQ(nameWith(file, 0775, 0), "") << file;
  }
}

TEST_F(LinuxPrograms, Files_whose_names_are_equal_in_the_code_page_do_not_share_a_program) {
  const auto one = Program("bin/жук"), other = Program("bin/лук");
  AddEntry("b.desktop", "Name=Browser\nIcon=" + AddIcon("pictures/b.png") + "\nExec=жук\n");
  const std::string path = paths.ToSystem(one), otherPath = paths.ToSystem(other);
  EXPECT_EQ(Field(path), "Browser");
  EXPECT_EQ(IconOf(path), kPng);
  EXPECT_NE(otherPath, path);
  EXPECT_EQ(Field(otherPath), "");
  EXPECT_EQ(IconOf(otherPath), "");
}

TEST_F(LinuxPrograms, An_entry_whose_program_or_required_program_is_missing_does_not_hold) {
  const auto path = Program("bin/browser");
  AddEntry("a.desktop", "Name=A\nExec=browser\nTryExec=missing\n");
  AddEntry("b.desktop", "Name=B\nExec=missing\n");
  AddEntry("c.desktop", "Name=C\nExec=../bin/browser\n");
  EXPECT_EQ(Field(path), "");
  AddEntry("d.desktop", "Name=D\nExec=browser\nTryExec=browser\n");
  clock.now += FolderWatch::kLookMilliseconds;
  EXPECT_EQ(Field(path), "D");
}

TEST_F(LinuxPrograms, Of_several_entries_the_shown_one_without_arguments_holds) {
  const auto path = Program("bin/office");
  AddEntry("a.desktop", "Name=Writer\nExec=office --writer %U\n");
  AddEntry("b.desktop", "Name=Hidden\nExec=office\nNoDisplay=true\n");
  AddEntry("c.desktop", "Name=Office\nExec=office %U\n");
  EXPECT_EQ(Field(path), "Office");
}

TEST_F(LinuxPrograms, The_users_own_entry_goes_before_the_systems) {
  const auto path = Program("bin/office");
  AddEntry("a.desktop", "Name=System\nExec=office\n");
  AddEntry("z.desktop", "Name=Own\nExec=office\n", "home/.local/share");
  EXPECT_EQ(Field(path), "Own");
}

TEST_F(LinuxPrograms, Entries_in_subfolders_are_found_and_a_folder_that_leads_into_itself_does_no_harm) {
  const auto path = Program("bin/office");
  AddEntry("vendor/a.desktop", "Name=Office\nExec=office\n");
  std::filesystem::create_directory_symlink(folder / "share/applications",
                                            folder / "share/applications/loop");
  EXPECT_EQ(Field(path), "Office");
}

TEST_F(LinuxPrograms, An_entry_that_comes_later_is_found_some_seconds_later) {
  const auto path = Program("bin/office");
  EXPECT_EQ(Field(path), "");
  AddEntry("a.desktop", "Name=Office\nExec=office\n");
  EXPECT_EQ(Field(path), "");
  clock.now += FolderWatch::kLookMilliseconds;
  EXPECT_EQ(Field(path), "Office");
}

TEST_F(LinuxPrograms, Entries_over_64_KB_and_entries_that_are_no_files_are_passed_over) {
  const auto path = Program("bin/office");
  AddEntry("a.desktop", "Name=Office\nExec=office\n#" + std::string(65536, 'x') + "\n");
  ASSERT_EQ(::mkfifo((folder / "share/applications/b.desktop").c_str(), 0644), 0);
  std::filesystem::create_directory(folder / "share/applications/c.desktop");
  EXPECT_EQ(Field(path), "");
}

TEST_F(LinuxPrograms, Hostile_names_in_entries_come_cleaned) {
  const auto path = Program("bin/office");
  AddEntry("a.desktop", "Name=Good\\r\\nGET / \u202Efdp.exe" + std::string(4096, 'x') + "\nExec=office\n");
  const std::string name = Field(path);
  EXPECT_TRUE(name.starts_with("Good  GET / fdp.exexxx")) << name;
  EXPECT_EQ(name.size(), 255u);
}

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

TEST(LinuxUserFolders, The_environment_names_the_folders_and_relative_ones_are_passed_over) {
  const Child child([] {
    ::setenv("HOME", "/h", 1);
    ::unsetenv("XDG_DATA_HOME");
    ::unsetenv("XDG_CONFIG_HOME");
    ::setenv("XDG_DATA_DIRS", "/a::relative:/b", 1);
    ::setenv("PATH", ".:/p", 1);
    const UserFolders folders = UserFolders::OfEnvironment();
    std::string text = folders.configHome;
    for (const auto& data : folders.dataDirs) text += " " + data;
    for (const auto& program : folders.programDirs) text += " " + program;
    return text;
  });
  EXPECT_EQ(child.Answer(), "/h/.config /h/.local/share /a /b /p");
}

} // namespace

} // namespace quendra::platform::linux_
