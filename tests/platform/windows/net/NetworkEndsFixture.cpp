#include "platform/windows/net/NetworkEndsFixture.h"

#include "platform/windows/net/SystemAddress.h"

#include <array>
#include <stdexcept>
#include <utility>

namespace quendra::platform::windows {

namespace {

constexpr long kNonBlocking = static_cast<long>(FIONBIO);

void Check(bool succeeded) {
  if (!succeeded) throw std::runtime_error("a socket call on loopback failed");
}

sockaddr_in Loopback(std::uint16_t port) {
  return SystemAddress({Ipv4Address::FromHost(INADDR_LOOPBACK), port});
}

/// The library's call for it is asked by tests alone.
void StopSending(SOCKET socket) {
  const winapi::SystemLibrary library(L"ws2_32.dll");
  Check(library.Find<decltype(::shutdown)>("shutdown")(socket, SD_SEND) == 0);
}

class SocketFarEnd : public FarEnd {
 public:
  SocketFarEnd(const SocketLibrary& library, SOCKET socket) : library_(library), socket_(socket) {}
  ~SocketFarEnd() override {
    if (socket_ != INVALID_SOCKET) library_.closesocket(socket_);
  }
  void Send(const std::string& bytes) override {
    Check(library_.send(socket_, bytes.data(), static_cast<int>(bytes.size()), 0) ==
          static_cast<int>(bytes.size()));
  }
  void CloseSending() override { StopSending(socket_); }
  void Reset() override {
    const linger forced{1, 0};
    Check(library_.setsockopt(socket_, SOL_SOCKET, SO_LINGER, reinterpret_cast<const char*>(&forced),
                              sizeof forced) == 0);
    library_.closesocket(std::exchange(socket_, INVALID_SOCKET));
  }
  void Drain() override {
    std::array<char, 65536> buffer;
    while (library_.recvfrom(socket_, buffer.data(), buffer.size(), 0, nullptr, nullptr) > 0) {
    }
  }

 private:
  const SocketLibrary& library_;
  SOCKET socket_;
};

} // namespace

NetworkEnds::NetworkEnds() {
  WSADATA data{};
  Check(library_.IsThere() && library_.WSAStartup(MAKEWORD(2, 2), &data) == 0);
}

NetworkEnds::~NetworkEnds() {
  for (const SOCKET socket : sockets_) library_.closesocket(socket);
  library_.WSACleanup();
}

SOCKET NetworkEnds::NewSocket() {
  const SOCKET made = library_.socket(AF_INET, SOCK_STREAM, 0);
  Check(made != INVALID_SOCKET);
  sockets_.push_back(made);
  return made;
}

std::uint16_t NetworkEnds::PortOf(SOCKET socket) const {
  sockaddr_in address{};
  int size = sizeof address;
  Check(library_.getsockname(socket, reinterpret_cast<sockaddr*>(&address), &size) == 0);
  return LibraryAddress(address).port;
}

std::uint16_t NetworkEnds::Listen() {
  const SOCKET listener = NewSocket();
  const sockaddr_in any = Loopback(0);
  Check(library_.bind(listener, reinterpret_cast<const sockaddr*>(&any), sizeof any) == 0);
  Check(library_.listen(listener, 1) == 0);
  return PortOf(listener);
}

std::uint16_t NetworkEnds::Connect(std::uint16_t port) {
  const SOCKET near = NewSocket();
  const sockaddr_in target = Loopback(port);
  Check(library_.connect(near, reinterpret_cast<const sockaddr*>(&target), sizeof target) == 0);
  sockets_.push_back(library_.accept(sockets_.front(), nullptr, nullptr));
  Check(sockets_.back() != INVALID_SOCKET);
  return PortOf(near);
}

SocketAddress NetworkEnds::Outside() {
  const std::uint16_t port = Listen();
  u_long isOn = 1;
  Check(library_.ioctlsocket(sockets_.back(), kNonBlocking, &isOn) == 0);
  return {Ipv4Address::FromHost(INADDR_LOOPBACK), port};
}

// What it accepts doesn't block either: the listener's mode is inherited.
std::unique_ptr<FarEnd> NetworkEnds::TakeConnection() {
  const SOCKET taken = library_.accept(sockets_.back(), nullptr, nullptr);
  if (taken == INVALID_SOCKET) return nullptr;
  return std::make_unique<SocketFarEnd>(library_, taken);
}

} // namespace quendra::platform::windows
