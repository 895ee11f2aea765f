#pragma once

#include <QPlainTextEdit>

namespace quendra::forms::qt {

/// The text of a message box that would not fit on the screen: a field no larger than there is room for, in
/// which the text is scrolled by wheel and keys. Nothing in it can be edited.
class BoxText : public QPlainTextEdit {
 public:
  BoxText(const QString& text, QSize room, Qt::LayoutDirection direction, QWidget* parent);
};

} // namespace quendra::forms::qt
