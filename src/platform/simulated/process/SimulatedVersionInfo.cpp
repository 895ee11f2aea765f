#include "platform/simulated/process/SimulatedVersionInfo.h"

#include "platform/simulated/SimulatedCore.h"

#include <cstdio>

namespace quendra::platform::simulated {

namespace {

/// A block of this machine is a mark, so that foreign bytes aren't taken for one, and the block's number.
constexpr std::uint32_t kBlockMark = 0x56534E51;
constexpr std::uint32_t kBlockSize = 64;

std::string TableOf(std::vector<std::uint8_t> translation) {
  translation.resize(4, 0);
  char text[16];
  std::snprintf(text, sizeof text, "%02X%02X%02X%02X", translation[1], translation[0], translation[3],
                translation[2]);
  return text;
}

std::vector<std::uint8_t> WithNul(const std::string& text) {
  std::vector<std::uint8_t> bytes(text.begin(), text.end());
  bytes.push_back(0);
  return bytes;
}

} // namespace

void SimulatedVersionInfo::Add(const std::string& path, std::vector<std::uint8_t> translation,
                               std::map<std::string, std::string> texts) {
  indexOf_[path] = static_cast<std::uint32_t>(blocks_.size());
  auto table = TableOf(translation);
  blocks_.push_back({std::move(translation), std::move(table), std::move(texts)});
}

std::uint32_t SimulatedVersionInfo::GetFileVersionInfoSizeA(const std::string& path) {
  return indexOf_.contains(CutText(path)) ? kBlockSize : 0;
}

bool SimulatedVersionInfo::GetFileVersionInfoA(const std::string& path, std::span<std::uint8_t> buffer) {
  const auto found = indexOf_.find(CutText(path));
  if (found == indexOf_.end() || unreadable_.contains(found->first) || buffer.size() < kBlockSize)
    return false;
  PutLittle32(buffer, 0, kBlockMark);
  PutLittle32(buffer, 4, found->second);
  return true;
}

std::optional<std::vector<std::uint8_t>>
SimulatedVersionInfo::VerQueryValueA(std::span<const std::uint8_t> block, const std::string& subBlockText) {
  const std::string subBlock = CutText(subBlockText);
  Queries.push_back(subBlock);
  if (block.size() < kBlockSize || Little32(block, 0) != kBlockMark || Little32(block, 4) >= blocks_.size())
    return {};
  const Block& found = blocks_[Little32(block, 4)];
  if (subBlock == kTranslation) {
    if (found.translation.empty()) return {};
    return found.translation;
  }
  const std::string prefix = std::string(kTexts) + found.table + "\\";
  if (!subBlock.starts_with(prefix)) return {};
  const auto text = found.texts.find(subBlock.substr(prefix.size()));
  if (text == found.texts.end()) return {};
  return WithNul(text->second);
}

} // namespace quendra::platform::simulated
