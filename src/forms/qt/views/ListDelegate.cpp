#include "forms/qt/views/ListDelegate.h"

#include "forms/qt/drawing/Conversion.h"
#include "forms/view/Palette.h"

#include <QPainter>

#include <algorithm>

namespace quendra::forms::qt {

namespace {

constexpr int kIconSide = 20;
constexpr int kPadding = 8;
/// What no column can show: longer texts are cut before they are measured.
constexpr std::size_t kMostShown = 300;

} // namespace

int ListDelegate::RowHeight(const QFontMetrics& metrics, const Scale& scale) {
  return std::max(scale.Pixels(kIconSide + 6), metrics.height() + scale.Pixels(10));
}

QSize ListDelegate::sizeHint(const QStyleOptionViewItem& option, const QModelIndex& /*index*/) const {
  return {40, RowHeight(option.fontMetrics, scale_)};
}

void ListDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                         const QModelIndex& index) const {
  const ListRow* row = model_.RowAt(index.row());
  if (option.state & QStyle::State_Selected) painter->fillRect(option.rect, ToQColor(Palette::Selection));
  const int cell = index.column();
  if (!row || cell > row->CellCount()) return;
  const int padding = scale_.Pixels(kPadding);
  QRect room = option.rect.adjusted(padding, 0, -padding, 0);
  if (cell == 0) room = DrawIcon(*painter, room, *row);
  if (row->CellText(cell).empty() || room.width() <= 0) return;

  const Text visible = VisibleText(row->CellText(cell), LineBreaks::Show, kMostShown);
  const QString text = ToQString(visible);
  QFont font = option.font;
  font.setBold(row->CellBold(cell));
  painter->setFont(font);
  const Colour colour = row->CellColour(cell);
  painter->setPen(colour == kBlack ? ToQColor(Palette::Ink) : ToQColor(colour));
  painter->setLayoutDirection(ToQt(DirectionOf(visible)));
  const Alignment alignment = model_.List()->Columns()[static_cast<std::size_t>(cell)].alignment;
  const auto flags =
      static_cast<int>(ToQt(SideOf(alignment, direction_)) | Qt::AlignVCenter) | Qt::TextSingleLine;
  painter->drawText(room, flags, painter->fontMetrics().elidedText(text, Qt::ElideRight, room.width()));
}

QRect ListDelegate::DrawIcon(QPainter& painter, const QRect& room, const ListRow& row) const {
  const int side = scale_.Pixels(kIconSide);
  const QPixmap icon = model_.SmallIcon(row, side);
  const int left = direction_ == Direction::RightToLeft ? room.right() + 1 - side : room.left();
  const QRect place(left, room.center().y() - side / 2 + 1, side, side);
  if (!icon.isNull()) {
    const QSizeF size = icon.deviceIndependentSize();
    painter.drawPixmap(
        QPointF(place.left() + (side - size.width()) / 2, place.top() + (side - size.height()) / 2), icon);
  }
  const int taken = side + scale_.Pixels(kPadding);
  return direction_ == Direction::RightToLeft ? room.adjusted(0, 0, -taken, 0)
                                              : room.adjusted(taken, 0, 0, 0);
}

} // namespace quendra::forms::qt
