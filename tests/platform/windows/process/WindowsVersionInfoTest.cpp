#include "platform/windows/process/WindowsVersionInfo.h"

#include "winapi/SystemLibrary.h"

#include <winver.h>

#include <gtest/gtest.h>

#include <algorithm>

namespace quendra::platform::windows {
namespace {

using Bytes = std::vector<std::uint8_t>;

struct WindowsVersionInfoTest : testing::TestWithParam<const char*> {
  Bytes BlockOf(const std::string& path) {
    Bytes block(versions.GetFileVersionInfoSizeA(path));
    EXPECT_TRUE(versions.GetFileVersionInfoA(path, block)) << path;
    return block;
  }
  /// What the system finds under that path, a text without its NUL.
  Text AskedOfTheSystem(Bytes& block, const Text& path) {
    void* value = nullptr;
    UINT length = 0;
    const auto query = library.Find<decltype(::VerQueryValueW)>("VerQueryValueW");
    return query(block.data(), winapi::Wide(path), &value, &length) && length > 0
               ? winapi::TextOf(static_cast<const wchar_t*>(value))
               : Text();
  }

  WindowsVersionInfo versions;
  winapi::SystemLibrary library{L"version.dll"};
};

TEST_P(WindowsVersionInfoTest, Every_name_has_the_value_that_the_system_finds) {
  Bytes block = BlockOf(GetParam());
  const auto translation = versions.VerQueryValueA(block, std::string(versions.kTranslation));
  ASSERT_TRUE(translation);
  ASSERT_GE(translation->size(), 4U);
  const std::uint32_t number =
      (*translation)[1] << 24 | (*translation)[0] << 16 | (*translation)[3] << 8 | (*translation)[2];
  const Text section = u"\\StringFileInfo\\" + PaddedLeft(HexText(number), 8, u'0') + u"\\";
  int found = 0;

  for (const char16_t* name : {u"CompanyName", u"FileDescription", u"FileVersion", u"InternalName",
                               u"LegalCopyright", u"OriginalFileName", u"ProductName", u"ProductVersion"}) {
    const auto value = versions.VerQueryValueA(block, ToCodePage(section + name));
    const Text expected = AskedOfTheSystem(block, section + name);
    if (!value) {
      EXPECT_EQ(expected, u"") << ToUtf8(name);
      continue;
    }
    EXPECT_EQ(value->back(), 0);
    EXPECT_EQ(std::string(value->begin(), value->end() - 1), ToCodePage(expected)) << ToUtf8(name);
    ++found;
  }

  EXPECT_GE(found, 5);
}

INSTANTIATE_TEST_SUITE_P(, WindowsVersionInfoTest,
                         testing::Values("C:\\WINDOWS\\system32\\kernel32.dll",
                                         "C:\\WINDOWS\\system32\\shell32.dll"),
                         [](const auto& tested) {
                           const std::string path = tested.param;
                           return path.substr(path.rfind('\\') + 1, path.rfind('.') - path.rfind('\\') - 1);
                         });

} // namespace
} // namespace quendra::platform::windows
