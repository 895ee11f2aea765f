#pragma once

#include "forms/controls/ListView.h"
#include "forms/qt/views/ListModel.h"
#include "forms/qt/views/WidgetView.h"

#include <QTreeView>

namespace quendra::forms::qt {

class ListViewView : public QTreeView, public WidgetView, public ListViewObserver {
 public:
  ListViewView(ViewContext& context, ListView& list, QWidget* parent);

  bool TakesMouse() const override { return false; }
  void Release() override;
  void ControlGone() override;

  void RowAdded(int index) override;
  void RowRemoved(int index) override;
  void RowChanged(int index, int cell) override;
  void RowsMoved() override;
  void RowsCleared() override;
  void ColumnsChanged() override;

 protected:
  void Apply(Aspect aspect) override;
  void resizeEvent(QResizeEvent* event) override;
  void currentChanged(const QModelIndex& current, const QModelIndex& previous) override;
  void keyPressEvent(QKeyEvent* event) override;
  void paintEvent(QPaintEvent* event) override;

 private:
  ListView& List() const { return static_cast<ListView&>(*TheControl()); }
  /// Changes the model without taking the toolkit's own moves of the selection for the user's.
  template <typename Change> void Quietly(Change change);
  /// The columns as they were set up, as far as there is room. The user's own widths stay until then.
  void SizeColumns();
  void FitColumns();
  /// The last row in sight is never cut: what a row more would need stays free.
  void FitRows();
  int RowHeight() const;
  void ShowSelection();
  void HeaderClicked(int section);

  ListModel model_;
  bool quiet_ = false;
  bool sizing_ = false;
  bool sizedByHand_ = false;
};

} // namespace quendra::forms::qt
