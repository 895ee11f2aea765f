#include "platform/windows/net/AnsiText.h"

#include "winapi/Winapi.h"

namespace quendra::platform::windows {

Text FromAnsi(std::string_view bytes) {
  const int size = static_cast<int>(bytes.size());
  const int needed = ::MultiByteToWideChar(CP_ACP, 0, bytes.data(), size, nullptr, 0);
  if (needed <= 0) return {};
  Text text(static_cast<std::size_t>(needed), u'\0');
  ::MultiByteToWideChar(CP_ACP, 0, bytes.data(), size, reinterpret_cast<wchar_t*>(text.data()), needed);
  return text;
}

} // namespace quendra::platform::windows
