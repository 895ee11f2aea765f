#include "forms/qt/drawing/FieldPainting.h"

#include "forms/qt/drawing/Conversion.h"

#include <QAction>
#include <QMenu>
#include <QPainter>

#include <algorithm>
#include <iterator>

namespace quendra::forms::qt {

FieldState StateOfField(const QWidget& field, bool readOnly) {
  return {field.isEnabled(), readOnly, field.hasFocus(),
          field.window()->testAttribute(Qt::WA_KeyboardFocusChange)};
}

void PaintField(QWidget& field, const FieldState& state) {
  QPainter painter(&field);
  painter.setRenderHint(QPainter::Antialiasing);
  const FieldFace face = FaceOf(state);
  painter.setPen(QPen(ToQColor(face.border), 1));
  painter.setBrush(ToQColor(face.fill));
  painter.drawRoundedRect(QRectF(field.rect()).adjusted(0.5, 0.5, -0.5, -0.5), face.corner, face.corner);
  painter.setBrush(Qt::NoBrush);
  for (const Ring& ring : RingsOf(state)) {
    painter.setPen(QPen(ToQColor(ring.colour), ring.width));
    painter.drawRoundedRect(QRectF(field.rect()).adjusted(ring.inset, ring.inset, -ring.inset, -ring.inset),
                            ring.corner, ring.corner);
  }
}

void BareField(QWidget& field) {
  QPalette bare = field.palette();
  bare.setColor(QPalette::Base, Qt::transparent);
  field.setPalette(bare);
}

QFont Monospaced(QFont font) {
  font.setFamilies({QStringLiteral("Noto Sans Mono"), QStringLiteral("DejaVu Sans Mono"),
                    QStringLiteral("Liberation Mono"), QStringLiteral("Monospace")});
  font.setStyleHint(QFont::Monospace);
  font.setFixedPitch(true);
  return font;
}

void CaptionEditMenu(QMenu& menu) {
  struct Entry {
    const char* name;
    const char16_t* caption;
  };
  static constexpr Entry kEntries[] = {{"edit-undo", u"ביטול"},      {"edit-redo", u"ביצוע מחדש"},
                                       {"edit-cut", u"גזירה"},       {"edit-copy", u"העתקה"},
                                       {"edit-paste", u"הדבקה"},     {"edit-delete", u"מחיקה"},
                                       {"select-all", u"בחירת הכול"}};
  for (QAction* action : menu.actions()) {
    const auto* entry = std::find_if(std::begin(kEntries), std::end(kEntries), [&](const Entry& known) {
      return action->objectName() == QLatin1String(known.name);
    });
    if (entry != std::end(kEntries))
      action->setText(QString::fromUtf16(entry->caption));
    else if (!action->isSeparator())
      action->setVisible(false); // nothing that users of this program type
  }
  menu.setLayoutDirection(Qt::RightToLeft);
}

} // namespace quendra::forms::qt
