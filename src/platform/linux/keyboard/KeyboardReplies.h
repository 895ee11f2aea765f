#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string>

/// Replies of a display about its keyboard, whole, in the byte order of this machine. What doesn't lie within
/// a reply isn't read.
namespace quendra::platform::linux_ {

/// The names of groups alone, as "GetNames" is asked for them and says that it tells them.
inline constexpr std::uint32_t kGroupNames = 0x1000;

using DisplayReply = std::span<const std::uint8_t>;

/// An answer's size as its head tells it; nothing is read beyond the head.
std::size_t SizeOfReply(std::span<const std::uint8_t, 32> head);

/// The one of up to four layouts with which keys are read now, from the reply to "GetState".
std::optional<unsigned> ActiveGroupOf(DisplayReply state);
/// The number under which the display keeps the group's name, from the reply to "GetNames" for the names of
/// groups alone.
std::optional<std::uint32_t> NameNumberOf(DisplayReply names, unsigned group);
/// The text of the reply to "GetAtomName". It ends by its length and has no NUL.
std::optional<std::string> NameTextOf(DisplayReply atomName);

} // namespace quendra::platform::linux_
