#include "platform/simulated/remote_access/EntryBook.h"

#include "runtime/Text.h"

namespace quendra::platform::simulated {

namespace {

bool SameName(const std::string& left, const std::string& right) {
  return SameIgnoringCase(FromCodePage(left), FromCodePage(right));
}

auto Named(const std::string& name) {
  return [&name](const SimulatedEntry& entry) { return SameName(entry.name, name); };
}

/// Texts one after another, each with its NUL, and one NUL more behind the last.
std::vector<std::string> TextsIn(std::span<const std::uint8_t> bytes) {
  std::vector<std::string> texts;
  for (std::size_t at = 0; at < bytes.size() && bytes[at] != 0; at += texts.back().size() + 1)
    texts.push_back(TextAt(bytes, at, bytes.size() - at));
  return texts;
}

} // namespace

SimulatedEntry* EntryBook::Find(const std::string& name) {
  const auto found = std::find_if(entries_.begin(), entries_.end(), Named(name));
  return found == entries_.end() ? nullptr : &*found;
}

SimulatedEntry& EntryBook::Made(const std::string& name, std::uint32_t entryBytes) {
  SimulatedEntry* entry = Find(name);
  if (!entry) entry = &entries_.emplace_back(SimulatedEntry{.name = name});
  entry->properties.resize(entryBytes);
  PutLittle32(entry->properties, 0, entryBytes);
  return *entry;
}

bool EntryBook::Remove(const std::string& name) { return std::erase_if(entries_, Named(name)) > 0; }

std::vector<std::uint8_t> PropertiesImage(const SimulatedEntry& entry) {
  std::vector<std::uint8_t> image = entry.properties;
  PutLittle32(image, RasEntry::kAlternateOffset, 0);
  if (entry.alternateNumbers.empty()) return image;
  PutLittle32(image, RasEntry::kAlternateOffset, static_cast<std::uint32_t>(image.size()));
  for (const std::string& number : entry.alternateNumbers) {
    image.insert(image.end(), number.begin(), number.end());
    image.push_back(0);
  }
  image.push_back(0);
  return image;
}

void TakeProperties(SimulatedEntry& entry, std::span<const std::uint8_t> image) {
  const auto record = image.first(entry.properties.size());
  entry.properties.assign(record.begin(), record.end());
  const std::uint32_t alternates = Little32(record, RasEntry::kAlternateOffset);
  const bool hasAny = alternates != 0 && alternates < image.size();
  entry.alternateNumbers = hasAny ? TextsIn(image.subspan(alternates)) : std::vector<std::string>();
}

} // namespace quendra::platform::simulated
