#pragma once

#include "forms/qt/views/ListModel.h"
#include "forms/view/ListLook.h"

#include <QStyledItemDelegate>

namespace quendra::forms::qt {

/// Draws the cells. By hand, as every cell chooses its own reading direction and all are drawn anew each
/// second.
class ListDelegate : public QStyledItemDelegate {
 public:
  ListDelegate(const ListModel& model, const Scale& scale, Direction direction, QObject* parent)
      : QStyledItemDelegate(parent), model_(model), scale_(scale), direction_(direction) {}

  void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override;
  QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const override;

 private:
  ListLook Look() const { return {scale_, direction_}; }
  void DrawIcon(QPainter& painter, const Area& place, int number) const;

  const ListModel& model_;
  const Scale& scale_;
  Direction direction_;
};

} // namespace quendra::forms::qt
