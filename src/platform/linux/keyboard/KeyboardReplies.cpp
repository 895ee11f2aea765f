#include "platform/linux/keyboard/KeyboardReplies.h"

#include <bit>
#include <cstring>

namespace quendra::platform::linux_ {

namespace {

constexpr std::size_t kHead = 32;
constexpr unsigned kMostGroups = 4;

template <typename Field> std::optional<Field> FieldAt(DisplayReply reply, std::size_t at) {
  if (at > reply.size() || reply.size() - at < sizeof(Field)) return {};
  Field field;
  std::memcpy(&field, reply.data() + at, sizeof field);
  return field;
}

} // namespace

std::size_t SizeOfReply(std::span<const std::uint8_t, 32> head) {
  return kHead + std::size_t{4} * FieldAt<std::uint32_t>(head, 4).value_or(0);
}

std::optional<unsigned> ActiveGroupOf(DisplayReply state) {
  const auto group = FieldAt<std::uint8_t>(state, 12);
  if (!group || *group >= kMostGroups) return {};
  return *group;
}

std::optional<std::uint32_t> NameNumberOf(DisplayReply names, unsigned group) {
  const auto told = FieldAt<std::uint32_t>(names, 8);
  const auto named = FieldAt<std::uint8_t>(names, 15);
  if (told != kGroupNames || !named || group >= kMostGroups || (*named >> group & 1U) == 0) return {};
  // A number for each group that has a name, in their order.
  const auto before = static_cast<std::size_t>(std::popcount(*named & ((1U << group) - 1)));
  return FieldAt<std::uint32_t>(names, kHead + before * sizeof(std::uint32_t));
}

std::optional<std::string> NameTextOf(DisplayReply atomName) {
  const auto length = FieldAt<std::uint16_t>(atomName, 8);
  if (!length || atomName.size() < kHead + *length) return {};
  const auto text = atomName.subspan(kHead, *length);
  return std::string(text.begin(), text.end());
}

} // namespace quendra::platform::linux_
