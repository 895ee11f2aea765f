#include "forms/headless/posix/PolledDesktop.h"
#include "platform/BackendFixture.h"
#include "platform/linux/LinuxFixture.h"
#include "platform/linux/LinuxMachine.h"
#include "platform/linux/internet/CacheFilesFixture.h"
#include "platform/linux/system/Files.h"

#include <arpa/inet.h>
#include <fcntl.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <filesystem>
#include <fstream>
#include <stdexcept>
#include <utility>
#include <vector>

namespace quendra::platform {

namespace {

void Check(int result) {
  if (result < 0) throw std::runtime_error("a socket call on loopback failed");
}

class RealFarEnd : public FarEnd {
 public:
  explicit RealFarEnd(int socket) : socket_(socket) {}
  ~RealFarEnd() override { close(socket_); }
  void Send(const std::string& bytes) override {
    if (send(socket_, bytes.data(), bytes.size(), MSG_NOSIGNAL) != static_cast<ssize_t>(bytes.size()))
      throw std::runtime_error("the far end can't send so much at once");
  }
  void CloseSending() override { Check(shutdown(socket_, SHUT_WR)); }
  void Reset() override {
    const linger forced{1, 0};
    Check(setsockopt(socket_, SOL_SOCKET, SO_LINGER, &forced, sizeof forced));
    close(std::exchange(socket_, -1));
  }
  void Drain() override {
    std::array<char, 65536> buffer;
    while (recv(socket_, buffer.data(), buffer.size(), MSG_DONTWAIT) > 0) {
    }
  }

 private:
  int socket_;
};

/// What the user of this machine keeps is left alone: registry and caches are in a folder of the test, no
/// display tells a layout and no network manager is asked.
class LinuxBackend : public Backend {
 public:
  LinuxBackend() {
    environment_.Set("XDG_DATA_HOME", folder_ / "data");
    environment_.Set("XDG_CACHE_HOME", folder_ / "cache");
    environment_.Set("DBUS_SYSTEM_BUS_ADDRESS", "unix:path=" + (folder_ / "no-bus"));
    for (const char* name : {"DISPLAY", "XDG_SESSION_TYPE"}) environment_.Set(name, {});
    machine_.emplace(loop_, loop_);
  }
  ~LinuxBackend() override {
    for (const int socket : sockets_) close(socket);
  }

  Machine Operations() override { return machine_->Operations(); }
  std::uint32_t OwnId() const override { return static_cast<std::uint32_t>(getpid()); }
  std::uint32_t OwnParent() const override { return static_cast<std::uint32_t>(getppid()); }
  std::string OwnName() const override { return std::filesystem::path(OwnPath()).filename(); }
  std::string OwnPath() const override { return std::filesystem::read_symlink("/proc/self/exe"); }
  std::uint32_t MissingId() const override {
    // Ids run from 1 to below this number.
    std::uint32_t limit = 0;
    std::ifstream("/proc/sys/kernel/pid_max") >> limit;
    return limit + 1;
  }
  std::uint32_t StartWaiting() override {
    started_.push_back(std::make_unique<linux_::Child>([] { return std::string(); }));
    return static_cast<std::uint32_t>(started_.back()->Id());
  }
  bool HasEnded(std::uint32_t processId) override {
    siginfo_t ending{};
    return linux_::Wait([&] {
      return waitid(P_PID, processId, &ending, WEXITED | WNOHANG | WNOWAIT) == 0 && ending.si_pid != 0;
    });
  }
  void KeepInCache(const std::string& url) override {
    std::string name = std::to_string(++cached_);
    name.insert(0, 40 - name.size(), '0');
    folder_.Write("cache/mozilla/firefox/profile/cache2/entries/" + name, linux_::FirefoxFile(":" + url));
  }
  std::optional<std::string> ContentOf(const std::string& path) override {
    std::string file = path.substr(std::string("C:").size());
    std::ranges::replace(file, '\\', '/');
    return linux_::ReadFile(folder_ / "data/quendra/drive_c" + file, 1'000'000);
  }
  std::optional<std::string> Layout() const override { return {}; }
  std::uint16_t Listen() override {
    const int socket = NewSocket();
    const sockaddr_in any = Loopback(0);
    Check(bind(socket, reinterpret_cast<const sockaddr*>(&any), sizeof any));
    Check(listen(socket, 1));
    return PortOf(socket);
  }
  std::uint16_t Connect(std::uint16_t port) override {
    const int socket = NewSocket();
    const sockaddr_in target = Loopback(port);
    Check(connect(socket, reinterpret_cast<const sockaddr*>(&target), sizeof target));
    sockets_.push_back(accept(sockets_.front(), nullptr, nullptr));
    Check(sockets_.back());
    return PortOf(socket);
  }
  forms::headless::HeadlessDesktop& Desktop() override { return loop_; }
  SocketAddress Outside() override {
    const std::uint16_t port = Listen();
    Check(fcntl(sockets_.back(), F_SETFL, O_NONBLOCK));
    return {Ipv4Address::FromHost(INADDR_LOOPBACK), port};
  }
  std::unique_ptr<FarEnd> TakeConnection() override {
    const int taken = accept4(sockets_.back(), nullptr, nullptr, SOCK_CLOEXEC);
    return taken < 0 ? nullptr : std::make_unique<RealFarEnd>(taken);
  }
  bool Until(const std::function<bool()>& condition) override { return loop_.WaitFor(condition, 10'000); }
  void Settle() override {
    loop_.WaitFor([] { return false; }, 30);
  }

 private:
  static sockaddr_in Loopback(std::uint16_t port) {
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    address.sin_port = htons(port);
    return address;
  }
  int NewSocket() {
    sockets_.push_back(socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0));
    Check(sockets_.back());
    return sockets_.back();
  }
  static std::uint16_t PortOf(int socket) {
    sockaddr_in address{};
    socklen_t size = sizeof address;
    Check(getsockname(socket, reinterpret_cast<sockaddr*>(&address), &size));
    return ntohs(address.sin_port);
  }

  linux_::TemporaryFolder folder_;
  linux_::Environment environment_;
  forms::headless::PolledDesktop loop_;
  std::optional<linux_::LinuxMachine> machine_;
  std::vector<std::unique_ptr<linux_::Child>> started_;
  int cached_ = 0;
  std::vector<int> sockets_;
};

} // namespace

Kind KindOfThisSystem() {
  return {"Linux", []() -> std::unique_ptr<Backend> { return std::make_unique<LinuxBackend>(); }};
}

} // namespace quendra::platform
