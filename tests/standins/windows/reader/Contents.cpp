#include "standins/windows/reader/Contents.h"

#include "standins/windows/reader/ForeignMemory.h"
#include "standins/windows/reader/Json.h"

#include <commctrl.h>

#include <algorithm>
#include <array>

namespace quendra::standins {

namespace {

constexpr LRESULT kMostRows = 5000;
constexpr LRESULT kMostColumns = 40;
constexpr const char* kNoAnswer = "null";
/// Milliseconds for a whole table: a program may hang between two cells.
constexpr DWORD kPatience = 5000;

/// How many of something there are; 0 without an answer.
int Counted(HWND window, UINT message, LRESULT most) {
  return static_cast<int>(std::clamp<LRESULT>(Ask(window, message).value_or(0), 0, most));
}

Text CellIn(HWND table, const ForeignMemory& memory, int row, int column) {
  LVITEMW asked{};
  asked.iSubItem = column;
  asked.pszText = memory.TextAddress();
  asked.cchTextMax = ForeignMemory::kMostCharacters;
  if (!memory.Put(asked)) return {};
  const auto length = Ask(table, LVM_GETITEMTEXTW, static_cast<WPARAM>(row), memory.Address());
  // The window may hand out a text of its own in place of filling ours.
  return length.value_or(0) > 0 ? memory.TakeText() : Text();
}

Text CaptionIn(HWND header, const ForeignMemory& memory, int column) {
  HDITEMW asked{};
  asked.mask = HDI_TEXT;
  asked.pszText = memory.TextAddress();
  asked.cchTextMax = ForeignMemory::kMostCharacters;
  if (!memory.Put(asked)) return {};
  const bool told = Ask(header, HDM_GETITEMW, static_cast<WPARAM>(column), memory.Address()).value_or(0) != 0;
  return told ? memory.TakeText() : Text();
}

/// The middle of a header on the screen: [x, y].
std::string PlaceIn(HWND header, const ForeignMemory& memory, int column) {
  RECT place{};
  if (!Ask(header, HDM_GETITEMRECT, static_cast<WPARAM>(column), memory.Address()) || !memory.Take(place))
    return kNoAnswer;
  POINT middle{(place.left + place.right) / 2, (place.top + place.bottom) / 2};
  ::ClientToScreen(header, &middle);
  return Listed({std::to_string(middle.x), std::to_string(middle.y)});
}

std::string HeadersIn(HWND table, const ForeignMemory& memory, int& columns) {
  const auto header = reinterpret_cast<HWND>(Ask(table, LVM_GETHEADER).value_or(0));
  columns = header ? Counted(header, HDM_GETITEMCOUNT, kMostColumns) : 0;
  std::vector<std::string> headers;
  for (int column = 0; column < columns; ++column)
    headers.push_back("{\"caption\":" + Quoted(CaptionIn(header, memory, column)) +
                      ",\"place\":" + PlaceIn(header, memory, column) + "}");
  return Listed(headers);
}

std::string SelectedIn(HWND table) {
  std::vector<std::string> selected;
  LRESULT row = -1;
  for (int count = 0; count < kMostRows; ++count) {
    row = Ask(table, LVM_GETNEXTITEM, static_cast<WPARAM>(row), LVNI_SELECTED).value_or(-1);
    if (row < 0) break;
    selected.push_back(std::to_string(row));
  }
  return Listed(selected);
}

bool IsCombo(HWND window) {
  std::array<wchar_t, 64> name{};
  ::GetClassNameW(window, name.data(), static_cast<int>(name.size()));
  return ::lstrcmpiW(name.data(), L"COMBOBOX") == 0;
}

} // namespace

std::string FieldIn(HWND window) {
  const auto length = Ask(window, WM_GETTEXTLENGTH);
  if (!length) return kNoAnswer;
  const std::string told = "{\"length\":" + std::to_string(*length);
  if (::GetWindowLongW(window, GWL_STYLE) & ES_PASSWORD) return told + "}";
  std::vector<wchar_t> text(static_cast<std::size_t>(*length) + 1);
  const auto taken = Ask(window, WM_GETTEXT, text.size(), reinterpret_cast<LPARAM>(text.data()));
  if (!taken) return kNoAnswer;
  const auto count = std::min(static_cast<std::size_t>(*taken), text.size());
  return told + ",\"text\":" + Quoted(winapi::TextOf(text.data(), count)) + "}";
}

std::string TableIn(HWND window) {
  const auto count = Ask(window, LVM_GETITEMCOUNT);
  const ForeignMemory memory(window);
  if (!count || !memory.IsThere()) return kNoAnswer;
  const DWORD begin = ::GetTickCount();
  int columns = 0;
  const std::string headers = HeadersIn(window, memory, columns);
  std::vector<std::string> rows;
  for (int row = 0; row < std::min(*count, kMostRows); ++row) {
    if (::GetTickCount() - begin > kPatience) return kNoAnswer;
    std::vector<std::string> cells;
    for (int column = 0; column < columns; ++column)
      cells.push_back(Quoted(CellIn(window, memory, row, column)));
    rows.push_back(Listed(cells));
  }
  return "{\"headers\":" + headers + ",\"rows\":" + Listed(rows) + ",\"selected\":" + SelectedIn(window) +
         "}";
}

std::string ItemsIn(HWND window) {
  const bool combo = IsCombo(window);
  std::vector<std::string> items;
  const int count = Counted(window, combo ? CB_GETCOUNT : LB_GETCOUNT, kMostRows);
  for (int item = 0; item < count; ++item) {
    const auto number = static_cast<WPARAM>(item);
    const LRESULT length = Ask(window, combo ? CB_GETLBTEXTLEN : LB_GETTEXTLEN, number).value_or(-1);
    if (length < 0) return kNoAnswer;
    std::vector<wchar_t> text(static_cast<std::size_t>(length) + 1);
    Ask(window, combo ? CB_GETLBTEXT : LB_GETTEXT, number, reinterpret_cast<LPARAM>(text.data()));
    items.push_back(Quoted(winapi::TextOf(text.data(), static_cast<std::size_t>(length))));
  }
  const auto chosen = Ask(window, combo ? CB_GETCURSEL : LB_GETCURSEL);
  if (!chosen) return kNoAnswer;
  return "{\"items\":" + Listed(items) + ",\"chosen\":" + std::to_string(*chosen) + "}";
}

} // namespace quendra::standins
