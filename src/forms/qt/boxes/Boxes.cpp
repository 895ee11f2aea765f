#include "forms/qt/boxes/Boxes.h"

#include "forms/qt/boxes/BoxIcons.h"
#include "forms/qt/boxes/BoxText.h"
#include "forms/qt/drawing/Conversion.h"
#include "forms/view/Palette.h"

#include <QGridLayout>
#include <QGuiApplication>
#include <QLabel>
#include <QMessageBox>
#include <QPushButton>
#include <QScreen>

#include <algorithm>

namespace quendra::forms::qt {

namespace {

constexpr int kOkPressed = 1;
constexpr std::size_t kMostText = 4096;
/// Pixels: room for the title of a short box.
constexpr int kLeastWidth = 320;
constexpr int kIconSide = 40;
/// What a box needs beside and above its text: margins, sign and button, and the frame that the window
/// manager puts round it.
constexpr QSize kAroundText(140, 180);
/// The toolkit breaks the lines of a box that would be wider than this, or than half the screen.
constexpr int kToolkitsWidth = 500;
constexpr int kMostTextWidth = 640;

QMessageBox::Icon KindOf(int flags) {
  switch (flags & 0x70) {
  case kCritical: return QMessageBox::Critical;
  case kExclamation: return QMessageBox::Warning;
  case kInformation: return QMessageBox::Information;
  default: return QMessageBox::NoIcon;
  }
}

/// Each line decides by itself how it reads; a mark in front has lines of numbers read with the others.
QString MarkedRightToLeft(QString text) {
  const QChar mark(0x200F);
  return mark + text.replace(u'\n', QStringLiteral("\n") + mark);
}

void LayOut(QMessageBox& box) {
  QPalette page = box.palette();
  page.setColor(QPalette::Window, ToQColor(Palette::Page));
  box.setPalette(page);
  if (auto* grid = qobject_cast<QGridLayout*>(box.layout())) {
    grid->setContentsMargins(20, 18, 20, 16);
    grid->setHorizontalSpacing(16);
    grid->setVerticalSpacing(14);
    grid->addItem(new QSpacerItem(kLeastWidth, 0), grid->rowCount(), 0, 1, grid->columnCount());
  }
}

/// Whether the toolkit's own label shows the text whole.
bool FitsIntoLabel(const QString& text, QSize screen, const QFontMetrics& metrics) {
  const QSize room(std::min(kToolkitsWidth, screen.width() / 2) - kAroundText.width(),
                   screen.height() - kAroundText.height());
  const QRect taken = metrics.boundingRect(QRect(QPoint(), room), Qt::TextWordWrap, text);
  return taken.width() <= room.width() && taken.height() <= room.height();
}

/// A text that is too large gets a field to scroll it in: the button must stay on the screen.
void PutText(QMessageBox& box, const QString& text, QSize screen) {
  box.setText(text);
  auto* label = box.findChild<QLabel*>(QStringLiteral("qt_msgbox_label"));
  if (!label || FitsIntoLabel(text, screen, label->fontMetrics())) return;
  const QSize room = (screen - kAroundText).boundedTo({kMostTextWidth, screen.height()}).expandedTo({1, 1});
  auto* field = new BoxText(text, room, box.layoutDirection(), &box);
  field->setAccessibleName(box.windowTitle());
  delete box.layout()->replaceWidget(label, field);
  label->hide();
}

} // namespace

int ShowBox(QWidget* owner, const Text& text, int flags, const Text& title) {
  const bool rightToLeft = (flags & kRightToLeft) != 0;
  QMessageBox box(owner);
  box.setLayoutDirection(rightToLeft ? Qt::RightToLeft : Qt::LeftToRight);
  // The kind is what assistive technology hears; the sign is what is seen.
  box.setIcon(KindOf(flags));
  auto* sign = box.findChild<QLabel*>(QStringLiteral("qt_msgboxex_icon_label"));
  if (sign && box.icon() != QMessageBox::NoIcon)
    sign->setPixmap(BoxIcon(flags, kIconSide, box.devicePixelRatioF()));
  box.setTextFormat(Qt::PlainText);
  box.setWindowTitle(ShownText(title));
  const QString shown = ToQString(VisibleText(text, LineBreaks::Keep, kMostText));
  const QScreen* screen = owner ? owner->screen() : QGuiApplication::primaryScreen();
  PutText(box, rightToLeft ? MarkedRightToLeft(shown) : shown, screen->availableSize());
  QPushButton* ok =
      box.addButton(rightToLeft ? QStringLiteral("אישור") : QStringLiteral("OK"), QMessageBox::AcceptRole);
  box.setDefaultButton(ok);
  box.setEscapeButton(ok);
  LayOut(box);
  ok->setFocus();
  box.exec();
  return kOkPressed;
}

} // namespace quendra::forms::qt
