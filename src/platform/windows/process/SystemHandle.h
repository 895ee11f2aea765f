#pragma once

#include "platform/process/Processes.h"
#include "winapi/Winapi.h"

namespace quendra::platform::windows {

// The system's own handles, whose values have 32 bits in a program of 32 bits.

inline HANDLE ToSystem(Handle handle) {
  return reinterpret_cast<HANDLE>(static_cast<std::uintptr_t>(handle.Value()));
}
inline Handle FromSystem(HANDLE handle) {
  return Handle(static_cast<std::uint32_t>(reinterpret_cast<std::uintptr_t>(handle)));
}

} // namespace quendra::platform::windows
