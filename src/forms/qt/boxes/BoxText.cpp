#include "forms/qt/boxes/BoxText.h"

#include <algorithm>

namespace quendra::forms::qt {

namespace {

/// What the field needs beside and above its lines.
constexpr QSize kMargins(28, 14);

} // namespace

BoxText::BoxText(const QString& text, QSize room, Qt::LayoutDirection direction, QWidget* parent)
    : QPlainTextEdit(parent) {
  setReadOnly(true);
  setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
  setTabChangesFocus(true);
  setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
  // A word may be longer than a line, and nobody scrolls sideways to read.
  QTextOption option = document()->defaultTextOption();
  option.setWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
  option.setTextDirection(direction);
  const bool rightToLeft = direction == Qt::RightToLeft;
  option.setAlignment(Qt::AlignAbsolute | (rightToLeft ? Qt::AlignRight : Qt::AlignLeft));
  document()->setDefaultTextOption(option);
  setPlainText(text);
  const QRect lines(0, 0, std::max(1, room.width() - kMargins.width()), 0);
  const int height = fontMetrics().boundingRect(lines, Qt::TextWrapAnywhere, text).height();
  setFixedSize(room.width(), std::min(room.height(), height + kMargins.height()));
}

} // namespace quendra::forms::qt
