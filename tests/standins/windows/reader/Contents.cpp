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
/// Milliseconds for a whole table: a program may hang between two cells.
constexpr DWORD kPatience = 5000;

/// Nothing is told of a window that leaves a question open: a part would be taken for the whole.
struct NoAnswer {};

LRESULT AnswerOf(HWND window, UINT message, WPARAM wParam = 0, LPARAM lParam = 0) {
  if (const auto answer = Ask(window, message, wParam, lParam)) return *answer;
  throw NoAnswer();
}

int Counted(HWND window, UINT message, LRESULT most) {
  return static_cast<int>(std::clamp<LRESULT>(AnswerOf(window, message), 0, most));
}

Text CellIn(HWND table, const ForeignMemory& memory, int row, int column) {
  LVITEMW asked{};
  asked.iSubItem = column;
  asked.pszText = memory.TextAddress();
  asked.cchTextMax = ForeignMemory::kMostCharacters;
  if (!memory.Put(asked)) throw NoAnswer();
  const bool told = AnswerOf(table, LVM_GETITEMTEXTW, static_cast<WPARAM>(row), memory.Address()) > 0;
  // For an empty text the window may leave ours as it was.
  return told ? memory.TakeText() : Text();
}

Text CaptionIn(HWND header, const ForeignMemory& memory, int column) {
  HDITEMW asked{};
  asked.mask = HDI_TEXT;
  asked.pszText = memory.TextAddress();
  asked.cchTextMax = ForeignMemory::kMostCharacters;
  if (!memory.Put(asked)) throw NoAnswer();
  const bool told = AnswerOf(header, HDM_GETITEMW, static_cast<WPARAM>(column), memory.Address()) != 0;
  return told ? memory.TakeText() : Text();
}

/// The middle of a header on the screen: [x, y].
std::string PlaceIn(HWND header, const ForeignMemory& memory, int column) {
  RECT place{};
  AnswerOf(header, HDM_GETITEMRECT, static_cast<WPARAM>(column), memory.Address());
  if (!memory.Take(place)) throw NoAnswer();
  POINT middle{(place.left + place.right) / 2, (place.top + place.bottom) / 2};
  ::ClientToScreen(header, &middle);
  return Listed({std::to_string(middle.x), std::to_string(middle.y)});
}

std::string HeadersIn(HWND table, const ForeignMemory& memory, int& columns) {
  const auto header = reinterpret_cast<HWND>(AnswerOf(table, LVM_GETHEADER));
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
    row = AnswerOf(table, LVM_GETNEXTITEM, static_cast<WPARAM>(row), LVNI_SELECTED);
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

std::string ToldOfField(HWND window) {
  const LRESULT length = AnswerOf(window, WM_GETTEXTLENGTH);
  const std::string told = "{\"length\":" + std::to_string(length);
  if (::GetWindowLongW(window, GWL_STYLE) & ES_PASSWORD) return told + "}";
  std::vector<wchar_t> text(static_cast<std::size_t>(length) + 1);
  const LRESULT taken = AnswerOf(window, WM_GETTEXT, text.size(), reinterpret_cast<LPARAM>(text.data()));
  const auto count = std::min(static_cast<std::size_t>(taken), text.size());
  return told + ",\"text\":" + Quoted(winapi::TextOf(text.data(), count)) + "}";
}

std::string ToldOfTable(HWND window) {
  const int count = Counted(window, LVM_GETITEMCOUNT, kMostRows);
  const ForeignMemory memory(window);
  if (!memory.IsThere()) throw NoAnswer();
  const DWORD begin = ::GetTickCount();
  int columns = 0;
  const std::string headers = HeadersIn(window, memory, columns);
  std::vector<std::string> rows;
  for (int row = 0; row < count; ++row) {
    if (::GetTickCount() - begin > kPatience) throw NoAnswer();
    std::vector<std::string> cells;
    for (int column = 0; column < columns; ++column)
      cells.push_back(Quoted(CellIn(window, memory, row, column)));
    rows.push_back(Listed(cells));
  }
  return "{\"headers\":" + headers + ",\"rows\":" + Listed(rows) + ",\"selected\":" + SelectedIn(window) +
         "}";
}

std::string ToldOfItems(HWND window) {
  const bool combo = IsCombo(window);
  std::vector<std::string> items;
  const int count = Counted(window, combo ? CB_GETCOUNT : LB_GETCOUNT, kMostRows);
  for (int item = 0; item < count; ++item) {
    const auto number = static_cast<WPARAM>(item);
    const LRESULT length = AnswerOf(window, combo ? CB_GETLBTEXTLEN : LB_GETTEXTLEN, number);
    if (length < 0) throw NoAnswer(); // it went meanwhile
    std::vector<wchar_t> text(static_cast<std::size_t>(length) + 1);
    AnswerOf(window, combo ? CB_GETLBTEXT : LB_GETTEXT, number, reinterpret_cast<LPARAM>(text.data()));
    items.push_back(Quoted(winapi::TextOf(text.data(), static_cast<std::size_t>(length))));
  }
  const LRESULT chosen = AnswerOf(window, combo ? CB_GETCURSEL : LB_GETCURSEL);
  return "{\"items\":" + Listed(items) + ",\"chosen\":" + std::to_string(chosen) + "}";
}

std::string AllOrNothing(std::string (*toldOf)(HWND window), HWND window) {
  try {
    return toldOf(window);
  } catch (const NoAnswer&) {
    return "null";
  }
}

} // namespace

std::string FieldIn(HWND window) { return AllOrNothing(ToldOfField, window); }

std::string TableIn(HWND window) { return AllOrNothing(ToldOfTable, window); }

std::string ItemsIn(HWND window) { return AllOrNothing(ToldOfItems, window); }

} // namespace quendra::standins
