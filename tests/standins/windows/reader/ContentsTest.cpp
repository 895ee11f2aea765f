#include "standins/windows/reader/Contents.h"

#include <gtest/gtest.h>

#include <commctrl.h>

// Windows as the tour meets them, and odd ones.

namespace quendra::standins {
namespace {

class MadeWindow {
 public:
  explicit MadeWindow(const wchar_t* name, DWORD style = 0)
      : window_(::CreateWindowExW(0, name, L"", WS_POPUP | style, 0, 0, 400, 300, nullptr, nullptr, nullptr,
                                  nullptr)) {}
  ~MadeWindow() { ::DestroyWindow(window_); }
  MadeWindow(const MadeWindow&) = delete;

  HWND Handle() const { return window_; }
  LRESULT Send(UINT message, WPARAM wParam = 0, LPARAM lParam = 0) const {
    return ::SendMessageW(window_, message, wParam, lParam);
  }
  LRESULT Send(UINT message, WPARAM wParam, const wchar_t* text) const {
    return Send(message, wParam, reinterpret_cast<LPARAM>(text));
  }

 private:
  HWND window_;
};

/// A table, each of whose rows is as long as the row of captions.
class MadeTable : public MadeWindow {
 public:
  using Texts = std::vector<const wchar_t*>;

  explicit MadeTable(const Texts& captions, const std::vector<Texts>& rows)
      : MadeWindow(WC_LISTVIEWW, LVS_REPORT) {
    for (std::size_t i = 0; i < captions.size(); ++i) AddColumn(static_cast<int>(i), captions[i]);
    for (std::size_t row = 0; row < rows.size(); ++row) {
      Put(LVM_INSERTITEMW, row, 0, L"");
      for (std::size_t cell = 0; cell < rows[row].size(); ++cell)
        Put(LVM_SETITEMTEXTW, row, cell, rows[row][cell]);
    }
  }

  void Select(int row) const {
    LVITEMW item{};
    item.stateMask = item.state = LVIS_SELECTED;
    Send(LVM_SETITEMSTATE, static_cast<WPARAM>(row), reinterpret_cast<LPARAM>(&item));
  }

 private:
  void AddColumn(int number, const wchar_t* caption) const {
    LVCOLUMNW column{};
    column.mask = LVCF_TEXT | LVCF_WIDTH;
    column.cx = 50;
    column.pszText = const_cast<wchar_t*>(caption);
    Send(LVM_INSERTCOLUMNW, static_cast<WPARAM>(number), reinterpret_cast<LPARAM>(&column));
  }
  void Put(UINT message, std::size_t row, std::size_t cell, const wchar_t* text) const {
    LVITEMW item{};
    item.mask = LVIF_TEXT;
    item.iItem = static_cast<int>(row);
    item.iSubItem = static_cast<int>(cell);
    item.pszText = const_cast<wchar_t*>(text);
    Send(message, row, reinterpret_cast<LPARAM>(&item));
  }
};

/// A window of another thread, which answers with 1, or with itself when asked for its header, until a
/// message comes at which it hangs.
class HangingWindow {
 public:
  explicit HangingWindow(UINT message) : hangsAt_(message) {
    thread_ = ::CreateThread(nullptr, 0, Live, this, 0, nullptr);
    ::WaitForSingleObject(made_, INFINITE);
  }
  ~HangingWindow() {
    ::SetEvent(goesOn_);
    ::PostMessageW(window_, WM_CLOSE, 0, 0);
    ::WaitForSingleObject(thread_, INFINITE);
    for (const HANDLE handle : {thread_, made_, goesOn_}) ::CloseHandle(handle);
  }
  HangingWindow(const HangingWindow&) = delete;

  HWND Handle() const { return window_; }

 private:
  static DWORD WINAPI Live(void* place) {
    auto& own = *static_cast<HangingWindow*>(place);
    own.window_ =
        ::CreateWindowExW(0, L"STATIC", L"", WS_POPUP, 0, 0, 9, 9, nullptr, nullptr, nullptr, nullptr);
    ::SetWindowLongPtrW(own.window_, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(&own));
    ::SetWindowLongPtrW(own.window_, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&Procedure));
    ::SetEvent(own.made_);
    MSG message{};
    while (::GetMessageW(&message, nullptr, 0, 0) > 0) ::DispatchMessageW(&message);
    return 0;
  }
  static LRESULT CALLBACK Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
    const auto& own = *reinterpret_cast<HangingWindow*>(::GetWindowLongPtrW(window, GWLP_USERDATA));
    if (message == own.hangsAt_) ::WaitForSingleObject(own.goesOn_, INFINITE);
    if (message == WM_DESTROY) ::PostQuitMessage(0);
    if (message < LVM_FIRST && (message < LB_ADDSTRING || message > LB_MSGMAX))
      return ::DefWindowProcW(window, message, wParam, lParam);
    if (message == LVM_GETNEXTITEM) return -1;
    return message == LVM_GETHEADER ? reinterpret_cast<LRESULT>(window) : 1;
  }

