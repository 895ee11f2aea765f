#include "forms/qt/drawing/PictureStore.h"

#include "forms/qt/drawing/Conversion.h"
#include "forms/qt/drawing/Resources.h"
#include "forms/view/Palette.h"

#include <QFile>
#include <QGuiApplication>
#include <QPainter>

#include <cstdio>
#include <cstring>

namespace quendra::forms::qt {

namespace {

QPixmap Placeholder() {
  QPixmap pixmap(32, 32);
  pixmap.fill(ToQColor(Palette::Placeholder));
  QPainter painter(&pixmap);
  painter.setPen(ToQColor(Palette::PlaceholderBorder));
  painter.drawRect(0, 0, 31, 31);
  return pixmap;
}

} // namespace

QPixmap PictureStore::PixmapOf(const Picture& picture) {
  if (const Picture::Pixels* pixels = picture.pixels()) return QPixmap::fromImage(ImageOf(*pixels));
  if (picture.IsNone()) return {};
  const auto found = artwork_.find(picture.ArtworkName());
  if (found != artwork_.end()) return found->second;
  return artwork_.emplace(picture.ArtworkName(), LoadArtwork(picture.ArtworkName())).first->second;
}

QPixmap PictureStore::LoadArtwork(const std::string& name) {
  RegisterResources();
  const QString base = QStringLiteral(":/artwork/") + QString::fromStdString(name);
  const bool dense = qGuiApp->devicePixelRatio() > 1;
  QPixmap pixmap(base + (dense ? QStringLiteral("@2x.png") : QStringLiteral(".png")));
  if (pixmap.isNull()) {
    std::fprintf(stderr, "quendra: artwork \"%s\" is missing\n", name.c_str());
    return Placeholder();
  }
  if (dense) pixmap.setDevicePixelRatio(2);
  return pixmap;
}

QImage PictureStore::ImageOf(const Picture::Pixels& pixels) {
  const std::size_t width = static_cast<std::size_t>(std::max(0, pixels.width));
  const std::size_t height = static_cast<std::size_t>(std::max(0, pixels.height));
  if (width == 0 || height == 0 || pixels.argb.size() / width < height) return {};
  QImage image(pixels.width, pixels.height, QImage::Format_ARGB32);
  for (std::size_t y = 0; y < height; ++y)
    std::memcpy(image.scanLine(static_cast<int>(y)), pixels.argb.data() + y * width, width * 4);
  return image;
}

Picture PictureStore::PictureOf(const QImage& image) {
  const QImage plain = image.convertToFormat(QImage::Format_ARGB32);
  Picture::Pixels pixels{plain.width(), plain.height(), {}};
  const std::size_t width = static_cast<std::size_t>(plain.width());
  pixels.argb.resize(width * static_cast<std::size_t>(plain.height()));
  for (int y = 0; y < plain.height(); ++y)
    std::memcpy(pixels.argb.data() + static_cast<std::size_t>(y) * width, plain.constScanLine(y), width * 4);
  return Picture::Of(std::move(pixels));
}

} // namespace quendra::forms::qt
