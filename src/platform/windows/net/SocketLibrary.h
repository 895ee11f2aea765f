#pragma once

#include "platform/windows/net/Winsock.h"
#include "winapi/SystemLibrary.h"

namespace quendra::platform::windows {

/// The system's socket library. Each call stands under its own name; none may be called unless the library is
/// there.
class SocketLibrary {
 public:
  explicit SocketLibrary(const wchar_t* fileName = L"ws2_32.dll");

  bool IsThere() const { return isThere_; }

  decltype(&::WSAAsyncGetHostByName) WSAAsyncGetHostByName = nullptr;
  decltype(&::WSAAsyncSelect) WSAAsyncSelect = nullptr;
  decltype(&::WSACancelAsyncRequest) WSACancelAsyncRequest = nullptr;
  decltype(&::WSACancelBlockingCall) WSACancelBlockingCall = nullptr;
  decltype(&::WSACleanup) WSACleanup = nullptr;
  decltype(&::WSAGetLastError) WSAGetLastError = nullptr;
  decltype(&::WSAIsBlocking) WSAIsBlocking = nullptr;
  decltype(&::WSAStartup) WSAStartup = nullptr;
  decltype(&::accept) accept = nullptr;
  decltype(&::bind) bind = nullptr;
  decltype(&::closesocket) closesocket = nullptr;
  decltype(&::connect) connect = nullptr;
  decltype(&::gethostbyname) gethostbyname = nullptr;
  decltype(&::gethostname) gethostname = nullptr;
  decltype(&::getpeername) getpeername = nullptr;
  decltype(&::getsockname) getsockname = nullptr;
  decltype(&::getsockopt) getsockopt = nullptr;
  decltype(&::ioctlsocket) ioctlsocket = nullptr;
  decltype(&::listen) listen = nullptr;
  decltype(&::recvfrom) recvfrom = nullptr;
  decltype(&::send) send = nullptr;
  decltype(&::sendto) sendto = nullptr;
  decltype(&::setsockopt) setsockopt = nullptr;
  decltype(&::socket) socket = nullptr;

 private:
  bool FindAll();

  winapi::SystemLibrary library_;
  bool isThere_;
};

} // namespace quendra::platform::windows
