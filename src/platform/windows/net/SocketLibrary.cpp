#include "platform/windows/net/SocketLibrary.h"

namespace quendra::platform::windows {

SocketLibrary::SocketLibrary(const wchar_t* fileName) : library_(fileName), isThere_(FindAll()) {}

bool SocketLibrary::FindAll() {
  return Find(library_, "WSAAsyncGetHostByName", WSAAsyncGetHostByName) &&
         Find(library_, "WSAAsyncSelect", WSAAsyncSelect) &&
         Find(library_, "WSACancelAsyncRequest", WSACancelAsyncRequest) &&
         Find(library_, "WSACancelBlockingCall", WSACancelBlockingCall) &&
         Find(library_, "WSACleanup", WSACleanup) && Find(library_, "WSAGetLastError", WSAGetLastError) &&
         Find(library_, "WSAIsBlocking", WSAIsBlocking) && Find(library_, "WSAStartup", WSAStartup) &&
         Find(library_, "accept", accept) && Find(library_, "bind", bind) &&
         Find(library_, "closesocket", closesocket) && Find(library_, "connect", connect) &&
         Find(library_, "gethostbyname", gethostbyname) && Find(library_, "gethostname", gethostname) &&
         Find(library_, "getpeername", getpeername) && Find(library_, "getsockname", getsockname) &&
         Find(library_, "getsockopt", getsockopt) && Find(library_, "ioctlsocket", ioctlsocket) &&
         Find(library_, "listen", listen) && Find(library_, "recvfrom", recvfrom) &&
         Find(library_, "send", send) && Find(library_, "sendto", sendto) &&
         Find(library_, "setsockopt", setsockopt) && Find(library_, "socket", socket);
}

} // namespace quendra::platform::windows
