#include "foundation/RegEdit.h"

#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/registry/SimulatedRegistry.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra::foundation {
namespace {

using platform::RegistryKey;
using platform::RegistryValue;

constexpr const char* kSettings = "HKEY_CURRENT_USER\\Software\\Quendra";

struct RegEditTest : testing::Test {
  using Box = forms::headless::HeadlessDesktop::Box;

  RegEditTest() { registry.AddKey(kSettings); }

  static Box FormatBox(const Text& path) { return {u"Incorrect Format:\n\n" + path, 0, u"Quendra"}; }

  forms::headless::HeadlessDesktop desktop;
  platform::simulated::SimulatedRegistry registry;
  RegEdit regEdit{registry, desktop};
  const Text settings = FromCodePage(kSettings);
};

TEST_F(RegEditTest, Each_root_has_its_number_and_every_other_name_has_none) {
  EXPECT_EQ(RegEdit::HiveFromName(u"HKEY_CLASSES_ROOT"), RegistryKey(0x80000000));
  EXPECT_EQ(RegEdit::HiveFromName(u"HKEY_CURRENT_USER"), RegistryKey(0x80000001));
  EXPECT_EQ(RegEdit::HiveFromName(u"HKEY_LOCAL_MACHINE"), RegistryKey(0x80000002));
  EXPECT_EQ(RegEdit::HiveFromName(u"HKEY_USERS"), RegistryKey(0x80000003));
  EXPECT_EQ(RegEdit::HiveFromName(u"HKEY_PERFORMANCE_DATA"), RegistryKey(0x80000004));
  EXPECT_EQ(RegEdit::HiveFromName(u"HKEY_CURRENT_CONFIG"), RegistryKey(0x80000005));
  EXPECT_EQ(RegEdit::HiveFromName(u"HKEY_DYN_DATA"), RegistryKey(0x80000006));
  for (const char16_t* other : {u"HKCU", u"", u"hkey_current_user", u"HKEY_CURRENT_USER\\", u"HKEY_"})
    EXPECT_EQ(RegEdit::HiveFromName(other), RegistryKey(0)) << ToUtf8(other);
}

TEST_F(RegEditTest, A_path_is_cut_to_what_stands_behind_its_root) {
  Text path = u"HKEY_USERS\\.DEFAULT\\Software";
  RegistryKey hive;

  regEdit.SplitRegPath(path, hive);

  EXPECT_EQ(path, u".DEFAULT\\Software");
  EXPECT_EQ(hive, platform::kUsers);
  EXPECT_EQ(regEdit.LastRegStatus(), 11u);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(RegEditTest, A_root_alone_leaves_an_empty_path) {
  Text path = u"HKEY_DYN_DATA";
  RegistryKey hive;

  regEdit.SplitRegPath(path, hive);

  EXPECT_EQ(path, u"");
  EXPECT_EQ(hive, platform::kDynData);
  EXPECT_EQ(regEdit.LastRegStatus(), 0u);
}

TEST_F(RegEditTest, An_unknown_root_has_the_handle_0_without_a_box) {
  Text path = u"HKEY_NOBODY\\Software";
  RegistryKey hive(5);

  regEdit.SplitRegPath(path, hive);

  EXPECT_EQ(path, u"Software");
  EXPECT_EQ(hive, platform::kNoRegistryKey);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(RegEditTest, A_trailing_backslash_shows_the_box_and_leaves_path_and_root) {
  Text path = u"HKEY_CURRENT_USER\\";
  RegistryKey hive(5);

  regEdit.SplitRegPath(path, hive);

  EXPECT_EQ(desktop.Boxes, std::vector{FormatBox(u"HKEY_CURRENT_USER\\")});
  EXPECT_EQ(path, u"HKEY_CURRENT_USER\\");
  EXPECT_EQ(hive, RegistryKey(5));
  EXPECT_EQ(regEdit.LastRegStatus(), 18u);
}

TEST_F(RegEditTest, A_short_root_shows_the_box) {
  for (const char16_t* path : {u"HKCU\\Software", u"", u"Software", u"hkey_current_user\\Software"})
    regEdit.CreateRegKey(path);

  EXPECT_EQ(desktop.Boxes, (std::vector{FormatBox(u"HKCU\\Software"), FormatBox(u""), FormatBox(u"Software"),
                                        FormatBox(u"hkey_current_user\\Software")}));
}

TEST_F(RegEditTest, A_badly_formed_first_path_reaches_no_registry) {
  regEdit.CreateRegKey(u"HKCU\\Software");
  regEdit.SetRegDword(u"HKCU\\Software", u"a", 1);

  EXPECT_TRUE(registry.Calls.empty());
  EXPECT_EQ(regEdit.LastRegStatus(), 5u);
}

TEST_F(RegEditTest, A_badly_formed_path_after_a_good_one_goes_to_the_old_root_and_is_refused_there) {
  regEdit.SetRegDword(settings, u"a", 1);
  registry.Calls.clear();

  regEdit.SetRegDword(u"HKEY_CURRENT_USER\\", u"b", 2);

  EXPECT_EQ(desktop.Boxes, std::vector{FormatBox(u"HKEY_CURRENT_USER\\")});
  EXPECT_EQ(registry.Calls, std::vector<std::string>{"RegOpenKeyExA HKEY_CURRENT_USER\\HKEY_CURRENT_USER\\"});
  EXPECT_NE(regEdit.LastRegStatus(), 0u);
  EXPECT_EQ(regEdit.LastHive(), platform::kCurrentUser);
}

TEST_F(RegEditTest, A_badly_formed_path_makes_no_key_at_the_old_root) {
  regEdit.CreateRegKey(settings);

  regEdit.CreateRegKey(u"HKEY_CURRENT_USER\\");

  EXPECT_EQ(regEdit.LastRegStatus(), platform::kBadKeyPath);
  EXPECT_FALSE(registry.HasKey("HKEY_CURRENT_USER\\HKEY_CURRENT_USER"));
}

TEST_F(RegEditTest, An_unknown_root_ends_each_operation_before_the_registry) {
  regEdit.CreateRegKey(u"HKEY_NOBODY\\a");
  regEdit.SetRegDword(u"HKEY_NOBODY\\a", u"b", 1);
  regEdit.SetRegString(u"HKEY_NOBODY\\a", u"b", u"c");
  regEdit.SetRegBinary(u"HKEY_NOBODY\\a", u"b", u"c");

  EXPECT_TRUE(registry.Calls.empty());
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_EQ(regEdit.LastRegStatus(), 12u);
}

TEST_F(RegEditTest, A_key_is_made_with_all_above_it_and_closed) {
  regEdit.CreateRegKey(u"HKEY_CURRENT_USER\\Software\\One\\Two");

  EXPECT_TRUE(registry.HasKey("HKEY_CURRENT_USER\\Software\\One\\Two"));
  EXPECT_EQ(registry.OpenCount(), 0u);
  EXPECT_EQ(regEdit.LastRegStatus(), 0u);
  EXPECT_NE(regEdit.LastRegKey(), platform::kNoRegistryKey);
}

TEST_F(RegEditTest, Making_a_key_that_is_there_opens_and_closes_it) {
  registry.SetValue(kSettings, "a", {platform::kRegBinary, {1}});

  regEdit.CreateRegKey(settings);

  EXPECT_EQ(registry.Calls,
            (std::vector<std::string>{"RegCreateKeyA HKEY_CURRENT_USER\\Software\\Quendra", "RegCloseKey"}));
  EXPECT_EQ(registry.Value(kSettings, "a"), (RegistryValue{platform::kRegBinary, {1}}));
}

TEST_F(RegEditTest, A_refused_key_leaves_the_registrys_number_and_isnt_closed) {
  registry.Refuse(kSettings, platform::kRegistryAccessDenied);

  regEdit.CreateRegKey(settings);

  EXPECT_EQ(regEdit.LastRegStatus(), 5u);
  EXPECT_EQ(registry.Calls.size(), 1u);
}

TEST_F(RegEditTest, A_number_is_written_as_4_bytes_low_byte_first) {
  regEdit.SetRegDword(settings, u"CacheLimit", 76800);

  EXPECT_EQ(registry.Value(kSettings, "CacheLimit"),
            (RegistryValue{platform::kRegDword, {0x00, 0x2C, 0x01, 0x00}}));
  EXPECT_EQ(registry.Calls, (std::vector<std::string>{"RegOpenKeyExA HKEY_CURRENT_USER\\Software\\Quendra",
                                                      "RegSetValueExA CacheLimit", "RegCloseKey"}));
  EXPECT_EQ(regEdit.LastRegStatus(), 0u);
}

TEST_F(RegEditTest, A_key_is_opened_for_writing_alone) {
  struct RemembersAccess : platform::simulated::SimulatedRegistry {
    std::uint32_t RegOpenKeyExA(RegistryKey parent, const std::string& path, std::uint32_t access,
                                RegistryKey& key) override {
      asked.push_back(access);
      return SimulatedRegistry::RegOpenKeyExA(parent, path, access, key);
    }
    std::vector<std::uint32_t> asked;
  } remembering;
  remembering.AddKey(kSettings);
  RegEdit writer(remembering, desktop);

  writer.SetRegDword(settings, u"a", 1);
  writer.SetRegString(settings, u"b", u"c");
  writer.SetRegBinary(settings, u"d", u"e");

  EXPECT_EQ(remembering.asked, (std::vector<std::uint32_t>{0x20006, 0x20006, 0x20006}));
}

TEST_F(RegEditTest, A_path_that_is_a_root_alone_writes_at_the_root) {
  regEdit.CreateRegKey(u"HKEY_CURRENT_USER");
  EXPECT_EQ(regEdit.LastRegStatus(), 0u);

  regEdit.SetRegDword(u"HKEY_CURRENT_USER", u"a", 1);

  EXPECT_EQ(registry.Value("HKEY_CURRENT_USER", "a"), (RegistryValue{platform::kRegDword, {1, 0, 0, 0}}));
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(RegEditTest, A_badly_formed_path_after_one_of_an_unknown_root_reaches_no_registry) {
  regEdit.SetRegDword(settings, u"a", 1);
  regEdit.CreateRegKey(u"HKEY_NOBODY\\a");
  registry.Calls.clear();

  regEdit.SetRegDword(u"HKEY_CURRENT_USER\\", u"b", 2);

  EXPECT_EQ(desktop.Boxes.size(), 1u);
  EXPECT_TRUE(registry.Calls.empty());
}

TEST_F(RegEditTest, A_text_is_written_in_the_code_page_without_a_closing_NUL) {
  regEdit.SetRegString(settings, u"Name", u"a\u05D0");

  EXPECT_EQ(registry.Value(kSettings, "Name"), (RegistryValue{platform::kRegText, {'a', 0xE0}}));
}

TEST_F(RegEditTest, An_empty_text_is_a_value_of_no_bytes) {
  regEdit.SetRegString(settings, u"Name", u"");

  EXPECT_EQ(registry.Value(kSettings, "Name"), (RegistryValue{platform::kRegText, {}}));
}

TEST_F(RegEditTest, Bytes_are_the_codes_of_the_characters_and_all_256_survive) {
  std::vector<std::uint8_t> all(256);
  for (std::size_t i = 0; i < all.size(); ++i) all[i] = static_cast<std::uint8_t>(i);

  regEdit.SetRegBinary(settings, u"Bytes", FromCodePage(std::string(all.begin(), all.end())));

  EXPECT_EQ(registry.Value(kSettings, "Bytes"), (RegistryValue{platform::kRegBinary, all}));
}

TEST_F(RegEditTest, An_empty_text_for_bytes_is_fault_9_and_leaves_the_key_open) {
  try {
    regEdit.SetRegBinary(settings, u"Bytes", u"");
    FAIL() << "no fault";
  } catch (const Fault& fault) {
    EXPECT_EQ(fault.number, Fault::kSubscript);
  }
  EXPECT_FALSE(registry.Value(kSettings, "Bytes"));
  EXPECT_EQ(registry.OpenCount(), 1u);
}

TEST_F(RegEditTest, A_value_in_a_key_that_doesnt_exist_isnt_written_and_no_message_comes) {
  regEdit.SetRegDword(u"HKEY_CURRENT_USER\\Missing", u"a", 1);
  regEdit.SetRegString(u"HKEY_CURRENT_USER\\Missing", u"a", u"b");
  regEdit.SetRegBinary(u"HKEY_CURRENT_USER\\Missing", u"a", u"b");

  EXPECT_FALSE(registry.HasKey("HKEY_CURRENT_USER\\Missing"));
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_EQ(regEdit.LastRegStatus(), 2u);
}

TEST_F(RegEditTest, A_refused_write_still_closes_the_key_whose_result_is_the_last) {
  struct RefusesValues : platform::simulated::SimulatedRegistry {
    std::uint32_t RegSetValueExA(RegistryKey, const std::string&, std::uint32_t,
                                 std::span<const std::uint8_t>) override {
      return platform::kRegistryDiskFull;
    }
  } refusing;
  refusing.AddKey(kSettings);
  RegEdit writer(refusing, desktop);

  writer.SetRegDword(settings, u"a", 1);

  EXPECT_EQ(writer.LastRegStatus(), 0u);
  EXPECT_EQ(refusing.OpenCount(), 0u);
}

TEST_F(RegEditTest, Keys_and_values_are_found_whatever_their_case) {
  regEdit.SetRegDword(u"HKEY_CURRENT_USER\\SOFTWARE\\quendra", u"ONE", 1);
  regEdit.SetRegDword(settings, u"one", 2);

  EXPECT_EQ(registry.Value(kSettings, "One"), (RegistryValue{platform::kRegDword, {2, 0, 0, 0}}));
}

} // namespace
} // namespace quendra::foundation