  const UINT hangsAt_;
  HANDLE made_ = ::CreateEventW(nullptr, TRUE, FALSE, nullptr);
  HANDLE goesOn_ = ::CreateEventW(nullptr, TRUE, FALSE, nullptr);
  HANDLE thread_ = nullptr;
  HWND window_ = nullptr;
};

HWND WindowThatIsGone() { return MadeWindow(L"STATIC").Handle(); }

/// Without the places of its headers.
std::string TableOf(HWND window) {
  std::string told = TableIn(window);
  for (auto at = told.find(",\"place\":["); at != std::string::npos; at = told.find(",\"place\":["))
    told.erase(at, told.find(']', at) + 1 - at);
  return told;
}

TEST(Contents, Of_a_field_are_its_text_whatever_stands_in_it) {
  const MadeWindow field(L"EDIT", ES_MULTILINE);
  EXPECT_EQ(FieldIn(field.Handle()), R"({"length":0,"text":""})");
  field.Send(WM_SETTEXT, 0, L"\"a\\b\"\r\nש");
  EXPECT_EQ(FieldIn(field.Handle()), R"({"length":8,"text":"\u0022a\u005cb\u0022\u000d\u000a\u05e9"})");
}

TEST(Contents, Of_a_secret_field_are_its_length_alone) {
  const MadeWindow field(L"EDIT", ES_PASSWORD);
  field.Send(WM_SETTEXT, 0, L"geheim");
  EXPECT_EQ(FieldIn(field.Handle()), R"({"length":6})");
}

TEST(Contents, Of_a_list_are_its_items_and_which_is_chosen) {
  const MadeWindow list(L"LISTBOX");
  EXPECT_EQ(ItemsIn(list.Handle()), R"({"items":[],"chosen":-1})");
  for (const wchar_t* item : {L"long one", L"", L"\"ש", L""}) list.Send(LB_ADDSTRING, 0, item);
  EXPECT_EQ(ItemsIn(list.Handle()), R"({"items":["long one","","\u0022\u05e9",""],"chosen":-1})");
  list.Send(LB_SETCURSEL, 2);
  EXPECT_EQ(ItemsIn(list.Handle()), R"({"items":["long one","","\u0022\u05e9",""],"chosen":2})");
}

TEST(Contents, Of_a_list_that_drops_down_are_told_likewise) {
  const MadeWindow list(L"COMBOBOX", CBS_DROPDOWNLIST);
  EXPECT_EQ(ItemsIn(list.Handle()), R"({"items":[],"chosen":-1})");
  for (const wchar_t* item : {L"one", L""}) list.Send(CB_ADDSTRING, 0, item);
  list.Send(CB_SETCURSEL, 1);
  EXPECT_EQ(ItemsIn(list.Handle()), R"({"items":["one",""],"chosen":1})");
}

TEST(Contents, Of_a_table_are_its_headers_its_cells_and_the_rows_that_are_selected) {
  const MadeTable table({L"Name", L""}, {{L"full", L"\"2\""}, {L"", L""}, {L"ש", L"x"}});
  table.Select(0);
  table.Select(2);
  EXPECT_EQ(TableOf(table.Handle()),
            R"({"headers":[{"caption":"Name"},{"caption":""}],)"
            R"("rows":[["full","\u00222\u0022"],["",""],["\u05e9","x"]],"selected":[0,2]})");
}

TEST(Contents, Of_a_table_are_empty_without_rows_or_columns) {
  EXPECT_EQ(TableOf(MadeTable({L"Name"}, {}).Handle()),
            R"({"headers":[{"caption":"Name"}],"rows":[],"selected":[]})");
  EXPECT_EQ(TableOf(MadeTable({}, {{}, {}}).Handle()), R"({"headers":[],"rows":[[],[]],"selected":[]})");
}

TEST(Contents, Of_a_cell_longer_than_is_asked_for_are_its_beginning) {
  const std::wstring longer(10'000, L'x');
  const std::string told = TableOf(MadeTable({L"A", L"B"}, {{longer.c_str(), L"y"}}).Handle());
  EXPECT_GT(told.size(), 3000U);
  EXPECT_LT(told.size(), longer.size());
  EXPECT_TRUE(told.ends_with(R"(xxx","y"]],"selected":[]})")) << told.substr(told.size() - 50);
}

TEST(Contents, Of_a_window_that_is_gone_are_none) {
  const HWND gone = WindowThatIsGone();
  EXPECT_EQ(FieldIn(gone), "null");
  EXPECT_EQ(ItemsIn(gone), "null");
  EXPECT_EQ(TableIn(gone), "null");
}

TEST(Contents, Of_a_window_that_hangs_at_any_question_are_none_and_not_a_part_of_them) {
  EXPECT_EQ(ItemsIn(HangingWindow(LB_GETCOUNT).Handle()), "null");
  EXPECT_EQ(TableIn(HangingWindow(LVM_GETITEMTEXTW).Handle()), "null");
  EXPECT_EQ(TableIn(HangingWindow(LVM_GETNEXTITEM).Handle()), "null");
}

} // namespace
} // namespace quendra::standins
