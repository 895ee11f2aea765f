#pragma once

#include "platform/process/Tokens.h"
#include "platform/simulated/SimulatedCore.h"

namespace quendra::platform::simulated {

/// Each step succeeds while its error is 0. AdjustTokenPrivileges answers true with error 1300, as for an
/// account that lacks the privilege, and false with any other.
class SimulatedTokens : public Tokens {
 public:
  explicit SimulatedTokens(Core& core) : core_(core) {}

  std::uint32_t OpenProcessTokenError = 0;
  std::uint32_t LookupPrivilegeValueError = 0;
  std::uint32_t AdjustTokenPrivilegesError = 0;
  /// "SeDebugPrivilege 2" for each AdjustTokenPrivileges that got through.
  std::vector<std::string> Adjusted;

  bool OpenProcessToken(Handle process, std::uint32_t access, Handle& token) override;
  bool LookupPrivilegeValueA(const std::string& system, const std::string& name,
                             std::uint64_t& luid) override;
  bool AdjustTokenPrivileges(Handle token, bool disableAll, std::uint64_t luid, std::uint32_t attributes,
                             std::span<std::uint8_t, 16> previousState) override;

 private:
  bool Answer(std::uint32_t error);

  Core& core_;
  std::vector<std::string> privileges_;
};

} // namespace quendra::platform::simulated
