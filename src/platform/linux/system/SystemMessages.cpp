#include "platform/linux/system/SystemMessages.h"

#include <algorithm>
#include <array>

namespace quendra::platform::linux_ {

namespace {

struct Message {
  std::uint32_t number;
  std::string_view text;
};

constexpr std::array kMessages{
    Message{2, "The system cannot find the file specified.\r\n"},
    Message{5, "Access is denied.\r\n"},
    Message{6, "The handle is invalid.\r\n"},
    Message{8, "Not enough storage is available to process this command.\r\n"},
    Message{50, "The request is not supported.\r\n"},
    Message{87, "The parameter is incorrect.\r\n"},
    Message{120, "This function is not supported on this system.\r\n"},
    Message{122, "The data area passed to a system call is too small.\r\n"},
};

} // namespace

std::string_view SystemMessage(std::uint32_t number) {
  const auto found = std::ranges::find(kMessages, number, &Message::number);
  return found == kMessages.end() ? std::string_view() : found->text;
}

} // namespace quendra::platform::linux_
