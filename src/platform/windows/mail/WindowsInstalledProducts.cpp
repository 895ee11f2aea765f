#include "platform/windows/mail/WindowsInstalledProducts.h"

#include "winapi/SystemLibrary.h"

#include <algorithm>
#include <array>

namespace quendra::platform::windows {

namespace {

using EnumProducts = UINT WINAPI(DWORD index, wchar_t* code);

/// No machine has as many: a list that doesn't end isn't walked for ever.
constexpr DWORD kMostProducts = 65536;

std::vector<std::string> Products() {
  std::vector<std::string> codes;
  const winapi::SystemLibrary msi(L"msi.dll");
  const auto enumerate = msi.Find<EnumProducts>("MsiEnumProductsW");
  std::array<wchar_t, InstalledProducts::kProductCodeBytes> code{};
  for (DWORD index = 0; enumerate && index < kMostProducts; ++index) {
    if (enumerate(index, code.data()) != ERROR_SUCCESS) break;
    code.back() = L'\0';
    codes.push_back(ToCodePage(winapi::TextOf(code.data())));
  }
  return codes;
}

} // namespace

std::uint32_t WindowsInstalledProducts::MsiEnumProductsA(std::uint32_t index, std::span<char> code) {
  if (index == 0) codes_ = Products();
  if (index >= codes_.size()) return kNoMoreItems;
  if (code.empty()) return 0;
  const std::string& product = codes_[index];
  const std::size_t length = std::min(product.size(), code.size() - 1);
  std::copy_n(product.begin(), length, code.begin());
  code[length] = '\0';
  return 0;
}

} // namespace quendra::platform::windows
