#pragma once

#include "platform/process/Tokens.h"

namespace quendra::platform::unavailable {

/// A system without access tokens; the last error is that of UnavailableProcesses.
class UnavailableTokens : public Tokens {
 public:
  bool OpenProcessToken(Handle, std::uint32_t, Handle&) override { return false; }
  bool LookupPrivilegeValueA(const std::string&, const std::string&, std::uint64_t&) override {
    return false;
  }
  bool AdjustTokenPrivileges(Handle, bool, std::uint64_t, std::uint32_t,
                             std::span<std::uint8_t, 16>) override {
    return false;
  }
};

} // namespace quendra::platform::unavailable
