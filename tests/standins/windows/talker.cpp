// A program that talks over the network, for the tour: run from a file of some name, it stands under that
// name in the table of processes. Prints its own port once it is connected, and ends with the other side.
//
//   talker get ADDRESS PORT          reads what comes
//   talker put ADDRESS PORT RATE     sends, so many bytes a second
//   talker talk ADDRESS PORT         short lines, ten a second, each answered
//   talker wait SECONDS              does nothing but stand there

#include <winsock2.h>
#include <ws2tcpip.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

namespace {

constexpr int kChunk = 8192;
constexpr DWORD kBetween = 100; // milliseconds

bool Read(SOCKET connection) {
  std::vector<char> data(65536);
  return ::recv(connection, data.data(), static_cast<int>(data.size()), 0) > 0;
}

bool Send(SOCKET connection, const std::string& data) {
  return ::send(connection, data.data(), static_cast<int>(data.size()), 0) == static_cast<int>(data.size());
}

void Get(SOCKET connection) {
  while (Read(connection)) {
  }
}

void Put(SOCKET connection, int rate) {
  const std::string chunk(kChunk, '\0');
  DWORD due = ::GetTickCount();
  while (Send(connection, chunk)) {
    due += static_cast<DWORD>(kChunk * 1000 / rate);
    const auto early = static_cast<int>(due - ::GetTickCount());
    if (early > 0) ::Sleep(static_cast<DWORD>(early));
  }
}

void Talk(SOCKET connection) {
  const std::string line = "a line of some sixty characters, as a person types it in a chat\n";
  while (Send(connection, line) && Read(connection)) ::Sleep(kBetween);
}

SOCKET Connect(const char* address, const char* port) {
  sockaddr_in to{};
  to.sin_family = AF_INET;
  to.sin_addr.s_addr = ::inet_addr(address);
  to.sin_port = ::htons(static_cast<u_short>(std::atoi(port)));
  const SOCKET connection = ::socket(AF_INET, SOCK_STREAM, 0);
  if (::connect(connection, reinterpret_cast<const sockaddr*>(&to), sizeof to) != 0) return INVALID_SOCKET;
  return connection;
}

void TellPort(SOCKET connection) {
  sockaddr_in own{};
  int size = sizeof own;
  ::getsockname(connection, reinterpret_cast<sockaddr*>(&own), &size);
  std::printf("%d\n", ::ntohs(own.sin_port));
  std::fflush(stdout);
}

} // namespace

int main(int count, char** words) {
  const std::vector<std::string> given(words + 1, words + count);
  if (given.size() == 2 && given[0] == "wait") {
    std::puts("waits");
    std::fflush(stdout);
    ::Sleep(static_cast<DWORD>(std::atoi(words[2])) * 1000);
    return 0;
  }
  if (given.size() < 3) return 2;
  WSADATA about{};
  ::WSAStartup(MAKEWORD(2, 2), &about);
  const SOCKET connection = Connect(words[2], words[3]);
  if (connection == INVALID_SOCKET) return 1;
  TellPort(connection);
  if (given[0] == "get") Get(connection);
  if (given[0] == "put" && given.size() == 4) Put(connection, std::max(1, std::atoi(words[4])));
  if (given[0] == "talk") Talk(connection);
}
