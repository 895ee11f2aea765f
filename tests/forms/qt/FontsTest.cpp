#include "forms/qt/QtFixture.h"

#include <QFile>
#include <QFontDatabase>
#include <QGlyphRun>
#include <QProcess>
#include <QTemporaryDir>
#include <QTextLayout>

namespace quendra::forms::qt {

namespace {

/// Every sign of Hebrew and Latin text that the program's forms and the data in them are made of.
QString AllSigns() {
  QString signs;
  for (char16_t sign = u' '; sign <= u'~'; ++sign) signs += QChar(sign);
  for (char16_t sign = u'א'; sign <= u'ת'; ++sign) signs += QChar(sign);
  return signs + QStringLiteral("©®…₪");
}

/// The signs that the font, with all that stands in for it, shows as the box of a missing one.
QString MissingSigns(const QFont& font) {
  QString missing;
  for (const QChar sign : AllSigns()) {
    QTextLayout layout(QString(sign), font);
    layout.beginLayout();
    layout.createLine();
    layout.endLayout();
    const auto runs = layout.glyphRuns();
    if (runs.isEmpty() || runs[0].glyphIndexes().value(0) == 0) missing += sign;
  }
  return missing;
}

constexpr char kFontsVariable[] = "FONTCONFIG_FILE";

/// Writes the settings of a system that has these fonts of the program's own sources and no others.
QString SettingsOfSystemWith(const QTemporaryDir& folder, const QStringList& fonts) {
  for (const QString& font : fonts)
    QFile::copy(QStringLiteral(QUENDRA_SOURCE_DIR "/artwork/fonts/") + font, folder.filePath(font));
  QFile settings(folder.filePath(QStringLiteral("fonts.conf")));
  if (settings.open(QIODevice::WriteOnly))
    settings.write("<?xml version=\"1.0\"?><!DOCTYPE fontconfig SYSTEM \"fonts.dtd\"><fontconfig><dir>" +
                   folder.path().toUtf8() + "</dir></fontconfig>");
  return settings.fileName();
}

/// Runs the test that asks in a process of its own, on a system with these fonts alone, and fails it here
/// when it fails there. True there, where the test is to go on.
bool RunsOnSystemWith(const QStringList& fonts) {
  if (qEnvironmentVariableIsSet(kFontsVariable)) return true;
  const QTemporaryDir folder;
  auto environment = QProcessEnvironment::systemEnvironment();
  environment.insert(QLatin1String(kFontsVariable), SettingsOfSystemWith(folder, fonts));
  const auto& test = *testing::UnitTest::GetInstance()->current_test_info();
  QProcess process;
  process.setProcessEnvironment(environment);
  process.setProcessChannelMode(QProcess::MergedChannels);
  process.start(QStringLiteral("/proc/self/exe"),
                {QStringLiteral("--gtest_filter=%1.%2").arg(test.test_suite_name(), test.name())});
  const bool finished = process.waitForFinished(60'000);
  const QByteArray said = process.readAll();
  EXPECT_TRUE(finished && process.exitStatus() == QProcess::NormalExit && process.exitCode() == 0 &&
              said.contains("[  PASSED  ] 1 test."))
      << said.constData();
  return false;
}

void ExpectEverySign() {
  for (const bool bold : {false, true}) {
    QFont font = QApplication::font();
    font.setBold(bold);
    EXPECT_EQ(MissingSigns(font).toStdString(), "") << bold;
  }
}

QStringList Styles(const char* family) {
  auto styles = QFontDatabase::styles(QLatin1String(family));
  styles.sort();
  return styles;
}

const QStringList kRegular{QStringLiteral("Regular")};
const QStringList kBoth{QStringLiteral("Bold"), QStringLiteral("Regular")};

} // namespace

class Fonts : public QtFixture {};

TEST_F(Fonts, Every_sign_is_shown_on_this_system) { ExpectEverySign(); }

TEST_F(Fonts, Every_sign_is_shown_on_a_system_without_any_font) {
  if (!RunsOnSystemWith({})) return;
  ExpectEverySign();
  EXPECT_EQ(Styles("Noto Sans"), kBoth);
  EXPECT_EQ(Styles("Noto Sans Hebrew"), kBoth);
}

TEST_F(Fonts, Every_sign_is_shown_on_a_system_without_a_Hebrew_font) {
  if (!RunsOnSystemWith({QStringLiteral("NotoSans-Regular.ttf")})) return;
  ExpectEverySign();
  EXPECT_EQ(Styles("Noto Sans"), kRegular);
  EXPECT_EQ(Styles("Noto Sans Hebrew"), kBoth);
}

TEST_F(Fonts, A_system_with_fonts_for_both_scripts_keeps_its_own) {
  if (!RunsOnSystemWith(
          {QStringLiteral("NotoSans-Regular.ttf"), QStringLiteral("NotoSansHebrew-Regular.ttf")}))
    return;
  ExpectEverySign();
  EXPECT_EQ(Styles("Noto Sans"), kRegular);
  EXPECT_EQ(Styles("Noto Sans Hebrew"), kRegular);
}

} // namespace quendra::forms::qt
