#include "platform/linux/keyboard/DisplayKeyboard.h"

#include "platform/linux/keyboard/KeyboardReplies.h"
#include "platform/linux/keyboard/XcbLibrary.h"

#include <cstdlib>
#include <vector>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint16_t kCoreKeyboard = 0x100;

using ReplyBytes = std::vector<std::uint8_t>;

/// The display's answer, which the library has read as far as its head says; empty for none.
ReplyBytes BytesOf(void* reply) {
  const std::unique_ptr<void, void (*)(void*)> owned(reply, std::free);
  if (reply == nullptr) return {};
  const auto* start = static_cast<const std::uint8_t*>(reply);
  return {start, start + SizeOfReply(std::span<const std::uint8_t, 32>(start, 32))};
}

std::optional<std::string> AskForActiveKeymap(const XcbLibrary& library, void* display) {
  if (BytesOf(library.xkb_use_extension_reply(display, library.xkb_use_extension(display, 1, 0), nullptr))
          .empty())
    return {};
  const auto stateRequest = library.xkb_get_state(display, kCoreKeyboard);
  const auto namesRequest = library.xkb_get_names(display, kCoreKeyboard, kGroupNames);
  const ReplyBytes state = BytesOf(library.xkb_get_state_reply(display, stateRequest, nullptr));
  const ReplyBytes names = BytesOf(library.xkb_get_names_reply(display, namesRequest, nullptr));
  const auto group = ActiveGroupOf(state);
  const auto number = group ? NameNumberOf(names, *group) : std::nullopt;
  if (!number) return {};
  return NameTextOf(
      BytesOf(library.get_atom_name_reply(display, library.get_atom_name(display, *number), nullptr)));
}

} // namespace

std::optional<std::string> ActiveKeymap() {
  const XcbLibrary library;
  if (!library.isThere) return {};
  const std::unique_ptr<void, void (*)(void*)> display(library.connect(nullptr, nullptr), library.disconnect);
  if (library.connection_has_error(display.get()) != 0) return {};
  return AskForActiveKeymap(library, display.get());
}

} // namespace quendra::platform::linux_
