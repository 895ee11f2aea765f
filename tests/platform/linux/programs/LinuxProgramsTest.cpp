#include "platform/linux/programs/LinuxProgramsFixture.h"

#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>

namespace quendra::platform::linux_ {

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

} // namespace quendra::platform::linux_
