#pragma once

#include "platform/process/Processes.h"

namespace quendra::platform {

/// Access tokens and privileges. Every call sets the last error that Processes::GetLastError gives, 0 on
/// success.
class Tokens {
 public:
  virtual ~Tokens() = default;

  /// The attribute of a privilege that is switched on.
  static constexpr std::uint32_t kEnabled = 2;

  virtual bool OpenProcessToken(Handle process, std::uint32_t access, Handle& token) = 0;
  /// An empty system name is this machine.
  virtual bool LookupPrivilegeValueA(const std::string& system, const std::string& name,
                                     std::uint64_t& luid) = 0;
  /// One privilege. `previousState` has 16 bytes. Success with error kNotAllAssigned means that the account
  /// lacks the privilege.
  virtual bool AdjustTokenPrivileges(Handle token, bool disableAll, std::uint64_t luid,
                                     std::uint32_t attributes, std::span<std::uint8_t, 16> previousState) = 0;
};

} // namespace quendra::platform
