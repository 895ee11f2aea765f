// Talks with one of its kind, each by a port that it is given:
//
//   port_talker serve ADDRESS PORT REQUESTS
//   port_talker call ADDRESS PORT REQUESTS PEER-ADDRESS PEER-PORT
//
// REQUESTS is COUNTxREQUEST:REPLY, how many there are and the bytes of each and of its reply. The one that
// calls begins when the event "quendra-talk-begin" is set. Each sets "quendra-talk-PORT" twice: when it
// listens or is connected, and when all is said; then it stands there until somebody ends it. Without its
// port it ends at once.

#include <winsock2.h>
#include <ws2tcpip.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

namespace {

constexpr DWORD kMostMilliseconds = 120'000;

struct Requests {
  int count = 0, request = 0, reply = 0;
};

sockaddr_in End(const char* address, const char* port) {
  sockaddr_in end{};
  end.sin_family = AF_INET;
  end.sin_addr.s_addr = ::inet_addr(address);
  end.sin_port = ::htons(static_cast<u_short>(std::atoi(port)));
  return end;
}

template <typename Call> bool At(Call call, SOCKET socket, const sockaddr_in& end) {
  return call(socket, reinterpret_cast<const sockaddr*>(&end), sizeof end) == 0;
}

HANDLE Event(const std::string& name) {
  return ::CreateEventA(nullptr, FALSE, FALSE, ("Local\\quendra-talk-" + name).c_str());
}

bool Send(SOCKET connection, int bytes) {
  const std::vector<char> data(static_cast<std::size_t>(bytes), 'x');
  return ::send(connection, data.data(), bytes, 0) == bytes;
}

bool Receive(SOCKET connection, int bytes) {
  std::vector<char> data(static_cast<std::size_t>(bytes));
  while (bytes > 0) {
    const int got = ::recv(connection, data.data(), bytes, 0);
    if (got <= 0) return false;
    bytes -= got;
  }
  return true;
}

bool Serve(SOCKET connection, const Requests& all) {
  for (int i = 0; i < all.count; ++i)
    if (!Receive(connection, all.request) || !Send(connection, all.reply)) return false;
  return true;
}

bool Call(SOCKET connection, const Requests& all) {
  for (int i = 0; i < all.count; ++i)
    if (!Send(connection, all.request) || !Receive(connection, all.reply)) return false;
  return true;
}

} // namespace

int main(int count, char** words) {
  if (count < 5) return 2;
  Requests all;
  if (std::sscanf(words[4], "%dx%d:%d", &all.count, &all.request, &all.reply) != 3) return 2;
  WSADATA about{};
  ::WSAStartup(MAKEWORD(2, 2), &about);
  const SOCKET own = ::socket(AF_INET, SOCK_STREAM, 0);
  if (!At(::bind, own, End(words[2], words[3]))) return 1;
  const HANDLE told = Event(words[3]);
  bool isSaid = false;
  if (count == 7) {
    if (!At(::connect, own, End(words[5], words[6]))) return 1;
    ::SetEvent(told);
    // An event that many wait for.
    const HANDLE begin = ::OpenEventA(SYNCHRONIZE, FALSE, "Local\\quendra-talk-begin");
    isSaid = ::WaitForSingleObject(begin, kMostMilliseconds) == WAIT_OBJECT_0 && Call(own, all);
  } else {
    if (::listen(own, 1) != 0) return 1;
    ::SetEvent(told);
    isSaid = Serve(::accept(own, nullptr, nullptr), all);
  }
  if (!isSaid) return 3;
  ::SetEvent(told);
  ::Sleep(kMostMilliseconds);
}
