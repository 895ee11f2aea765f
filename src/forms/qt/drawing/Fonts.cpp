#include "forms/qt/drawing/Fonts.h"

#include "forms/qt/drawing/Resources.h"

#include <QFontDatabase>
#include <QStringList>

#include <algorithm>

namespace quendra::forms::qt {

namespace {

void AddFamily(const QString& name) {
  RegisterResources();
  for (const char* weight : {"Regular", "Bold"})
    QFontDatabase::addApplicationFont(QStringLiteral(":/fonts/%1-%2.ttf").arg(name, QLatin1String(weight)));
}

/// Whether a font of the system is for the script. The toolkit lists its names for the usual kinds of font as
/// if they were families, also where there is no such font.
bool HasFontFor(QFontDatabase::WritingSystem script) {
  const QStringList families = QFontDatabase::families(script);
  return std::any_of(families.begin(), families.end(), [](const QString& family) {
    return family != QLatin1String("Sans Serif") && family != QLatin1String("Serif") &&
           family != QLatin1String("Monospace");
  });
}

} // namespace

void AddMissingFonts() {
  // Asked before either is added: it may cover a part of the other script.
  const bool hasHebrew = HasFontFor(QFontDatabase::Hebrew);
  const bool hasLatin = HasFontFor(QFontDatabase::Latin);
  if (!hasHebrew) AddFamily(QStringLiteral("NotoSansHebrew"));
  if (!hasLatin) AddFamily(QStringLiteral("NotoSans"));
}

} // namespace quendra::forms::qt
