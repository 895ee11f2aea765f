#pragma once

#include "platform/windows/net/Winsock.h"
#include "winapi/SystemLibrary.h"

#include <iphlpapi.h>

namespace quendra::platform::windows {

/// The system's IP helper library. Each call stands under its own name and is nullptr where this system's
/// library lacks it.
class IpHelperLibrary {
 public:
  IpHelperLibrary();

  /// An answer to a call that the library lacks.
  static constexpr DWORD kMissing = ERROR_NOT_SUPPORTED;

  /// Of the first systems alone, on which the next one isn't there yet.
  DWORD(WINAPI* AllocateAndGetTcpExTableFromStack)
  (void** table, BOOL sorted, HANDLE heap, DWORD flags, DWORD family) = nullptr;
  decltype(&::GetExtendedTcpTable) GetExtendedTcpTable = nullptr;
  decltype(&::GetAdaptersInfo) GetAdaptersInfo = nullptr;
  decltype(&::GetIfTable) GetIfTable = nullptr;
  decltype(&::GetIpForwardTable) GetIpForwardTable = nullptr;
  decltype(&::SetTcpEntry) SetTcpEntry = nullptr;

 private:
  winapi::SystemLibrary library_{L"iphlpapi.dll"};
};

} // namespace quendra::platform::windows
