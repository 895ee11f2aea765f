#pragma once

#include "platform/process/Tokens.h"
#include "platform/windows/process/LastError.h"
#include "platform/windows/system/LazyLibrary.h"

namespace quendra::platform::windows {

/// The system's access tokens.
class WindowsTokens : public Tokens {
 public:
  explicit WindowsTokens(LastError& lastError) : lastError_(lastError) {}

  bool OpenProcessToken(Handle process, std::uint32_t access, Handle& token) override;
  bool LookupPrivilegeValueA(const std::string& system, const std::string& name,
                             std::uint64_t& luid) override;
  bool AdjustTokenPrivileges(Handle token, bool disableAll, std::uint64_t luid, std::uint32_t attributes,
                             std::span<std::uint8_t, 16> previousState) override;

 private:
  template <typename Function> Function* Find(const char* name);

  LastError& lastError_;
  LazyLibrary advapi32_{L"advapi32.dll"};
};

} // namespace quendra::platform::windows
