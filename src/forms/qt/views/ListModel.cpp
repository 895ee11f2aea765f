#include "forms/qt/views/ListModel.h"

#include "forms/qt/drawing/Conversion.h"
#include "forms/view/Accessible.h"

#include <QGuiApplication>

namespace quendra::forms::qt {

namespace {

const Picture* PictureIn(const ImageList* images, int index) {
  return images && index >= 1 && index <= images->Count() ? &images->Item(index).picture : nullptr;
}

Text KeyOfIcon(const ImageList* images, int index) {
  return PictureIn(images, index) ? images->Item(index).Key : Text();
}

/// Long texts as plain ones: a tip would take a text with tags in it for a document.
QString TipOf(const QString& text) {
  return QStringLiteral("<p style='white-space:pre-wrap'>") + text.toHtmlEscaped();
}

} // namespace

int ListModel::columnCount(const QModelIndex& parent) const {
  return parent.isValid() || !list_ ? 0 : static_cast<int>(list_->Columns().size());
}

const ListRow* ListModel::RowAt(int row) const {
  return list_ && row >= 0 && row < list_->Count() ? &list_->Row(row + 1) : nullptr;
}

QVariant ListModel::data(const QModelIndex& index, int role) const {
  const ListRow* row = RowAt(index.row());
  if (!row || index.column() > row->CellCount()) return {};
  switch (role) {
  case Qt::DisplayRole:
  case Qt::AccessibleTextRole: return ShownText(row->CellText(index.column()));
  case Qt::ToolTipRole: {
    const QString text = ShownText(row->CellText(index.column()));
    return text.isEmpty() ? QVariant() : TipOf(text);
  }
  case Qt::AccessibleDescriptionRole:
    return ToQString(KeyOfIcon(list_->SmallIcons, row->CellIcon(index.column())));
  default: return {};
  }
}

QVariant ListModel::headerData(int section, Qt::Orientation orientation, int role) const {
  if (orientation != Qt::Horizontal || section < 0 || section >= columnCount()) return {};
  const ColumnHeader& column = list_->Columns()[static_cast<std::size_t>(section)];
  switch (role) {
  case Qt::DisplayRole: return ShownText(column.caption);
  case Qt::ToolTipRole: return column.caption.empty() ? QVariant(ToQString(column.description)) : QVariant();
  case Qt::AccessibleTextRole: return ToQString(AccessibleNameOf(column));
  default: return {};
  }
}

void ListModel::RowAdded(int index) {
  beginInsertRows({}, index - 1, index - 1);
  ++rows_;
  endInsertRows();
}

void ListModel::RowRemoved(int index) {
  beginRemoveRows({}, index - 1, index - 1);
  --rows_;
  endRemoveRows();
}

void ListModel::Reset() {
  beginResetModel();
  rows_ = list_ ? list_->Count() : 0;
  endResetModel();
}

void ListModel::TellCellChanged(int index, int cell) {
  const QModelIndex changed = this->index(index - 1, cell);
  emit dataChanged(changed, changed);
}

void ListModel::TellRowsMoved() {
  emit layoutAboutToBeChanged();
  emit layoutChanged();
}

void ListModel::Release() {
  list_ = nullptr;
  Reset();
}

QPixmap ListModel::SmallIcon(int icon, int side) const {
  const Picture* picture = PictureIn(list_->SmallIcons, icon);
  if (!picture) return {};
  const auto place = static_cast<std::size_t>(icon - 1);
  if (icons_.size() <= place) icons_.resize(place + 1);
  CachedIcon& cached = icons_[place];
  if (cached.pixmap.isNull() || cached.picture != *picture || cached.side != side) {
    const QPixmap whole = pictures_.PixmapOf(*picture);
    if (whole.isNull()) return {};
    // As fine as the screen, also where the picture itself doesn't say how fine it is.
    const qreal ratio = qGuiApp->devicePixelRatio();
    const int pixels = static_cast<int>(side * ratio);
    cached = {*picture, side, whole.scaled(pixels, pixels, Qt::KeepAspectRatio, Qt::SmoothTransformation)};
    cached.pixmap.setDevicePixelRatio(ratio);
  }
  return cached.pixmap;
}

QPixmap ListModel::HeaderIcon(int section) const {
  if (section < 0 || section >= columnCount()) return {};
  const Picture* picture =
      PictureIn(list_->HeaderIcons, list_->Columns()[static_cast<std::size_t>(section)].icon);
  return picture ? pictures_.PixmapOf(*picture) : QPixmap();
}

} // namespace quendra::forms::qt
