#pragma once

#include <arpa/inet.h>
#include <cerrno>
#include <cstdint>
#include <cstring>
#include <netinet/in.h>
#include <stdexcept>
#include <string>
#include <sys/socket.h>

namespace quendra::integration {

inline int Check(long result, const char* what) {
  if (result < 0) throw std::runtime_error(std::string(what) + ": " + std::strerror(errno));
  return static_cast<int>(result);
}

inline sockaddr_in InetAddress(const std::string& address, std::uint16_t port) {
  sockaddr_in result{};
  result.sin_family = AF_INET;
  result.sin_port = htons(port);
  inet_pton(AF_INET, address.c_str(), &result.sin_addr);
  return result;
}

inline const sockaddr* Generic(const sockaddr_in& address) {
  return reinterpret_cast<const sockaddr*>(&address);
}

/// All of the bytes, or a fault.
inline void SendAll(int connection, const char* bytes, std::size_t size) {
  while (size > 0) {
    const auto sent = static_cast<std::size_t>(Check(send(connection, bytes, size, MSG_NOSIGNAL), "send"));
    bytes += sent;
    size -= sent;
  }
}

/// False at the end of the stream.
inline bool ReceiveAll(int connection, char* bytes, std::size_t size) {
  while (size > 0) {
    const ssize_t got = recv(connection, bytes, size, 0);
    if (got <= 0) return false;
    bytes += got;
    size -= static_cast<std::size_t>(got);
  }
  return true;
}

} // namespace quendra::integration
