#pragma once

#include <cstdint>

namespace quendra::diagnostics {

inline constexpr std::int16_t kWebPort = 80;
inline constexpr std::int16_t kOutgoingMailPort = 25;
inline constexpr std::int16_t kIncomingMailPort = 110;

inline constexpr const char16_t* kWebRequest = u"GET / HTTP/1.0\n\n";
// Without a line end: mail servers greet unasked, and their greeting is what counts.
inline constexpr const char16_t* kOutgoingMailRequest = u"HELO localhost";
inline constexpr const char16_t* kIncomingMailRequest = u"USER temp";

} // namespace quendra::diagnostics
