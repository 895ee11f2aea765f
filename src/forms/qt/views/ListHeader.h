#pragma once

#include "forms/qt/views/ListModel.h"
#include "forms/view/ListLook.h"

#include <QHeaderView>

namespace quendra::forms::qt {

/// The header of a list: captions or icons, and an arrow on the column that the rows are sorted by.
class ListHeader : public QHeaderView {
 public:
  ListHeader(const ListModel& model, const Scale& scale, Direction direction, QWidget* parent);
  QSize sizeHint() const override;

 protected:
  void paintSection(QPainter* painter, const QRect& rect, int section) const override;

 private:
  ListLook Look() const { return {scale_, direction_}; }
  void DrawIcon(QPainter& painter, const Area& header, const QPixmap& icon) const;
  void DrawCaption(QPainter& painter, const Area& header, const ColumnHeader& column) const;
  void DrawArrow(QPainter& painter, const Area& header) const;

  const ListModel& model_;
  const Scale& scale_;
  Direction direction_;
};

} // namespace quendra::forms::qt
