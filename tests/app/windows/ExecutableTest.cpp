#include "app/windows/StartedProgram.h"
#include "platform/windows/process/WindowsVersionInfo.h"
#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>

// What the system and its users see of the program's file before it runs.

namespace quendra::app::windows {
namespace {

using Bytes = std::vector<std::uint8_t>;

Bytes ReadProgram() {
  std::ifstream file(ToCodePage(ProgramFile()), std::ios::binary);
  return {std::istreambuf_iterator<char>(file), {}};
}

/// A resource of the program's file, which is only read.
class Resource {
 public:
  Resource(int number, const wchar_t* kind)
      : file_(::LoadLibraryExW(winapi::Wide(ProgramFile()), nullptr, LOAD_LIBRARY_AS_DATAFILE)) {
    const HRSRC place = ::FindResourceW(file_, MAKEINTRESOURCEW(number), kind);
    if (!place) return;
    const auto* start = static_cast<const std::uint8_t*>(::LockResource(::LoadResource(file_, place)));
    bytes_.assign(start, start + ::SizeofResource(file_, place));
  }
  ~Resource() { ::FreeLibrary(file_); }
  Resource(const Resource&) = delete;

  const Bytes& Content() const { return bytes_; }
  bool Says(std::string_view words) const {
    return std::string(bytes_.begin(), bytes_.end()).find(words) != std::string::npos;
  }

 private:
  HMODULE file_;
  Bytes bytes_;
};

TEST(Executable, Is_at_most_four_megabytes_long) {
  const std::size_t length = ReadProgram().size();
  EXPECT_GT(length, 100'000U);
  EXPECT_LE(length, 4U * 1024 * 1024);
}

TEST(Executable, Is_a_program_with_windows_for_XP_and_without_a_console) {
  const Bytes file = ReadProgram();
  ASSERT_GT(file.size(), 0x400U);
  const std::size_t optional = Little32(file, 0x3C) + 24;
  ASSERT_LT(optional + 72, file.size());
  EXPECT_EQ(Little16(file, optional - 20), 0x14C) << "the machine";
  EXPECT_EQ(Little16(file, optional + 40), 5) << "the system's version";
  EXPECT_EQ(Little16(file, optional + 42), 1);
  EXPECT_EQ(Little16(file, optional + 48), 5) << "the version of its windows";
  EXPECT_EQ(Little16(file, optional + 50), 1);
  EXPECT_EQ(Little16(file, optional + 68), 2) << "windows, not a console";
}

TEST(Executable, Asks_by_its_manifest_for_controls_of_version_6_and_for_no_rights) {
  const Resource manifest(1, MAKEINTRESOURCEW(24));
  EXPECT_TRUE(manifest.Says("name=\"Microsoft.Windows.Common-Controls\" version=\"6.0.0.0\""));
  EXPECT_TRUE(manifest.Says("level=\"asInvoker\""));
}

TEST(Executable, Has_an_icon_of_four_sizes_without_compressed_images) {
  const Resource group(1, reinterpret_cast<const wchar_t*>(RT_GROUP_ICON));
  ASSERT_GE(group.Content().size(), 6U + 4 * 14);
  ASSERT_EQ(Little16(group.Content(), 4), 4);
  for (std::size_t i = 0; i < 4; ++i) {
    const std::size_t entry = 6 + 14 * i;
    EXPECT_EQ(group.Content()[entry], (std::array{16, 24, 32, 48}[i]));
    const Resource image(Little16(group.Content(), entry + 12), reinterpret_cast<const wchar_t*>(RT_ICON));
    ASSERT_GE(image.Content().size(), 40U);
    EXPECT_EQ(Little32(image.Content(), 0), 40U) << "the length of a bitmap's header";
  }
}

struct VersionRow {
  const char* name;
  const char* texts;
  const char16_t* company;
  const char16_t* description;
};

class ExecutablesVersion : public testing::TestWithParam<VersionRow> {
 protected:
  ExecutablesVersion() {
    const std::string path = ToCodePage(ProgramFile());
    block_.resize(versions_.GetFileVersionInfoSizeA(path));
    versions_.GetFileVersionInfoA(path, block_);
  }
  Text Value(const char* name) {
    const auto value =
        versions_.VerQueryValueA(block_, std::string("\\StringFileInfo\\") + GetParam().texts + "\\" + name);
    return value ? FromCodePage(CutAtNul(std::string(value->begin(), value->end()))) : u"none";
  }

 private:
  platform::windows::WindowsVersionInfo versions_;
  Bytes block_;
};

TEST_P(ExecutablesVersion, Is_told_in_this_language) {
  EXPECT_EQ(Value("ProductName"), u"Quendra");
  EXPECT_EQ(Value("CompanyName"), GetParam().company);
  EXPECT_EQ(Value("FileDescription"), GetParam().description);
  EXPECT_EQ(Value("OriginalFilename"), u"quendra.exe");
  EXPECT_EQ(Value("ProductVersion"), u"1.1");
}

INSTANTIATE_TEST_SUITE_P(Languages, ExecutablesVersion,
                         testing::Values(VersionRow{"Hebrew", "040D04B0", u"זלמר", u"תמיכה ללקוחות זלמר"},
                                         VersionRow{"English", "040904B0", u"Zelmar",
                                                    u"Support for subscribers of Zelmar"}),
                         [](const auto& row) { return row.param.name; });

} // namespace
} // namespace quendra::app::windows
