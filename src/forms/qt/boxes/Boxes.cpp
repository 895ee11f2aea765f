#include "forms/qt/boxes/Boxes.h"

#include "forms/qt/boxes/BoxIcons.h"
#include "forms/qt/boxes/BoxText.h"
#include "forms/qt/drawing/Conversion.h"
#include "forms/qt/views/FormView.h"
#include "forms/view/BoxContent.h"
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

/// Pixels: room for the title of a short box.
constexpr int kLeastWidth = 320;
constexpr int kIconSide = 40;
/// Under which name a button keeps the number of its answer.
constexpr char kNumber[] = "number";
/// What a box needs beside and above its text: margins, sign and button, and the frame that the window
/// manager puts round it.
constexpr QSize kAroundText(140, 180);
/// The toolkit breaks the lines of a box that would be wider than this, or than half the screen.
constexpr int kToolkitsWidth = 500;
constexpr int kMostTextWidth = 640;

QMessageBox::Icon KindOf(BoxSign sign) {
  switch (sign) {
  case BoxSign::Critical: return QMessageBox::Critical;
  case BoxSign::Question: return QMessageBox::Question;
  case BoxSign::Exclamation: return QMessageBox::Warning;
  case BoxSign::Information: return QMessageBox::Information;
  case BoxSign::None: break;
  }
  return QMessageBox::NoIcon;
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

void PutSign(QMessageBox& box, BoxSign sign) {
  // The kind is what assistive technology hears; the sign is what is seen.
  box.setIcon(KindOf(sign));
  auto* place = box.findChild<QLabel*>(QStringLiteral("qt_msgboxex_icon_label"));
  if (place && sign != BoxSign::None) place->setPixmap(BoxIcon(sign, kIconSide, box.devicePixelRatioF()));
}

/// Gives the button that has the focus first.
QPushButton* PutButtons(QMessageBox& box, const BoxContent& content) {
  QPushButton* first = nullptr;
  for (const BoxButton& wanted : content.buttons) {
    QPushButton* button = box.addButton(ToQString(wanted.caption), QMessageBox::AcceptRole);
    button->setProperty(kNumber, wanted.number);
    if (wanted.number == content.defaultButton) box.setDefaultButton(first = button);
    if (wanted.number == content.cancelButton) box.setEscapeButton(button);
  }
  return first;
}

} // namespace

int ShowBox(QWidget* owner, const Text& text, int flags, const Text& title) {
  const BoxContent content = BoxContentOf(text, flags, title);
  const FormView::Hold hold(dynamic_cast<FormView*>(owner));
  QMessageBox box(owner);
  box.setLayoutDirection(content.rightToLeft ? Qt::RightToLeft : Qt::LeftToRight);
  PutSign(box, content.sign);
  box.setTextFormat(Qt::PlainText);
  box.setWindowTitle(ToQString(content.title));
  const QScreen* screen = owner ? owner->screen() : QGuiApplication::primaryScreen();
  PutText(box, ToQString(content.text), screen->availableSize());
  QPushButton* first = PutButtons(box, content);
  LayOut(box);
  if (first) first->setFocus();
  box.exec();
  // None is pressed where the program ends while the box stands.
  const QAbstractButton* pressed = box.clickedButton();
  return pressed ? pressed->property(kNumber).toInt() : content.defaultButton;
}

} // namespace quendra::forms::qt
