#pragma once

#include "forms/win32/views/FieldView.h"
#include "forms/win32/views/list/DueCells.h"
#include "forms/win32/views/list/ListColumns.h"
#include "forms/win32/views/list/ListPainter.h"

namespace quendra::forms::win32 {

/// A table. The system's window holds no data: it has the bars, the keys and the columns, and tells assistive
/// technology. Rows and headers are drawn here, each put together before it is shown.
class ListViewView : public FieldView, public ListViewObserver {
 public:
  ListViewView(ViewContext& context, ListView& list, HWND parent);
  void Paint(Drawing& drawing) override;
  Text TipAt(HWND window, Spot place) const override;
  void Release() override;
  void ControlGone() override;

  void RowAdded(int index) override;
  void RowRemoved(int index) override;
  void RowChanged(int index, int cell) override;
  void RowsMoved() override;
  void RowsCleared() override;
  void ColumnsChanged() override;

  /// Where a row, from 0 on, stands in the system's window.
  Area PlaceOfRow(int row) const;
  HWND Header() const { return header_->Window(); }

 protected:
  std::optional<LRESULT> Answer(UINT message, WPARAM wParam, LPARAM lParam) override;
  std::optional<LRESULT> AnswerInner(UINT message, WPARAM wParam, LPARAM lParam) override;
  Area Room(Extent field) const override;
  void PutInPlace() override;
  void Apply(Aspect aspect) override;

 private:
  static constexpr UINT kTell = WM_APP + 0x213;

  ListView& List() const { return static_cast<ListView&>(*TheControl()); }
  /// Changes the system's window without taking what it tells of for the user's choice.
  template <typename Change> void Quietly(Change change);
  std::optional<LRESULT> AnswerHeader(UINT message, WPARAM wParam, LPARAM lParam);
  std::optional<LRESULT> Told(const NMHDR& notice);
  std::optional<LRESULT> ToldByHeader(const NMHDR& notice);
  void TellText(NMHDR& notice) const;
  int Search(const NMHDR& notice) const;
  LRESULT LeaveRoomForBar(WPARAM wParam, LPARAM lParam);
  LRESULT TakeMouse(UINT message, WPARAM wParam, LPARAM lParam);
  void Choose(int row);
  /// The system's window hears once of all that a handler changes: rows it counts and measures anew each
  /// time, which takes milliseconds, and a call for each of hundreds of cells takes as long.
  void Due();
  void RowsDue(int from);
  void Tell();
  void TellColumns();
  void FitColumns();
  void TellRows();
  void RedrawDue();
  RowsInSight InSight() const;
  void SetRowHeight();
  /// The last row in sight is never cut: what a row more would need stays free.
  void FitRows();
  void ShowSelection();
  int TopRow() const;
  /// Not all systems move the whole of a mirrored window's inside when it scrolls.
  void RedrawIfScrolled();
  void PaintRows();
  void PaintHeaders();
  void PaintRing(Drawing& drawing, int top) const;

  ListPainter painter_;
  std::optional<ListColumns> columns_;
  std::optional<InnerWindow> header_;
  std::optional<Surface> canvas_; ///< of one row
  bool quiet_ = false;
  bool fittingRows_ = false;
  DueCells due_;
  bool columnsDue_ = false;
  bool rowsDue_ = false; ///< the system's window has not heard of all rows
  bool telling_ = false; ///< it is about to hear of what is due
  Spot scrolled_{};      ///< how far the rows were that were painted last
  int told_ = 0;         ///< how many rows the system's window has heard of
  int shown_ = -1;       ///< the row that is drawn as selected
};

} // namespace quendra::forms::win32
