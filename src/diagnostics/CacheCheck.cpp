#include "diagnostics/CacheCheck.h"

#include "runtime/Integers.h"

namespace quendra::diagnostics {

namespace {

constexpr int kEntriesARepaint = 10;
constexpr std::int32_t kLimit = 76800;
constexpr const char16_t* kLimitedCaches[] = {
    u"HKEY_CURRENT_USER\\Software\\Microsoft\\Windows\\CurrentVersion\\Internet "
    u"Settings\\5.0\\Cache\\Content",
    u"HKEY_CURRENT_USER\\Software\\Microsoft\\Windows\\CurrentVersion\\Internet Settings\\Cache\\Content",
};

} // namespace

Outcome CacheCheck::Run(CheckRows& rows) {
  DeleteEntries(rows);
  LimitSize();
  return Outcome::Passed;
}

// Element 0 of the list is an empty name, which is handed over like the others.
void CacheCheck::DeleteEntries(CheckRows& rows) {
  std::vector<Text> names(1);
  list_.GetCacheURLList(names);
  const std::int16_t last = ToInt16(static_cast<std::int64_t>(names.size()) - 1);
  for (std::int32_t i = 0; i <= last; ++i) {
    rows.SetDetail(DecimalText(last) + u"/" + DecimalText(i));
    if (i % kEntriesARepaint == 0) rows.Repaint();
    const Text& name = names[static_cast<std::size_t>(i)];
    if (name.find(u"Cookie") == Text::npos) cache_.DeleteUrlCacheEntryA(ToCodePage(name));
  }
}

void CacheCheck::LimitSize() {
  for (const char16_t* key : kLimitedCaches) registry_.SetRegDword(key, u"CacheLimit", kLimit);
}

} // namespace quendra::diagnostics
