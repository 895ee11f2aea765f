#include "forms/qt/drawing/Dress.h"

#include "forms/qt/drawing/Conversion.h"
#include "forms/qt/drawing/Fonts.h"
#include "forms/view/ListLook.h"
#include "forms/view/Palette.h"

#include <QApplication>
#include <QFont>
#include <QIcon>
#include <QPalette>

namespace quendra::forms::qt {

namespace {

QPalette HousePalette() {
  QPalette house;
  house.setColor(QPalette::Window, ToQColor(Palette::QuietPage));
  house.setColor(QPalette::Base, ToQColor(RowGround(0, false)));
  house.setColor(QPalette::AlternateBase, ToQColor(RowGround(1, false)));
  house.setColor(QPalette::Button, ToQColor(Palette::Button));
  for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText, QPalette::ToolTipText})
    house.setColor(role, ToQColor(Palette::Ink));
  for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
    house.setColor(QPalette::Disabled, role, ToQColor(Palette::QuietInk));
  house.setColor(QPalette::ToolTipBase, ToQColor(Palette::Page));
  house.setColor(QPalette::Highlight, ToQColor(RowGround(0, true)));
  house.setColor(QPalette::HighlightedText, ToQColor(Palette::Ink));
  house.setColor(QPalette::Link, ToQColor(Palette::Link));
  return house;
}

} // namespace

void DressApplication(QApplication& application) {
  QApplication::setStyle(QStringLiteral("fusion"));
  QApplication::setPalette(HousePalette());
  AddMissingFonts();
  QFont font;
  font.setFamilies({QStringLiteral("Noto Sans"), QStringLiteral("Noto Sans Hebrew"),
                    QStringLiteral("DejaVu Sans"), QStringLiteral("Sans Serif")});
  font.setPointSize(9);
  QApplication::setFont(font);
  QApplication::setLayoutDirection(Qt::RightToLeft);
  application.setQuitOnLastWindowClosed(false);
  application.setApplicationName(QStringLiteral("quendra"));
  QGuiApplication::setDesktopFileName(QStringLiteral("quendra"));
}

} // namespace quendra::forms::qt
