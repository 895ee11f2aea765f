#include "forms/qt/drawing/Palette.h"

#include "forms/qt/drawing/Fonts.h"

#include <QApplication>
#include <QFont>
#include <QIcon>
#include <QPalette>

namespace quendra::forms::qt {

namespace {

QPalette HousePalette() {
  QPalette house;
  house.setColor(QPalette::Window, palette::kQuietPage);
  house.setColor(QPalette::Base, palette::kPage);
  house.setColor(QPalette::AlternateBase, palette::kQuietPage);
  house.setColor(QPalette::Button, QColor(0xFB, 0xFC, 0xFD));
  for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText, QPalette::ToolTipText})
    house.setColor(role, palette::kInk);
  for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
    house.setColor(QPalette::Disabled, role, palette::kQuietInk);
  house.setColor(QPalette::ToolTipBase, palette::kPage);
  house.setColor(QPalette::Highlight, palette::kSelection);
  house.setColor(QPalette::HighlightedText, palette::kInk);
  house.setColor(QPalette::Link, palette::kLink);
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
