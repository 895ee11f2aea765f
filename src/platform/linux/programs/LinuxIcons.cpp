#include "platform/linux/programs/LinuxIcons.h"

#include "platform/linux/system/Files.h"

namespace quendra::platform::linux_ {

namespace {

/// What the bytes are is judged by them, not by the file's name: a desktop entry may name any file.
bool IsImage(std::string_view bytes) {
  if (bytes.starts_with("\x89PNG\r\n\x1A\n") || bytes.starts_with("/* XPM */")) return true;
  const std::string_view start = bytes.substr(0, 4096);
  const std::size_t first = start.find_first_not_of("\xEF\xBB\xBF \t\r\n");
  return first != std::string_view::npos && start[first] == '<' &&
         start.find("<svg") != std::string_view::npos;
}

} // namespace

Handle LinuxIcons::ExtractIconExA(const std::string& path, int index) {
  if (index != 0 || path.empty()) return kNoHandle;
  Image image = ImageFor(paths_.ToRaw(path));
  if (!image) return kNoHandle;
  do next_ += 4;
  while (Handle(next_) == kNoHandle || icons_.contains(Handle(next_)));
  icons_.emplace(Handle(next_), std::move(image));
  return Handle(next_);
}

const std::vector<std::uint8_t>& LinuxIcons::ImageOf(Handle icon) {
  static const std::vector<std::uint8_t> kNone;
  const auto found = icons_.find(icon);
  return found == icons_.end() ? kNone : *found->second;
}

LinuxIcons::Image LinuxIcons::ImageFor(const std::string& executable) {
  // The index is asked first, so that it looks at its folders; what is remembered holds as long as the index
  // does.
  index_.EntryFor(executable);
  if (theme_.Refresh() || generation_ != index_.Generation() || imageOf_.size() >= kMostRemembered)
    imageOf_.clear();
  generation_ = index_.Generation();
  const auto [place, isNew] = imageOf_.try_emplace(executable);
  if (isNew) place->second = Load(executable);
  return place->second;
}

LinuxIcons::Image LinuxIcons::Load(const std::string& executable) {
  const DesktopEntry* entry = index_.EntryFor(executable);
  if (entry == nullptr) return {};
  const auto file = theme_.Find(entry->icon);
  const auto bytes = file ? ReadFile(*file, kIconBytes) : std::nullopt;
  if (!bytes || !IsImage(*bytes)) return {};
  return std::make_shared<const std::vector<std::uint8_t>>(bytes->begin(), bytes->end());
}

} // namespace quendra::platform::linux_
