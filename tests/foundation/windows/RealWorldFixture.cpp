#include "foundation/WorldFixture.h"
#include "platform/windows/WindowsLoopFixture.h"
#include "platform/windows/WineDeviations.h"
#include "platform/windows/net/WindowsHostNames.h"
#include "platform/windows/net/WindowsSockets.h"

#include <winsock2.h>

#include <array>
#include <stdexcept>
#include <utility>

// The far ends call the library by its names: only what is tested must look it up.

namespace quendra::foundation {

namespace {

sockaddr_in Loopback(std::int32_t port) {
  sockaddr_in address{};
  address.sin_family = AF_INET;
  address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
  address.sin_port = htons(static_cast<std::uint16_t>(port));
  return address;
}

void Check(int result) {
  if (result == SOCKET_ERROR) throw std::runtime_error("a socket call of the test failed");
}

/// The library as long as somebody uses it.
struct Started {
  Started() {
    WSADATA data;
    if (WSAStartup(MAKEWORD(2, 2), &data) != 0) throw std::runtime_error("no socket library");
  }
  ~Started() { WSACleanup(); }
};

class OwnedSocket {
 public:
  explicit OwnedSocket(SOCKET socket = INVALID_SOCKET) : socket_(socket) {}
  OwnedSocket(OwnedSocket&& other) noexcept : socket_(std::exchange(other.socket_, INVALID_SOCKET)) {}
  OwnedSocket& operator=(OwnedSocket&& other) noexcept {
    std::swap(socket_, other.socket_);
    return *this;
  }
  ~OwnedSocket() { Close(); }
  void Close() {
    if (socket_ != INVALID_SOCKET) closesocket(std::exchange(socket_, INVALID_SOCKET));
  }
  void DontWait() {
    u_long on = 1;
    Check(ioctlsocket(socket_, FIONBIO, &on));
  }
  explicit operator bool() const { return socket_ != INVALID_SOCKET; }
  SOCKET Number() const { return socket_; }

 private:
  SOCKET socket_;
};

OwnedSocket BoundSocket(int type) {
  OwnedSocket bound(socket(AF_INET, type, 0));
  const sockaddr_in any = Loopback(0);
  Check(bind(bound.Number(), reinterpret_cast<const sockaddr*>(&any), sizeof any));
  return bound;
}

std::int32_t PortOf(const OwnedSocket& bound) {
  sockaddr_in address{};
  int size = sizeof address;
  Check(getsockname(bound.Number(), reinterpret_cast<sockaddr*>(&address), &size));
  return ntohs(address.sin_port);
}

class RealFarEnd : public FarEnd {
 public:
  explicit RealFarEnd(OwnedSocket socket) : socket_(std::move(socket)) { socket_.DontWait(); }
  void Send(const std::string& bytes) override {
    if (send(socket_.Number(), bytes.data(), static_cast<int>(bytes.size()), 0) !=
        static_cast<int>(bytes.size()))
      throw std::runtime_error("the far end can't send so much at once");
  }
  void Close() override { socket_.Close(); }
  void Reset() override {
    const linger forced{1, 0};
    setsockopt(socket_.Number(), SOL_SOCKET, SO_LINGER, reinterpret_cast<const char*>(&forced),
               sizeof forced);
    Close();
  }
  const std::string& Received() override {
    std::array<char, 65536> buffer;
    int read = 0;
    while (socket_ && (read = recv(socket_.Number(), buffer.data(), buffer.size(), 0)) > 0)
      received_.append(buffer.data(), static_cast<std::size_t>(read));
    if (socket_ && (read == 0 || (read < 0 && ::WSAGetLastError() != WSAEWOULDBLOCK))) ended_ = true;
    return received_;
  }
  bool Ended() override {
    Received();
    return ended_;
  }

 private:
  OwnedSocket socket_;
  std::string received_;
  bool ended_ = false;
};

class RealFarServer : public FarServer {
 public:
  RealFarServer() : socket_(BoundSocket(SOCK_STREAM)) {
    socket_.DontWait();
    Check(listen(socket_.Number(), 128));
  }
  std::int32_t Port() override { return PortOf(socket_); }
  std::unique_ptr<FarEnd> TakeConnection() override {
    OwnedSocket accepted(accept(socket_.Number(), nullptr, nullptr));
    return accepted ? std::make_unique<RealFarEnd>(std::move(accepted)) : nullptr;
  }

 private:
  OwnedSocket socket_;
};

class RealFarDatagrams : public FarDatagrams {
 public:
  RealFarDatagrams() { socket_.DontWait(); }
  std::int32_t Port() override { return PortOf(socket_); }
  void SendTo(std::int32_t port, const std::string& bytes) override {
    const sockaddr_in target = Loopback(port);
    Check(sendto(socket_.Number(), bytes.data(), static_cast<int>(bytes.size()), 0,
                 reinterpret_cast<const sockaddr*>(&target), sizeof target));
  }
  const std::vector<std::string>& Received() override {
    std::array<char, 65536> buffer;
    int read = 0;
    while ((read = recv(socket_.Number(), buffer.data(), buffer.size(), 0)) >= 0)
      received_.emplace_back(buffer.data(), static_cast<std::size_t>(read));
    return received_;
  }

 private:
  OwnedSocket socket_ = BoundSocket(SOCK_DGRAM);
  std::vector<std::string> received_;
};

class RealWorld : private Started, public World {
 public:
  RealWorld() : World(std::make_unique<platform::windows::WindowsLoop>()) {}

  std::string WhyNot(const std::string& test) const override {
    return platform::windows::WineDeviationIn(test);
  }
  platform::Sockets& Sockets() override { return sockets_; }
  platform::HostNames& Names() override { return names_; }
  std::unique_ptr<FarServer> Listen() override { return std::make_unique<RealFarServer>(); }
  std::unique_ptr<FarEnd> Dial(std::int32_t port) override {
    OwnedSocket dialled(socket(AF_INET, SOCK_STREAM, 0));
    const sockaddr_in target = Loopback(port);
    Check(connect(dialled.Number(), reinterpret_cast<const sockaddr*>(&target), sizeof target));
    return std::make_unique<RealFarEnd>(std::move(dialled));
  }
  std::unique_ptr<FarDatagrams> OpenDatagrams() override { return std::make_unique<RealFarDatagrams>(); }
  std::int32_t ClosedPort() override { return PortOf(BoundSocket(SOCK_STREAM)); }
  bool Until(const std::function<bool()>& condition) override { return desktop_.WaitFor(condition, 40'000); }
  void Settle() override {
    desktop_.WaitFor([] { return false; }, 30);
  }

 private:
  platform::windows::WindowsLoop& desktop_ = static_cast<platform::windows::WindowsLoop&>(Desktop);
  platform::windows::SocketLibrary library_;
  platform::windows::WindowsHostNames names_{library_};
  platform::windows::WindowsSockets sockets_{desktop_, library_};
};

} // namespace

std::unique_ptr<World> MakeRealWorld() { return std::make_unique<RealWorld>(); }

} // namespace quendra::foundation
