#include "monitor/MonitorFixture.h"

namespace quendra::monitor {

namespace {

const std::vector<std::uint8_t> kHebrewInPage1255{0x0D, 0x04, 0xE7, 0x04};
const char* kPath = "C:\\a.exe";

struct FileVersion : MonitorFixture {
  void Product(const std::string& name) {
    machine.AddVersionBlock(kPath, kHebrewInPage1255, {{"ProductName", name}});
  }
  Text Application() { return fileInfo.ApplicationNameOf(FromUtf8(kPath)); }
  FileVersionInfo Read() { return fileInfo.ReadFileVersionInfo(FromUtf8(kPath)); }
};

std::vector<Text> FieldsOf(const FileVersionInfo& info) {
  return {info.CompanyName,    info.FileDescription,  info.FileVersion, info.InternalName,
          info.LegalCopyright, info.OriginalFileName, info.ProductName, info.ProductVersion};
}

const std::vector<Text> kAllEmpty(8);
const std::vector<Text> kAllMissing(8, u"?");

/// Version records whose values and sizes a test makes up byte by byte.
struct OddVersions : platform::VersionInfo {
  std::uint32_t Size = 8;
  std::vector<std::uint8_t> Value;

  std::uint32_t GetFileVersionInfoSizeA(const std::string&) override { return Size; }
  bool GetFileVersionInfoA(const std::string&, std::span<std::uint8_t>) override { return true; }
  std::optional<std::vector<std::uint8_t>> VerQueryValueA(std::span<const std::uint8_t>,
                                                          const std::string&) override {
    return Value;
  }
};

struct OddFileVersion : MonitorFixture {
  OddVersions versions;
  mdlFileInfo odd{machine.processes, machine.tokens, versions, desktop};
};

} // namespace

TEST_F(FileVersion, Fills_the_eight_fields) {
  machine.AddVersionBlock(kPath, kHebrewInPage1255,
                          {{"CompanyName", "1"},
                           {"FileDescription", "2"},
                           {"FileVersion", "3"},
                           {"InternalName", "4"},
                           {"LegalCopyright", "5"},
                           {"OriginalFileName", "6"},
                           {"ProductName", "7"},
                           {"ProductVersion", "8"}});
  EXPECT_EQ(FieldsOf(Read()), (std::vector<Text>{u"1", u"2", u"3", u"4", u"5", u"6", u"7", u"8"}));
}

TEST_F(FileVersion, Asks_in_record_order_under_language_before_code_page_in_eight_digits) {
  machine.AddVersionBlock(kPath, kHebrewInPage1255, {});
  Read();
  EXPECT_EQ(machine.versionInfo.Queries,
            (std::vector<std::string>{
                "\\VarFileInfo\\Translation", "\\StringFileInfo\\040D04E7\\CompanyName",
                "\\StringFileInfo\\040D04E7\\FileDescription", "\\StringFileInfo\\040D04E7\\FileVersion",
                "\\StringFileInfo\\040D04E7\\InternalName", "\\StringFileInfo\\040D04E7\\LegalCopyright",
                "\\StringFileInfo\\040D04E7\\OriginalFileName", "\\StringFileInfo\\040D04E7\\ProductName",
                "\\StringFileInfo\\040D04E7\\ProductVersion"}));
}

TEST_F(FileVersion, Pads_a_small_translation_with_zeros_on_the_left) {
  machine.AddVersionBlock(kPath, {0, 0, 0xB0, 4}, {{"ProductName", "neutral"}});
  EXPECT_EQ(Application(), u"neutral");
  EXPECT_EQ(machine.versionInfo.Queries[1], "\\StringFileInfo\\000004B0\\CompanyName");
}

TEST_F(FileVersion, Takes_the_top_bit_of_a_language_as_it_is) {
  machine.AddVersionBlock(kPath, {0x01, 0xFF, 0xE4, 0xFF}, {});
  Read();
  EXPECT_EQ(machine.versionInfo.Queries[1], "\\StringFileInfo\\FF01FFE4\\CompanyName");
}

TEST_F(FileVersion, Of_a_translation_shorter_than_four_bytes_still_makes_the_eight_queries) {
  machine.AddVersionBlock(kPath, {0x0D, 0x04}, {{"ProductName", "short"}});
  const FileVersionInfo info = Read();
  EXPECT_EQ(machine.versionInfo.Queries.size(), 9u);
  EXPECT_EQ(machine.versionInfo.Queries[1], "\\StringFileInfo\\040D0000\\CompanyName");
  EXPECT_EQ(info.ProductName, u"short");
  EXPECT_EQ(info.CompanyName, u"?");
}

TEST_F(FileVersion, Takes_the_first_of_several_translations) {
  machine.AddVersionBlock(kPath, {0x0D, 0x04, 0xE7, 0x04, 0x09, 0x04, 0xE4, 0x04}, {});
  Read();
  EXPECT_EQ(machine.versionInfo.Queries[1], "\\StringFileInfo\\040D04E7\\CompanyName");
}

TEST_F(FileVersion, Holds_question_marks_for_what_the_block_lacks) {
  machine.AddVersionBlock(kPath, kHebrewInPage1255, {});
  EXPECT_EQ(FieldsOf(Read()), kAllMissing);
}

TEST_F(FileVersion, Of_a_file_without_a_version_block_is_empty) { EXPECT_EQ(FieldsOf(Read()), kAllEmpty); }

TEST_F(FileVersion, Of_an_empty_path_is_empty_and_asks_nothing) {
  machine.AddVersionBlock("", kHebrewInPage1255, {});
  EXPECT_EQ(FieldsOf(fileInfo.ReadFileVersionInfo(u"")), kAllEmpty);
  EXPECT_TRUE(machine.versionInfo.Queries.empty());
}

TEST_F(FileVersion, Of_a_block_that_cannot_be_read_is_empty) {
  machine.AddVersionBlock(kPath, kHebrewInPage1255, {{"ProductName", "A"}});
  machine.versionInfo.FailReading(kPath);
  EXPECT_EQ(FieldsOf(Read()), kAllEmpty);
}

TEST_F(FileVersion, Of_a_block_without_a_translation_is_empty) {
  machine.AddVersionBlock(kPath, {}, {{"ProductName", "A"}});
  EXPECT_EQ(FieldsOf(Read()), kAllEmpty);
}

TEST_F(FileVersion, Cuts_a_value_at_its_first_NUL) {
  Product(std::string("before\0behind", 13));
  EXPECT_EQ(Application(), u"before");
}

TEST_F(FileVersion, Cuts_a_value_at_255_characters) {
  Product(std::string(300, 'x'));
  EXPECT_EQ(Application(), Text(255, u'x'));
}

TEST_F(FileVersion, Reads_values_in_the_systems_code_page) {
  Product(ToCodePage(u"דפדפן"));
  EXPECT_EQ(Application(), u"דפדפן");
}

TEST_F(OddFileVersion, Of_a_size_below_zero_is_empty) {
  versions.Size = 0xFFFFFFFF;
  EXPECT_EQ(FieldsOf(odd.ReadFileVersionInfo(u"x")), kAllEmpty);
}

TEST_F(OddFileVersion, Takes_a_value_without_a_NUL_as_it_is) {
  versions.Value = {'a', 'b', 'c', 'd'};
  EXPECT_EQ(odd.ReadFileVersionInfo(u"x").ProductName, u"abcd");
}

TEST_F(OddFileVersion, Of_empty_values_has_empty_fields) {
  EXPECT_EQ(FieldsOf(odd.ReadFileVersionInfo(u"x")), kAllEmpty);
}

// Application names.

TEST_F(FileVersion, Without_a_product_name_gives_a_question_mark_as_the_application) {
  machine.AddVersionBlock(kPath, kHebrewInPage1255, {{"CompanyName", "A"}});
  EXPECT_EQ(Application(), u"?");
}

TEST_F(FileVersion, Without_a_block_gives_an_empty_application) { EXPECT_EQ(Application(), u""); }

TEST_F(FileVersion, Makes_the_systems_own_name_short) {
  Product(ToCodePage(u"Microsoft® Windows® Operating System"));
  EXPECT_EQ(Application(), u"MS® Windows");
}

TEST_F(FileVersion, Makes_the_systems_own_name_short_wherever_it_stands) {
  Product(ToCodePage(u"(Microsoft® Windows® Operating System/Microsoft® Windows® Operating System)"));
  EXPECT_EQ(Application(), u"(MS® Windows/MS® Windows)");
}

TEST_F(FileVersion, Removes_the_word_with_its_mark_and_leaves_the_blank_and_the_word_behind_it) {
  Product(ToCodePage(u"Windows® Messenger Windows®"));
  EXPECT_EQ(Application(), u" Messenger ");
}

TEST_F(FileVersion, Searches_with_regard_to_case) {
  Product(ToCodePage(u"WINDOWS® microsoft® Windows Operating System"));
  EXPECT_EQ(Application(), u"WINDOWS® microsoft® Windows Operating System");
}

} // namespace quendra::monitor
