#include "forms/qt/drawing/ImageDecoder.h"

#include <QBuffer>
#include <QImageReader>

namespace quendra::forms::qt {

namespace {

constexpr std::size_t kMostBytes = 8 * 1024 * 1024;
constexpr int kLargestSide = 2048;

bool IsKnownFormat(const QByteArray& format) {
  return format == "png" || format == "svg" || format == "svgz" || format == "xpm";
}

bool IsSane(QSize size) {
  return size.width() > 0 && size.height() > 0 && size.width() <= kLargestSide &&
         size.height() <= kLargestSide;
}

} // namespace

QImage DecodeIcon(const std::vector<std::uint8_t>& bytes, QSize bounds) {
  if (bytes.empty() || bytes.size() > kMostBytes || !IsSane(bounds)) return {};
  QByteArray data = QByteArray::fromRawData(reinterpret_cast<const char*>(bytes.data()),
                                            static_cast<qsizetype>(bytes.size()));
  QBuffer buffer(&data);
  buffer.open(QIODevice::ReadOnly);
  QImageReader reader(&buffer);
  const QByteArray format = reader.format();
  if (!IsKnownFormat(format)) return {};
  const QSize size = reader.size();
  // A drawing has no pixels of its own: it is drawn at the wanted size, whatever size it names.
  const bool isDrawing = format.startsWith("svg");
  if (isDrawing ? size.isEmpty() : !IsSane(size)) return {};
  const QSize fitted = size.scaled(bounds, Qt::KeepAspectRatio).expandedTo({1, 1});
  if (isDrawing) reader.setScaledSize(fitted);
  const QImage image = reader.read();
  if (image.isNull() || image.size() == fitted) return image;
  return image.scaled(fitted, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
}

} // namespace quendra::forms::qt
