#include "forms/win32/drawing/PictureStore.h"

#include "forms/view/Palette.h"
#include "forms/view/paint/Raster.h"
#include "forms/view/paint/Stretch.h"
#include "forms/view/png/PngReader.h"
#include "forms/win32/drawing/Resources.h"

#include <cstdio>

namespace quendra::forms::win32 {

namespace {

const Bitmap kNoBitmap;

Bitmap Placeholder(int density) {
  const int side = 32 * density;
  const Area all{{}, {side, side}};
  Bitmap bitmap{side, side, std::vector<std::uint32_t>(static_cast<std::size_t>(side * side))};
  Raster raster(bitmap);
  raster.Fill(all, Palette::PlaceholderBorder);
  raster.Fill(all.GrownBy(-density), Palette::Placeholder);
  return bitmap;
}

bool Has(const Bitmap& bitmap, Extent extent) { return Extent{bitmap.width, bitmap.height} == extent; }

} // namespace

const Bitmap& PictureStore::BitmapOf(const Picture& picture) {
  if (const Bitmap* pixels = picture.pixels()) return IsWhole(*pixels) ? *pixels : kNoBitmap;
  return picture.IsNone() ? kNoBitmap : ArtworkOf(picture.ArtworkName()).bitmap;
}

const Bitmap& PictureStore::BitmapOf(const Picture& picture, Extent extent) {
  const Bitmap& bitmap = BitmapOf(picture);
  if (bitmap.argb.empty() || Has(bitmap, extent)) return bitmap;
  const bool isArtwork = !picture.ArtworkName().empty();
  Bitmap& stretched = isArtwork ? ArtworkOf(picture.ArtworkName()).stretched : stretched_;
  if (!isArtwork || !Has(stretched, extent)) stretched = Stretched(bitmap, extent);
  return stretched;
}

Extent PictureStore::LaidOut(const Picture& picture, const Bitmap& bitmap, bool dense) {
  const int pixels = dense && !picture.ArtworkName().empty() ? 2 : 1;
  return {bitmap.width / pixels, bitmap.height / pixels};
}

PictureStore::Artwork& PictureStore::ArtworkOf(const std::string& name) {
  const auto found = artwork_.find(name);
  if (found != artwork_.end()) return found->second;
  return artwork_.emplace(name, Artwork{LoadArtwork(name), {}}).first->second;
}

Bitmap PictureStore::LoadArtwork(const std::string& name) const {
  if (auto bitmap = ReadPng(ResourceOf(dense_ ? name + "@2x" : name))) return std::move(*bitmap);
  std::fprintf(stderr, "quendra: artwork \"%s\" is missing\n", name.c_str());
  return Placeholder(dense_ ? 2 : 1);
}

} // namespace quendra::forms::win32
