#include "platform/windows/remote_access/RasEntryForms.h"

#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"

#include <algorithm>
#include <cstring>

namespace quendra::platform::windows {

namespace {

constexpr std::size_t kWideAlternateOffset = offsetof(RASENTRYW, dwAlternateOffset);

/// What stands from the offset on; nothing where that isn't within the image.
std::span<const std::uint8_t> Alternates(std::span<const std::uint8_t> image, std::size_t offsetAt) {
  if (image.size() < offsetAt + 4) return {};
  const std::uint32_t offset = Little32(image, offsetAt);
  return offset == 0 || offset >= image.size() ? std::span<const std::uint8_t>() : image.subspan(offset);
}

/// With the two NULs that end a list; nothing for an empty one.
template <typename List> List WholeList(List list) {
  const List end(2, '\0');
  list.resize(std::min(list.find(end), list.size()));
  return list.empty() ? list : list + end;
}

template <typename List>
void Append(std::vector<std::uint8_t>& image, std::size_t offsetAt, const List& list) {
  if (image.size() < offsetAt + 4) return;
  PutLittle32(image, offsetAt, list.empty() ? 0 : static_cast<std::uint32_t>(image.size()));
  const auto* const bytes = reinterpret_cast<const std::uint8_t*>(list.data());
  image.insert(image.end(), bytes, bytes + list.size() * sizeof list[0]);
}

} // namespace

std::vector<std::uint8_t> WideEntryOf(std::span<const std::uint8_t> entry) {
  const auto record = entry.first(Little32(entry, 0));
  std::vector<std::uint8_t> wide(WideBytes(kRasEntry, record.size()));
  Widen(kRasEntry, record, wide);
  const auto list = Alternates(entry, RasEntry::kAlternateOffset);
  Append(wide, kWideAlternateOffset,
         WholeList(FromCodePage({reinterpret_cast<const char*>(list.data()), list.size()})));
  return wide;
}

std::vector<std::uint8_t> NarrowEntryOf(std::span<const std::uint8_t> wide, std::uint32_t recordBytes) {
  std::vector<std::uint8_t> entry(recordBytes);
  Narrow(kRasEntry, wide, entry);
  const auto list = Alternates(wide, kWideAlternateOffset);
  Text text(list.size() / sizeof(char16_t), u'\0');
  if (!text.empty()) std::memcpy(text.data(), list.data(), text.size() * sizeof(char16_t));
  Append(entry, RasEntry::kAlternateOffset, ToCodePage(WholeList(text)));
  return entry;
}

} // namespace quendra::platform::windows
