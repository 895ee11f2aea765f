#include "platform/windows/mail/WindowsInstalledProducts.h"

#include "winapi/SystemLibrary.h"

#include <gtest/gtest.h>

namespace quendra::platform::windows {
namespace {

/// Products that the machine's registry lists.
struct WindowsInstalledProductsTest : testing::Test {
  static constexpr const wchar_t* kPlace = L"Software\\Classes\\Installer\\Products\\";
  // "{00160409-78E1-11D2-B60F-006097C998E7}" and another, as the installer packs them.
  static constexpr const wchar_t* kFirst = L"904061001E872D116BF00006799C897E";
  static constexpr const wchar_t* kSecond = L"B49E92CC2CB71D119A12000A9CE1A22A";

  WindowsInstalledProductsTest() {
    for (const wchar_t* product : {kFirst, kSecond}) {
      HKEY key = nullptr;
      advapi32.Find<decltype(::RegCreateKeyExW)>("RegCreateKeyExW")(
          HKEY_LOCAL_MACHINE, (std::wstring(kPlace) + product).c_str(), 0, nullptr, REG_OPTION_VOLATILE,
          KEY_ALL_ACCESS, nullptr, &key, nullptr);
      advapi32.Find<decltype(::RegCloseKey)>("RegCloseKey")(key);
    }
  }
  ~WindowsInstalledProductsTest() override {
    for (const wchar_t* product : {kFirst, kSecond})
      advapi32.Find<decltype(::RegDeleteKeyW)>("RegDeleteKeyW")(HKEY_LOCAL_MACHINE,
                                                                (std::wstring(kPlace) + product).c_str());
  }

  std::string CodeAt(std::uint32_t index) {
    std::string code(InstalledProducts::kProductCodeBytes, ' ');
    if (products.MsiEnumProductsA(index, code) != 0) return "none";
    EXPECT_EQ(code.back(), '\0');
    code.pop_back();
    return code;
  }

  winapi::SystemLibrary advapi32{L"advapi32.dll"};
  WindowsInstalledProducts products;
};

TEST_F(WindowsInstalledProductsTest, Products_are_told_in_order_and_none_behind_the_last) {
  EXPECT_EQ(CodeAt(0), "{00160409-78E1-11D2-B60F-006097C998E7}");
  EXPECT_EQ(CodeAt(1), "{CC29E94B-7BC2-11D1-A921-00A0C91E2AA2}");
  EXPECT_EQ(CodeAt(2), "none");
  EXPECT_EQ(CodeAt(1), "{CC29E94B-7BC2-11D1-A921-00A0C91E2AA2}");
}

TEST_F(WindowsInstalledProductsTest, A_buffer_with_less_room_gets_what_fits_and_a_NUL) {
  std::string room(5, 'x');
  EXPECT_EQ(products.MsiEnumProductsA(0, room), 0U);
  EXPECT_EQ(room, std::string("{001\0", 5));
}

} // namespace
} // namespace quendra::platform::windows
