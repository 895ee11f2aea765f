// A loopback web server for measurements: answers whatever asks with a number of zero bytes, or keeps many
// connections open and sends each a few bytes. Prints its port, serves a given number of connections and
// ends.
//   socket-server BYTES CONNECTIONS

#include <arpa/inet.h>
#include <netinet/in.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

namespace {

constexpr int kSecondsToLive = 120;

int Listen(sockaddr_in& address) {
  const int listener = ::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
  address.sin_family = AF_INET;
  address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
  socklen_t size = sizeof address;
  if (listener < 0 || ::bind(listener, reinterpret_cast<sockaddr*>(&address), size) != 0 ||
      ::listen(listener, 4096) != 0 ||
      ::getsockname(listener, reinterpret_cast<sockaddr*>(&address), &size) != 0)
    return -1;
  return listener;
}

void Send(int connection, long long bytes) {
  static const std::vector<char> zeros(1 << 20);
  while (bytes > 0) {
    const auto piece =
        static_cast<std::size_t>(bytes < static_cast<long long>(zeros.size()) ? bytes : zeros.size());
    const auto sent = ::send(connection, zeros.data(), piece, MSG_NOSIGNAL);
    if (sent <= 0) return;
    bytes -= sent;
  }
}

void Serve(int connection, long long bytes) {
  char request[4096];
  if (::recv(connection, request, sizeof request, 0) > 0) {
    const std::string header =
        "HTTP/1.1 200 OK\r\nConnection: close\r\nContent-Length: " + std::to_string(bytes) + "\r\n\r\n";
    if (::send(connection, header.data(), header.size(), MSG_NOSIGNAL) > 0) Send(connection, bytes);
  }
  ::close(connection);
}

} // namespace

int main(int argc, char** argv) {
  if (argc != 3) return 2;
  const long long bytes = std::atoll(argv[1]);
  const int connections = std::atoi(argv[2]);
  ::alarm(kSecondsToLive);
  sockaddr_in address{};
  const int listener = Listen(address);
  if (listener < 0) return 1;
  std::printf("%d\n", ntohs(address.sin_port));
  std::fflush(stdout);
  for (int i = 0; i < connections; ++i) {
    const int connection = ::accept4(listener, nullptr, nullptr, SOCK_CLOEXEC);
    if (connection < 0) return 1;
    Serve(connection, bytes);
  }
  return 0;
}
