#pragma once

#include "forms/view/fields/FieldLook.h"

#include <QWidget>

class QMenu;

namespace quendra::forms::qt {

/// How a field stands now.
FieldState StateOfField(const QWidget& field, bool readOnly);
/// Paints the ground, the border and the ring of a field under its text.
void PaintField(QWidget& field, const FieldState& state);
/// Takes the toolkit's own ground from a widget that shows a field.
void BareField(QWidget& field);
/// Letters that are all as wide, in the size of the font.
QFont Monospaced(QFont font);
/// Gives the toolkit's menu of a field its captions in the language of the program.
void CaptionEditMenu(QMenu& menu);

} // namespace quendra::forms::qt
