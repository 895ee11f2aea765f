#include "forms/headless/HeadlessDesktop.h"
#include "forms/view/ControlPlacement.h"

#include <cstdio>

namespace quendra::forms::headless {

namespace {

std::string Place(int x, int y) { return std::to_string(x) + "," + std::to_string(y); }

/// RRGGBB.
std::string ColourText(Colour colour) {
  char text[16];
  std::snprintf(text, sizeof text, "%02X%02X%02X", colour & 0xFFU, colour >> 8 & 0xFFU, colour >> 16 & 0xFFU);
  return text;
}

std::uint64_t HashOf(std::string_view bytes) {
  std::uint64_t hash = 0xCBF29CE484222325ULL;
  for (const char byte : bytes) hash = (hash ^ static_cast<unsigned char>(byte)) * 0x100000001B3ULL;
  return hash;
}

} // namespace

int HeadlessDesktop::WidthInPixels(const PictureBox& /*box*/, TextView text) const {
  return CharacterWidth * static_cast<int>(text.size());
}

int HeadlessDesktop::LineHeightInPixels(const PictureBox& /*box*/) const { return LineHeight; }

void HeadlessDesktop::Draw(PictureBox& box, const std::string& drawing) {
  drawings_[&box].push_back(drawing);
  Record(ToUtf8(box.Name()) + " " + drawing);
}

void HeadlessDesktop::DropDrawings(PictureBox& box) {
  drawings_[&box].clear();
  Record("Cls " + ToUtf8(box.Name()));
}

void HeadlessDesktop::FillBox(PictureBox& box, int x1, int y1, int x2, int y2, Colour colour) {
  Draw(box, "Box " + Place(x1, y1) + " " + Place(x2, y2) + " " + ColourText(colour));
}

void HeadlessDesktop::PrintLine(PictureBox& box, TextView text, const Area& /*place*/) {
  Draw(box, "Print " + Place(box.CurrentX, box.CurrentY) + " " + ColourText(box.ForeColour()) + " " +
                ToUtf8(text));
}

void HeadlessDesktop::BitBlt(PictureBox& target, int x, int y, int width, int height,
                             const PictureBox& source, int sourceX, int sourceY) {
  const std::string copy = "BitBlt " + Place(x, y) + " " + std::to_string(width) + "x" +
                           std::to_string(height) + " from " + ToUtf8(source.Name()) + " " +
                           Place(sourceX, sourceY);
  Record(ToUtf8(target.Name()) + " " + copy);
  const std::vector<std::string> copied = DrawingOf(source);
  auto& drawing = drawings_[&target];
  const Extent room = ExtentOf(target.Position(), scale_);
  const bool whole = x <= 0 && y <= 0 && x + width >= room.width && y + height >= room.height;
  if (whole)
    drawing.clear();
  else
    drawing.push_back(copy);
  drawing.insert(drawing.end(), copied.begin(), copied.end());
}

void HeadlessDesktop::Refresh(PictureBox& box) { Record("Refresh " + ToUtf8(box.Name())); }

bool HeadlessDesktop::DrawIconEx(PictureBox& box, int x, int y, const std::vector<std::uint8_t>& image,
                                 int width, int height) {
  if (image.empty()) return false;
  const std::uint64_t hash = HashOf({reinterpret_cast<const char*>(image.data()), image.size()});
  Draw(box, "Icon " + Place(x, y) + " " + std::to_string(width) + "x" + std::to_string(height) + " of " +
                std::to_string(image.size()) + " bytes " + ToUtf8(HexText(static_cast<std::uint32_t>(hash))));
  return true;
}

Picture HeadlessDesktop::ImageOf(const PictureBox& box) const {
  std::string contents = box.Contents().ArtworkName();
  for (const auto& drawing : DrawingOf(box)) contents += "\n" + drawing;
  const auto [place, isNew] = images_.try_emplace(contents);
  const std::uint64_t hash = HashOf(contents);
  if (isNew)
    place->second =
        Picture::Of({2, 1, {static_cast<std::uint32_t>(hash), static_cast<std::uint32_t>(hash >> 32)}});
  return place->second;
}

const std::vector<std::string>& HeadlessDesktop::DrawingOf(const PictureBox& box) const {
  static const std::vector<std::string> kNothing;
  const auto found = drawings_.find(&box);
  return found == drawings_.end() ? kNothing : found->second;
}

} // namespace quendra::forms::headless
