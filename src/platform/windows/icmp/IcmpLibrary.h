#pragma once

#include "platform/windows/net/Winsock.h"
#include "winapi/SystemLibrary.h"

#include <ipexport.h>

namespace quendra::platform::windows {

/// The system's ICMP helper: part of the IP helper library, before that a library of its own. Each call
/// stands under its own name; none may be called unless the library is there.
class IcmpLibrary {
 public:
  IcmpLibrary();

  bool IsThere() const { return isThere_; }

  HANDLE(WINAPI* IcmpCreateFile)() = nullptr;
  BOOL(WINAPI* IcmpCloseHandle)(HANDLE handle) = nullptr;
  DWORD(WINAPI* IcmpSendEcho)
  (HANDLE handle, IPAddr target, void* data, WORD dataSize, IP_OPTION_INFORMATION* options, void* reply,
   DWORD replySize, DWORD milliseconds) = nullptr;

 private:
  bool FindAll();

  winapi::SystemLibrary library_;
  bool isThere_;
};

} // namespace quendra::platform::windows
