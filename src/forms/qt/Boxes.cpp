#include "forms/qt/Boxes.h"

#include "forms/qt/Conversion.h"

#include <QMessageBox>
#include <QPushButton>

namespace quendra::forms::qt {

namespace {

constexpr int kOkPressed = 1;
constexpr qsizetype kMostText = 4096;

QMessageBox::Icon IconOf(int flags) {
  switch (flags & 0x70) {
  case kCritical: return QMessageBox::Critical;
  case kExclamation: return QMessageBox::Warning;
  case kInformation: return QMessageBox::Information;
  default: return QMessageBox::NoIcon;
  }
}

} // namespace

int ShowBox(QWidget* owner, const Text& text, int flags, const Text& title) {
  const bool rightToLeft = (flags & kRightToLeft) != 0;
  QMessageBox box(owner);
  box.setLayoutDirection(rightToLeft ? Qt::RightToLeft : Qt::LeftToRight);
  box.setIcon(IconOf(flags));
  box.setTextFormat(Qt::PlainText);
  box.setWindowTitle(VisibleText(title));
  box.setText(VisibleText(text, LineBreaks::Keep, kMostText));
  QPushButton* ok =
      box.addButton(rightToLeft ? QStringLiteral("אישור") : QStringLiteral("OK"), QMessageBox::AcceptRole);
  box.setDefaultButton(ok);
  box.setEscapeButton(ok);
  box.exec();
  return kOkPressed;
}

} // namespace quendra::forms::qt
