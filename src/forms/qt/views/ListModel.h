#pragma once

#include "forms/controls/ListView.h"
#include "forms/qt/drawing/PictureStore.h"

#include <QAbstractTableModel>

namespace quendra::forms::qt {

/// Reads straight from the list. Its row count is what the view has been told so far: the toolkit asks for
/// the old rows while it hears of a change that the list has made already.
class ListModel : public QAbstractTableModel {
 public:
  ListModel(const ListView& list, PictureStore& pictures)
      : list_(&list), pictures_(pictures), rows_(list.Count()) {}

  int rowCount(const QModelIndex& parent = {}) const override { return parent.isValid() ? 0 : rows_; }
  int columnCount(const QModelIndex& parent = {}) const override;
  QVariant data(const QModelIndex& index, int role) const override;
  QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

  void RowAdded(int index);
  void RowRemoved(int index);
  void Reset();
  /// Tells the toolkit's observers beside the view, assistive technology above all.
  void TellCellChanged(int index, int cell);
  void TellRowsMoved();
  /// The list is gone; the model stays empty.
  void Release();

  /// The row of the list, nullptr where there is none.
  const ListRow* RowAt(int row) const;
  const ListView* List() const { return list_; }
  /// A small icon of the list by its index, scaled to `side` pixels; null for none.
  QPixmap SmallIcon(int icon, int side) const;
  QPixmap HeaderIcon(int section) const;

 private:
  struct CachedIcon {
    Picture picture;
    int side = 0;
    QPixmap pixmap;
  };

  const ListView* list_;
  PictureStore& pictures_;
  int rows_;
  mutable std::vector<CachedIcon> icons_;
};

} // namespace quendra::forms::qt
