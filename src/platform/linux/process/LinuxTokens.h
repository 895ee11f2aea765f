#pragma once

#include "platform/linux/process/HandleTable.h"
#include "platform/process/Tokens.h"

namespace quendra::platform::linux_ {

/// The one privilege that the program asks for. On this system nobody has to switch on a right that he has,
/// and what he may not do is refused when he tries it, so everybody gets the privilege.
class LinuxTokens : public Tokens {
 public:
  explicit LinuxTokens(HandleTable& handles) : handles_(handles) {}

  bool OpenProcessToken(Handle process, std::uint32_t access, Handle& token) override;
  bool LookupPrivilegeValueA(const std::string& system, const std::string& name,
                             std::uint64_t& luid) override;
  bool AdjustTokenPrivileges(Handle token, bool disableAll, std::uint64_t luid, std::uint32_t attributes,
                             std::span<std::uint8_t, 16> previousState) override;

 private:
  bool Answer(std::uint32_t error);

  HandleTable& handles_;
};

} // namespace quendra::platform::linux_
