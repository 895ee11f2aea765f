#include "platform/windows/process/WindowsTokens.h"

#include "platform/windows/process/SystemHandle.h"

#include <cstring>

namespace quendra::platform::windows {

template <typename Function> Function* WindowsTokens::Find(const char* name) {
  const auto call = advapi32_.Find<Function>(name);
  if (!call) lastError_.value = kCallNotImplemented;
  return call;
}

bool WindowsTokens::OpenProcessToken(Handle process, std::uint32_t access, Handle& token) {
  const auto open = Find<decltype(::OpenProcessToken)>("OpenProcessToken");
  HANDLE opened = nullptr;
  if (!open || !lastError_.Succeeded(open(ToSystem(process), access, &opened) != FALSE)) return false;
  token = FromSystem(opened);
  return true;
}

bool WindowsTokens::LookupPrivilegeValueA(const std::string& system, const std::string& name,
                                          std::uint64_t& luid) {
  const auto lookUp = Find<decltype(::LookupPrivilegeValueW)>("LookupPrivilegeValueW");
  if (!lookUp) return false;
  const Text machine = FromCodePage(system);
  const Text privilege = FromCodePage(name);
  LUID found{};
  const bool known =
      lookUp(machine.empty() ? nullptr : winapi::Wide(machine), winapi::Wide(privilege), &found) != FALSE;
  if (!lastError_.Succeeded(known)) return false;
  luid = std::uint64_t{static_cast<std::uint32_t>(found.HighPart)} << 32 | found.LowPart;
  return true;
}

bool WindowsTokens::AdjustTokenPrivileges(Handle token, bool disableAll, std::uint64_t luid,
                                          std::uint32_t attributes,
                                          std::span<std::uint8_t, 16> previousState) {
  const auto adjust = Find<decltype(::AdjustTokenPrivileges)>("AdjustTokenPrivileges");
  if (!adjust) return false;
  TOKEN_PRIVILEGES wanted{};
  wanted.PrivilegeCount = 1;
  wanted.Privileges[0].Luid = {static_cast<DWORD>(luid), static_cast<LONG>(luid >> 32)};
  wanted.Privileges[0].Attributes = attributes;
  TOKEN_PRIVILEGES previous{};
  static_assert(sizeof previous == 16);
  DWORD needed = 0;
  const bool adjusted =
      adjust(ToSystem(token), disableAll, &wanted, sizeof previous, &previous, &needed) != FALSE;
  // A success has an error too: that the account lacks the privilege.
  lastError_.value = ::GetLastError();
  std::memcpy(previousState.data(), &previous, sizeof previous);
  return adjusted;
}

} // namespace quendra::platform::windows
