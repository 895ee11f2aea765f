#include "platform/BehaviourFixture.h"
#include "platform/registry/Registry.h"

#include <array>

namespace quendra::platform {
namespace {

using Bytes = std::vector<std::uint8_t>;

struct RegistryBehaviourTest : BehaviourTest {
  Registry& registry = machine.registry;

  RegistryKey Make(const std::string& path, RegistryKey parent = kCurrentUser) {
    RegistryKey key;
    EXPECT_EQ(registry.RegCreateKeyA(parent, path, key), kRegistrySuccess) << path;
    return key;
  }
  std::uint32_t Open(const std::string& path, std::uint32_t access, RegistryKey& key) {
    return registry.RegOpenKeyExA(kCurrentUser, path, access, key);
  }
  Bytes Read(RegistryKey key, const std::string& name, std::uint32_t& type) {
    Bytes data(1000);
    std::uint32_t size = 0;
    const auto error = registry.RegQueryValueExA(key, name, type, data, size);
    EXPECT_EQ(error, kRegistrySuccess) << name;
    data.resize(error == kRegistrySuccess ? size : 0);
    return data;
  }
  Bytes Read(RegistryKey key, const std::string& name) {
    std::uint32_t type = 0;
    return Read(key, name, type);
  }
};

TEST_P(RegistryBehaviourTest, A_key_is_made_with_all_above_it_and_opened_later) {
  const RegistryKey made = Make("One\\Two\\Three");
  RegistryKey opened;

  EXPECT_EQ(Open("One\\Two\\Three", kKeyRead, opened), kRegistrySuccess);
  EXPECT_NE(opened, made);
  EXPECT_EQ(registry.RegCloseKey(made), kRegistrySuccess);
  EXPECT_EQ(registry.RegCloseKey(made), kInvalidRegistryKey);
}

TEST_P(RegistryBehaviourTest, A_key_that_isnt_there_is_not_found_and_leaves_the_handle) {
  RegistryKey key(77);
  EXPECT_EQ(Open("Missing", kKeyRead, key), kKeyNotFound);
  EXPECT_EQ(Open("Missing\\Below", kKeyRead, key), kKeyNotFound);
  EXPECT_EQ(key, RegistryKey(77));
}

TEST_P(RegistryBehaviourTest, Making_a_key_again_keeps_its_values_and_the_case_of_its_name) {
  const RegistryKey key = Make("Case");
  ASSERT_EQ(registry.RegSetValueExA(key, "v", kRegBinary, Bytes{1}), kRegistrySuccess);

  EXPECT_EQ(Read(Make("cASE"), "V"), Bytes{1});
  RegistryKey all;
  std::string name;
  ASSERT_EQ(registry.RegOpenKeyExA(kCurrentUser, "", kKeyRead, all), kRegistrySuccess);
  EXPECT_EQ(registry.RegEnumKeyExA(all, 0, name), kRegistrySuccess);
  EXPECT_EQ(name, "Case");
}

TEST_P(RegistryBehaviourTest, Hebrew_names_and_bytes_that_the_code_page_leaves_undefined_survive) {
  const RegistryKey key = Make("\xE6\xEC\xEE\xF8\\\x8D\xFF");
  ASSERT_EQ(registry.RegSetValueExA(key, "\xFF", kRegText, Bytes{0xFF, 0x8D}), kRegistrySuccess);

  EXPECT_EQ(Read(key, "\xFF"), (Bytes{0xFF, 0x8D}));
  RegistryKey parent;
  std::string name;
  ASSERT_EQ(Open("\xE6\xEC\xEE\xF8", kKeyRead, parent), kRegistrySuccess);
  ASSERT_EQ(registry.RegEnumKeyExA(parent, 0, name), kRegistrySuccess);
  EXPECT_EQ(name, "\x8D\xFF");
}

TEST_P(RegistryBehaviourTest, Values_keep_type_and_bytes_NULs_too) {
  const RegistryKey key = Make("Values");
  for (const std::uint32_t type : {0U, 1U, 3U, 4U, 0xFFFFFFFFU})
    for (const Bytes& data : {Bytes{}, Bytes{0}, Bytes{0, 1, 0, 255}}) {
      ASSERT_EQ(registry.RegSetValueExA(key, "v", type, data), kRegistrySuccess);
      std::uint32_t told = 7;
      EXPECT_EQ(Read(key, "v", told), data);
      EXPECT_EQ(told, type);
    }
}

TEST_P(RegistryBehaviourTest, A_value_tells_its_size_first_and_fills_no_buffer_with_less_room) {
  const RegistryKey key = Make("Values");
  ASSERT_EQ(registry.RegSetValueExA(key, "v", kRegBinary, Bytes{1, 2, 3}), kRegistrySuccess);
  std::uint32_t type = 0;
  std::uint32_t size = 0;
  std::array<std::uint8_t, 2> room{9, 9};

  EXPECT_EQ(registry.RegQueryValueExA(key, "v", type, {}, size), kRegistrySuccess);
  EXPECT_EQ(size, 3u);
  size = 0;
  EXPECT_EQ(registry.RegQueryValueExA(key, "v", type, room, size), kMoreValueData);
  EXPECT_EQ(size, 3u);
  EXPECT_EQ(room, (std::array<std::uint8_t, 2>{9, 9}));
  EXPECT_EQ(registry.RegQueryValueExA(key, "other", type, room, size), kKeyNotFound);
}

TEST_P(RegistryBehaviourTest, A_handle_does_what_it_was_opened_for) {
  Make("Access");
  RegistryKey reading;
  RegistryKey writing;
  ASSERT_EQ(Open("Access", kKeyRead, reading), kRegistrySuccess);
  ASSERT_EQ(Open("Access", kSetValue, writing), kRegistrySuccess);
  std::uint32_t number = 0;
  std::string name;

  EXPECT_EQ(registry.RegSetValueExA(reading, "v", kRegBinary, Bytes{1}), kRegistryAccessDenied);
  EXPECT_EQ(registry.RegSetValueExA(writing, "v", kRegBinary, Bytes{1}), kRegistrySuccess);
  EXPECT_EQ(registry.RegQueryValueExA(writing, "v", number, {}, number), kRegistryAccessDenied);
  EXPECT_EQ(registry.RegEnumKeyExA(writing, 0, name), kRegistryAccessDenied);
  EXPECT_EQ(registry.RegQueryValueExA(reading, "v", number, {}, number), kRegistrySuccess);
  // Making a key below doesn't ask what the handle was opened for.
  Make("Below", writing);
}

TEST_P(RegistryBehaviourTest, Paths_with_an_empty_name_are_refused) {
  RegistryKey key(77);
  for (const char* path : {"\\", "\\One", "One\\", "One\\\\Two", "HKEY_CURRENT_USER\\"}) {
    EXPECT_EQ(registry.RegCreateKeyA(kCurrentUser, path, key), kBadKeyPath) << path;
    EXPECT_EQ(Open(path, kKeyRead, key), kBadKeyPath) << path;
  }
  EXPECT_EQ(Open("One", kKeyRead, key), kKeyNotFound);
}

TEST_P(RegistryBehaviourTest, Names_of_255_bytes_and_512_deep_are_the_limit) {
  RegistryKey key;
  Make(std::string(255, 'x'));
  EXPECT_EQ(registry.RegCreateKeyA(kCurrentUser, std::string(256, 'x'), key), kRegistryInvalidParameter);
  std::string deep = "d";
  for (int i = 1; i < 512; ++i) deep += "\\d";
  Make(deep);
  EXPECT_EQ(registry.RegCreateKeyA(kCurrentUser, deep + "\\d", key), kRegistryInvalidParameter);
  EXPECT_EQ(registry.RegSetValueExA(kCurrentUser, std::string(16384, 'x'), kRegText, {}),
            kRegistryInvalidParameter);
}

TEST_P(RegistryBehaviourTest, A_path_ends_at_its_NUL) {
  Make(std::string("Cut\0\\Off", 8));
  RegistryKey key;
  EXPECT_EQ(Open("Cut", kKeyRead, key), kRegistrySuccess);
  EXPECT_EQ(Open("Cut\\Off", kKeyRead, key), kKeyNotFound);
}

TEST_P(RegistryBehaviourTest, Roots_are_open_hold_values_and_stay_open) {
  EXPECT_EQ(registry.RegSetValueExA(kCurrentUser, "v", kRegBinary, Bytes{5}), kRegistrySuccess);
  EXPECT_EQ(registry.RegCloseKey(kCurrentUser), kRegistrySuccess);
  EXPECT_EQ(Read(kCurrentUser, "v"), Bytes{5});
  RegistryKey key;
  EXPECT_EQ(registry.RegOpenKeyExA(RegistryKey(0x80000007), "", kKeyRead, key), kInvalidRegistryKey);
  EXPECT_EQ(registry.RegOpenKeyExA(kNoRegistryKey, "", kKeyRead, key), kInvalidRegistryKey);
}

TEST_P(RegistryBehaviourTest, No_hive_is_made_or_deleted) {
  RegistryKey key;
  EXPECT_EQ(registry.RegCreateKeyA(kLocalMachine, "Mine", key), kRegistryInvalidParameter);
  EXPECT_EQ(registry.RegCreateKeyA(kUsers, "Mine\\Below", key), kRegistryInvalidParameter);
  EXPECT_EQ(registry.RegCreateKeyA(kLocalMachine, "Software\\Mine", key), kRegistrySuccess);
  EXPECT_EQ(registry.RegDeleteKeyA(kLocalMachine, "SAM"), kRegistryAccessDenied);
  EXPECT_EQ(registry.RegDeleteKeyA(kCurrentUser, ""), kRegistryAccessDenied);
}

TEST_P(RegistryBehaviourTest, A_key_with_keys_stays_and_a_deleted_one_takes_nothing_more) {
  const RegistryKey outer = Make("Outer");
  const RegistryKey inner = Make("Outer\\Inner");
  ASSERT_EQ(registry.RegSetValueExA(inner, "v", kRegBinary, Bytes{1}), kRegistrySuccess);

  EXPECT_EQ(registry.RegDeleteKeyA(kCurrentUser, "Outer"), kRegistryAccessDenied);
  EXPECT_EQ(registry.RegDeleteKeyA(outer, "inner"), kRegistrySuccess);
  EXPECT_EQ(registry.RegSetValueExA(inner, "v", kRegBinary, Bytes{1}), kKeyMarkedDeleted);
  EXPECT_EQ(registry.RegDeleteKeyA(kCurrentUser, "Outer"), kRegistrySuccess);
  EXPECT_EQ(registry.RegDeleteKeyA(kCurrentUser, "Outer"), kKeyNotFound);
  // Made anew, it is empty.
  std::uint32_t number = 0;
  EXPECT_EQ(registry.RegQueryValueExA(Make("Outer\\Inner"), "v", number, {}, number), kKeyNotFound);
}

TEST_P(RegistryBehaviourTest, Keys_are_told_by_number_and_values_can_be_deleted) {
  const RegistryKey key = Make("List");
  for (const char* name : {"b", "A", "c"}) Make(name, key);
  std::string names;
  std::string name;
  for (std::uint32_t i = 0; registry.RegEnumKeyExA(key, i, name) == kRegistrySuccess; ++i) names += name;
  EXPECT_EQ(names, "Abc");
  EXPECT_EQ(registry.RegEnumKeyExA(key, 3, name), kNoMoreKeys);

  ASSERT_EQ(registry.RegSetValueExA(key, "v", kRegBinary, Bytes{1}), kRegistrySuccess);
  EXPECT_EQ(registry.RegDeleteValueA(key, "V"), kRegistrySuccess);
  EXPECT_EQ(registry.RegDeleteValueA(key, "v"), kKeyNotFound);
}

TEST_P(RegistryBehaviourTest, A_fresh_system_has_the_newer_internet_settings_alone) {
  const std::string settings = "software\\microsoft\\windows\\CurrentVersion\\Internet Settings\\";
  RegistryKey key;
  EXPECT_EQ(Open(settings + "5.0\\Cache\\Content", kKeyWrite, key), kRegistrySuccess);
  EXPECT_EQ(Open(settings + "Cache\\Content", kKeyWrite, key), kKeyNotFound);
  EXPECT_EQ(registry.RegOpenKeyExA(kLocalMachine, "SYSTEM\\CurrentControlSet\\Services", kKeyWrite, key),
            kRegistrySuccess);
}

INSTANTIATE_TEST_SUITE_P(, RegistryBehaviourTest, kEveryBackend, NameOfBackend);

} // namespace
} // namespace quendra::platform
