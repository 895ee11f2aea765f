#pragma once

/// Whether sanitizers watch this build: it then takes several times as long, and keeps what was freed for a
/// while.
#ifdef __SANITIZE_ADDRESS__
#define QUENDRA_SANITIZED 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
#define QUENDRA_SANITIZED 1
#endif
#endif
#ifndef QUENDRA_SANITIZED
#define QUENDRA_SANITIZED 0
#endif

namespace quendra {
inline constexpr bool kSanitized = QUENDRA_SANITIZED == 1;
}
