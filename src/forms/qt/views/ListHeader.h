#pragma once

#include "forms/qt/Scale.h"
#include "forms/qt/views/ListModel.h"

#include <QHeaderView>

namespace quendra::forms::qt {

/// The header of a list: captions or icons, and an arrow on the column that the rows are sorted by.
class ListHeader : public QHeaderView {
 public:
  ListHeader(const ListModel& model, const Scale& scale, bool rightToLeft, QWidget* parent);
  QSize sizeHint() const override;

 protected:
  void paintSection(QPainter* painter, const QRect& rect, int section) const override;

 private:
  void DrawArrow(QPainter& painter, const QRect& rect) const;

  const ListModel& model_;
  const Scale& scale_;
  bool rightToLeft_;
};

} // namespace quendra::forms::qt
