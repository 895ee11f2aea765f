#include "platform/linux/process/LinuxTokens.h"

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint64_t kDebugPrivilege = 20;

} // namespace

bool LinuxTokens::Answer(std::uint32_t error) {
  handles_.lastError = error;
  return error == kNoError;
}

bool LinuxTokens::OpenProcessToken(Handle process, std::uint32_t, Handle& token) {
  if (process != kOwnProcess)
    return Answer(handles_.Find<OpenedProcess>(process) ? kAccessDenied : kErrorInvalidHandle);
  token = handles_.Add(OwnToken{});
  return Answer(kNoError);
}

bool LinuxTokens::LookupPrivilegeValueA(const std::string&, const std::string& name, std::uint64_t& luid) {
  if (name.c_str() != std::string("SeDebugPrivilege")) return Answer(kNoSuchPrivilege);
  luid = kDebugPrivilege;
  return Answer(kNoError);
}

bool LinuxTokens::AdjustTokenPrivileges(Handle token, bool, std::uint64_t luid, std::uint32_t,
                                        std::span<std::uint8_t, 16> previousState) {
  if (handles_.Find<OwnToken>(token) == nullptr) return Answer(kErrorInvalidHandle);
  std::fill(previousState.begin(), previousState.end(), std::uint8_t{0});
  // A success all the same: the error alone tells that there is no such privilege to give.
  Answer(luid == kDebugPrivilege ? kNoError : kNotAllAssigned);
  return true;
}

} // namespace quendra::platform::linux_
