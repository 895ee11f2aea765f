#include "forms/headless/posix/PolledDesktop.h"
#include "foundation/WorldFixture.h"
#include "platform/linux/net/LinuxHostNames.h"
#include "platform/linux/net/LinuxSockets.h"

#include <arpa/inet.h>
#include <fcntl.h>
#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <stdexcept>

namespace quendra::foundation {

namespace {

using platform::linux_::Descriptor;

sockaddr_in Loopback(std::int32_t port) {
  sockaddr_in address{};
  address.sin_family = AF_INET;
  address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
  address.sin_port = htons(static_cast<std::uint16_t>(port));
  return address;
}

void Check(std::int64_t result) {
  if (result < 0) throw std::runtime_error("a socket call of the test failed");
}

Descriptor BoundSocket(int type) {
  Descriptor descriptor(socket(AF_INET, type | SOCK_CLOEXEC, 0));
  const sockaddr_in any = Loopback(0);
  Check(bind(descriptor.Number(), reinterpret_cast<const sockaddr*>(&any), sizeof any));
  return descriptor;
}

std::int32_t PortOf(const Descriptor& descriptor) {
  sockaddr_in address{};
  socklen_t size = sizeof address;
  Check(getsockname(descriptor.Number(), reinterpret_cast<sockaddr*>(&address), &size));
  return ntohs(address.sin_port);
}

class RealFarEnd : public FarEnd {
 public:
  explicit RealFarEnd(Descriptor descriptor) : descriptor_(std::move(descriptor)) {
    Check(fcntl(descriptor_.Number(), F_SETFL, O_NONBLOCK));
  }
  void Send(const std::string& bytes) override {
    if (send(descriptor_.Number(), bytes.data(), bytes.size(), MSG_NOSIGNAL) !=
        static_cast<ssize_t>(bytes.size()))
      throw std::runtime_error("the far end can't send so much at once");
  }
  void Close() override { descriptor_ = Descriptor(); }
  void Reset() override {
    const linger forced{1, 0};
    setsockopt(descriptor_.Number(), SOL_SOCKET, SO_LINGER, &forced, sizeof forced);
    Close();
  }
  const std::string& Received() override {
    std::array<char, 65536> buffer;
    ssize_t read = 0;
    while (descriptor_ && (read = recv(descriptor_.Number(), buffer.data(), buffer.size(), 0)) > 0)
      received_.append(buffer.data(), static_cast<std::size_t>(read));
    if (descriptor_ && (read == 0 || (read < 0 && errno != EAGAIN))) ended_ = true;
    return received_;
  }
  bool Ended() override {
    Received();
    return ended_;
  }

 private:
  Descriptor descriptor_;
  std::string received_;
  bool ended_ = false;
};

class RealFarServer : public FarServer {
 public:
  RealFarServer() : descriptor_(BoundSocket(SOCK_STREAM | SOCK_NONBLOCK)) {
    Check(listen(descriptor_.Number(), 128));
  }
  std::int32_t Port() override { return PortOf(descriptor_); }
  std::unique_ptr<FarEnd> TakeConnection() override {
    Descriptor accepted(accept4(descriptor_.Number(), nullptr, nullptr, SOCK_CLOEXEC));
    return accepted ? std::make_unique<RealFarEnd>(std::move(accepted)) : nullptr;
  }

 private:
  Descriptor descriptor_;
};

class RealFarDatagrams : public FarDatagrams {
 public:
  std::int32_t Port() override { return PortOf(descriptor_); }
  void SendTo(std::int32_t port, const std::string& bytes) override {
    const sockaddr_in target = Loopback(port);
    Check(sendto(descriptor_.Number(), bytes.data(), bytes.size(), 0,
                 reinterpret_cast<const sockaddr*>(&target), sizeof target));
  }
  const std::vector<std::string>& Received() override {
    std::array<char, 65536> buffer;
    ssize_t read = 0;
    while ((read = recv(descriptor_.Number(), buffer.data(), buffer.size(), 0)) >= 0)
      received_.emplace_back(buffer.data(), static_cast<std::size_t>(read));
    return received_;
  }

 private:
  Descriptor descriptor_ = BoundSocket(SOCK_DGRAM | SOCK_NONBLOCK);
  std::vector<std::string> received_;
};

class RealWorld : public World {
 public:
  RealWorld() : World(std::make_unique<forms::headless::PolledDesktop>()) {}

  platform::Sockets& Sockets() override { return sockets_; }
  platform::HostNames& Names() override { return names_; }
  std::unique_ptr<FarServer> Listen() override { return std::make_unique<RealFarServer>(); }
  std::unique_ptr<FarEnd> Dial(std::int32_t port) override {
    Descriptor descriptor(socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0));
    const sockaddr_in target = Loopback(port);
    Check(connect(descriptor.Number(), reinterpret_cast<const sockaddr*>(&target), sizeof target));
    return std::make_unique<RealFarEnd>(std::move(descriptor));
  }
  std::unique_ptr<FarDatagrams> OpenDatagrams() override { return std::make_unique<RealFarDatagrams>(); }
  std::int32_t ClosedPort() override { return PortOf(BoundSocket(SOCK_STREAM)); }
  bool Until(const std::function<bool()>& condition) override { return desktop_.WaitFor(condition, 40'000); }
  void Settle() override {
    desktop_.WaitFor([] { return false; }, 30);
  }

 private:
  forms::headless::PolledDesktop& desktop_ = static_cast<forms::headless::PolledDesktop&>(Desktop);
  const platform::linux_::ProcFolder folder_;
  platform::linux_::LinuxHostNames names_{folder_};
  platform::linux_::LinuxSockets sockets_{desktop_, desktop_, names_};
};

} // namespace

std::unique_ptr<World> MakeRealWorld() { return std::make_unique<RealWorld>(); }

} // namespace quendra::foundation
