#include "mail/MailClients.h"

#include "platform/mail/InstalledProducts.h"

#include <algorithm>
#include <array>

namespace quendra::mail {

namespace {

/// No machine has as many products: a list that doesn't end isn't walked for ever.
constexpr std::uint32_t kMostProducts = 65536;

constexpr std::array<TextView, 2> kProducts2000{u"{00160409-78E1-11D2-B60F-006097C998E7}",
                                                u"{CC29E94B-7BC2-11D1-A921-00A0C91E2AA2}"};

// Codes of the later families tell the product in their fourth and fifth character and the family behind the
// ninth.
constexpr std::array<TextView, 3> kProductsWithOutlook{u"11", u"1A", u"E0"};
constexpr std::size_t kProductAt = 3;
constexpr std::size_t kFamilyAt = 9;
constexpr TextView kFamilyXp = u"-6000-11D3-8CFE-0050048383C9}";
constexpr TextView kFamily2003 = u"-6000-11D3-8CFE-0150048383C9}";

bool IsOneOf(const auto& list, TextView text) { return std::ranges::find(list, text) != list.end(); }

TextView TokenOf(TextView code) {
  if (IsOneOf(kProducts2000, code)) return u"MSO 2k|";
  if (code.size() < kFamilyAt || !IsOneOf(kProductsWithOutlook, code.substr(kProductAt, 2))) return {};
  const TextView family = code.substr(kFamilyAt);
  if (family == kFamilyXp) return u"MSO XP|";
  return family == kFamily2003 ? u"MSO 2k3|" : TextView();
}

} // namespace

Text MailClients::DetectMailClients() {
  Text tokens = u"OE|";
  for (std::uint32_t index = 0; index < kMostProducts; ++index) {
    std::string buffer(platform::InstalledProducts::kProductCodeBytes, ' ');
    buffer.push_back('\0');
    if (products_.MsiEnumProductsA(index, buffer) != 0) break;
    // A text without a "}" is no code: nothing is left of it.
    const Text code = FromCodePage(buffer.substr(0, buffer.find('}') + 1));
    tokens += TokenOf(Trimmed(code));
  }
  return tokens;
}

} // namespace quendra::mail
