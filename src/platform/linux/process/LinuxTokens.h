#pragma once

#include "platform/linux/process/HandleTable.h"
#include "platform/process/Tokens.h"

#include <functional>

namespace quendra::platform::linux_ {

/// True for those who may look at every process: the administrator, and who may trace any process.
bool MayTraceEveryProcess();

/// The one privilege that the program asks for, held by those who may look at every process.
class LinuxTokens : public Tokens {
 public:
  explicit LinuxTokens(HandleTable& handles, std::function<bool()> mayTrace = MayTraceEveryProcess)
      : handles_(handles), mayTrace_(std::move(mayTrace)) {}

  bool OpenProcessToken(Handle process, std::uint32_t access, Handle& token) override;
  bool LookupPrivilegeValueA(const std::string& system, const std::string& name,
                             std::uint64_t& luid) override;
  bool AdjustTokenPrivileges(Handle token, bool disableAll, std::uint64_t luid, std::uint32_t attributes,
                             std::span<std::uint8_t, 16> previousState) override;

 private:
  bool Answer(std::uint32_t error);

  HandleTable& handles_;
  std::function<bool()> mayTrace_;
};

} // namespace quendra::platform::linux_
