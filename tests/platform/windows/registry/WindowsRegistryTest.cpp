#include "platform/windows/registry/WindowsRegistry.h"

#include "platform/windows/registry/RegistryTexts.h"

#include <gtest/gtest.h>

#include <array>

namespace quendra::platform::windows {
namespace {

using Bytes = std::vector<std::uint8_t>;

TEST(RegistryTextsTest, Bytes_of_the_code_page_become_characters_and_come_back) {
  Bytes every(256);
  for (std::size_t i = 0; i < every.size(); ++i) every[i] = static_cast<std::uint8_t>(i);

  const Bytes characters = CharactersOfText(every);

  ASSERT_EQ(characters.size(), 512U);
  EXPECT_EQ((Bytes{characters.begin() + 2 * 0xE0, characters.begin() + 2 * 0xE0 + 2}), (Bytes{0xD0, 0x05}));
  EXPECT_EQ(BytesOfText(characters), every);
}

TEST(RegistryTextsTest, Half_a_character_is_lost_and_what_the_page_lacks_is_a_question_mark) {
  EXPECT_EQ(BytesOfText(Bytes{'a', 0, 'b'}), Bytes{'a'});
  EXPECT_EQ(BytesOfText(Bytes{0x42, 0x30}), Bytes{'?'});
}

/// A key of the test's own, and how the system itself shows its values.
struct WindowsRegistryTest : testing::Test {
  WindowsRegistryTest() { registry.RegCreateKeyA(kCurrentUser, kPath, key); }
  ~WindowsRegistryTest() override {
    registry.RegCloseKey(key);
    registry.RegDeleteKeyA(kCurrentUser, kPath);
  }

  Bytes KeptAs(const wchar_t* name) {
    Bytes data(100);
    auto size = static_cast<DWORD>(data.size());
    const auto query = advapi32.Find<decltype(::RegQueryValueExW)>("RegQueryValueExW");
    EXPECT_EQ(query(reinterpret_cast<HKEY>(std::uintptr_t{key.Value()}), name, nullptr, nullptr, data.data(),
                    &size),
              ERROR_SUCCESS);
    data.resize(size);
    return data;
  }

  static constexpr const char* kPath = "Software\\QuendraTest";
  winapi::SystemLibrary advapi32{L"advapi32.dll"};
  WindowsRegistry registry;
  RegistryKey key;
};

TEST_F(WindowsRegistryTest, A_text_is_kept_in_the_systems_characters_without_a_NUL_of_ours) {
  ASSERT_EQ(registry.RegSetValueExA(key, "\xE0", kRegText, Bytes{'a', 0xE0}), kRegistrySuccess);
  EXPECT_EQ(KeptAs(L"\u05D0"), (Bytes{'a', 0, 0xD0, 0x05}));
}

TEST_F(WindowsRegistryTest, Other_values_are_kept_as_they_are) {
  ASSERT_EQ(registry.RegSetValueExA(key, "v", kRegBinary, Bytes{'a', 0xE0, 0}), kRegistrySuccess);
  EXPECT_EQ(KeptAs(L"v"), (Bytes{'a', 0xE0, 0}));
}

TEST_F(WindowsRegistryTest, A_long_value_is_read_whole) {
  const Bytes data(100'000, 7);
  ASSERT_EQ(registry.RegSetValueExA(key, "v", kRegBinary, data), kRegistrySuccess);
  Bytes read(data.size());
  std::uint32_t type = 0, size = 0;
  EXPECT_EQ(registry.RegQueryValueExA(key, "v", type, read, size), kRegistrySuccess);
  EXPECT_EQ(read, data);
}

} // namespace
} // namespace quendra::platform::windows
