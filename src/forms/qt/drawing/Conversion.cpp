#include "forms/qt/drawing/Conversion.h"

#include <algorithm>

namespace quendra::forms::qt {

namespace {

constexpr char16_t kReplacement = u'\uFFFD';
constexpr char16_t kEllipsis = u'\u2026';

bool ChangesDirectionOrHides(char16_t unit) {
  return unit == u'\u00AD' || unit == u'\u061C' || unit == u'\uFEFF' ||
         (unit >= u'\u200B' && unit <= u'\u200F') || (unit >= u'\u2028' && unit <= u'\u202E') ||
         (unit >= u'\u2060' && unit <= u'\u206F');
}

char16_t VisibleUnit(char16_t unit) {
  if (unit < 0x20) return static_cast<char16_t>(0x2400 + unit);
  if (unit == 0x7F) return u'\u2421';
  if (unit >= 0x80 && unit < 0xA0) return kReplacement;
  return ChangesDirectionOrHides(unit) ? kReplacement : unit;
}

} // namespace

QFont ToQFont(const Font& font, double zoom) {
  QFont result;
  result.setPointSizeF(std::max(1.0, font.size * zoom));
  result.setBold(font.bold);
  result.setUnderline(font.underline);
  return result;
}

QString VisibleText(TextView text, LineBreaks lineBreaks, qsizetype limit) {
  const bool cut = static_cast<qsizetype>(text.size()) > limit;
  if (cut) text = text.substr(0, static_cast<std::size_t>(limit));
  QString visible;
  visible.reserve(static_cast<qsizetype>(text.size()) + 1);
  for (std::size_t i = 0; i < text.size(); ++i) {
    const char16_t unit = text[i];
    const bool pair =
        QChar::isHighSurrogate(unit) && i + 1 < text.size() && QChar::isLowSurrogate(text[i + 1]);
    if (pair) {
      visible.append(QChar(unit)).append(QChar(text[++i]));
    } else if (QChar::isSurrogate(unit)) {
      visible.append(QChar(kReplacement));
    } else if (lineBreaks == LineBreaks::Keep && unit == u'\r') {
      continue;
    } else if (lineBreaks == LineBreaks::Keep && unit == u'\n') {
      visible.append(u'\n');
    } else {
      visible.append(QChar(VisibleUnit(unit)));
    }
  }
  if (cut) visible.append(QChar(kEllipsis));
  return visible;
}

Qt::LayoutDirection DirectionOf(QStringView text) {
  const auto isHebrew = [](QChar unit) { return unit.unicode() >= 0x0590 && unit.unicode() <= 0x05FF; };
  return std::any_of(text.begin(), text.end(), isHebrew) ? Qt::RightToLeft : Qt::LeftToRight;
}

QString Isolated(const QString& text) {
  if (text.isEmpty() || DirectionOf(text) == Qt::RightToLeft) return text;
  return QChar(0x2066) + text + QChar(0x2069);
}

Qt::Alignment SideOf(Alignment alignment, bool rightToLeft) {
  if (alignment == Alignment::Centre) return Qt::AlignHCenter;
  return (alignment == Alignment::Leading) == rightToLeft ? Qt::AlignRight | Qt::AlignAbsolute
                                                          : Qt::AlignLeft | Qt::AlignAbsolute;
}

} // namespace quendra::forms::qt
