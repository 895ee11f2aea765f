#pragma once

#include "forms/view/ListLook.h"
#include "forms/win32/views/ViewFixture.h"
#include "forms/win32/views/list/ListViewView.h"

#include <commctrl.h>

namespace quendra::forms::win32 {

class TableWindow : public ViewFixture {
 protected:
  TableWindow() {
    form.design = [this] { list.Move(0, 0, 6000, 4500); };
    list.AddColumn({u"יישום", 1500});
    list.AddColumn({u"פורטים", 1500, Alignment::Trailing});
  }

  ListRow& AddRow(const Text& name) {
    ListRow& row = list.Add(u"p" + name, name, 0);
    row.AddCell(u".80.", {});
    return row;
  }
  ListViewView& View() { return As<ListViewView>(list); }
  LRESULT Ask(UINT message, WPARAM wParam = 0, LPARAM lParam = 0) {
    Settle();
    return ::SendMessageW(Inner(list), message, wParam, lParam);
  }
  int Count() { return static_cast<int>(Ask(LVM_GETITEMCOUNT)); }
  int SelectedRow() { return static_cast<int>(Ask(LVM_GETNEXTITEM, static_cast<WPARAM>(-1), LVNI_SELECTED)); }
  int Width(int column) { return static_cast<int>(Ask(LVM_GETCOLUMNWIDTH, static_cast<WPARAM>(column))); }
  Text Shown(int row, int column) {
    wchar_t text[64] = {};
    LVITEMW item{};
    item.iSubItem = column;
    item.pszText = text;
    item.cchTextMax = 64;
    Ask(LVM_GETITEMTEXTW, static_cast<WPARAM>(row), reinterpret_cast<LPARAM>(&item));
    return winapi::TextOf(text);
  }
  Extent Inside() {
    Settle();
    return View().Inner().Inside();
  }
  int RowHeight() { return View().PlaceOfRow(0).extent.height; }
  int HeaderHeight() {
    RECT header{};
    ::GetWindowRect(View().Header(), &header);
    return static_cast<int>(header.bottom - header.top);
  }
  /// In the pixels of the system's window, whose own places count from the right.
  Spot MiddleOf(int row) { return {20, View().PlaceOfRow(row).corner.top + RowHeight() / 2}; }

  /// Handles what the view has posted to the system's window, and nothing else.
  void TellDue() {
    MSG message{};
    while (::PeekMessageW(&message, Inner(list), WM_APP, 0xBFFF, PM_REMOVE)) ::DispatchMessageW(&message);
  }
  /// Of the columns that are 100 pixels wide, counted from the right as the system's window does.
  bool IsDue(int row, int cell) {
    const HRGN region = ::CreateRectRgn(0, 0, 0, 0);
    ::GetUpdateRgn(Inner(list), region, FALSE);
    const int middle = View().PlaceOfRow(row).corner.top + RowHeight() / 2;
    const bool due = ::PtInRegion(region, 100 * cell + 50, middle) != 0;
    ::DeleteObject(region);
    return due;
  }
  RECT OnScreen() {
    RECT window{};
    ::GetWindowRect(Inner(list), &window);
    return window;
  }
  /// Pixels between the window's left or right edge and what rows have.
  LONG BarBeside(bool left) {
    const RECT window = OnScreen();
    RECT rows{};
    ::GetClientRect(Inner(list), &rows);
    ::MapWindowPoints(Inner(list), nullptr, reinterpret_cast<POINT*>(&rows), 2);
    return left ? rows.left - window.left : window.right - rows.right;
  }
  static bool IsGround(Colour colour) {
    return colour == RowGround(0, false) || colour == RowGround(1, false) || colour == RowGround(0, true);
  }

  ImageList icons{form, u"icons"};
  ListView list{form, u"main_ListView1"};
};

} // namespace quendra::forms::win32
