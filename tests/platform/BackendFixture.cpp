#include "platform/BackendFixture.h"

#include "forms/headless/posix/PolledDesktop.h"
#include "platform/linux/LinuxFixture.h"
#include "platform/linux/LinuxMachine.h"
#include "platform/linux/internet/CacheFilesFixture.h"
#include "platform/linux/system/Files.h"
#include "platform/simulated/SimulatedMachine.h"

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

class SimulatedFarEnd : public FarEnd {
 public:
  explicit SimulatedFarEnd(std::shared_ptr<simulated::SimulatedPeer> peer) : peer_(std::move(peer)) {}
  void Send(const std::string& bytes) override { peer_->Send(bytes); }
  void CloseSending() override { peer_->Close(); }
  void Reset() override { peer_->Reset(); }
  void Drain() override { peer_->Received.clear(); }

 private:
  std::shared_ptr<simulated::SimulatedPeer> peer_;
};

class SimulatedBackend : public Backend {
 public:
  SimulatedBackend() {
    machine_.AddProcess({.id = 4, .parent = 0, .name = "System"});
    machine_.AddProcess({.id = OwnId(), .parent = OwnParent(), .name = OwnName(), .path = OwnPath()});
    machine_.hostNames.Addresses = {"127.0.0.1", "10.0.0.7"};
    machine_.ipHelper.Adapters = {{"{1}", "Ethernet", {"10.0.0.7"}, {"10.0.0.138"}}};
    machine_.icmp.RouteTo("127.0.0.1").Target(0);
    machine_.ipHelper.Interfaces = {Interface(1, kLoopbackInterface), Interface(2, kEthernetInterface)};
    machine_.performanceData.SetProcessors({{u"0", 1000}, {u"_Total", 1000}}, 5);
    machine_.AddCaptureAdapter({"\\Device\\NPF_{1}", "Ethernet", "10.0.0.7"});
  }

  Machine Operations() override { return machine_.Operations(); }
  std::uint32_t OwnId() const override { return 1234; }
  std::uint32_t OwnParent() const override { return 4; }
  std::string OwnName() const override { return "quendra.exe"; }
  std::string OwnPath() const override { return "C:\\Program Files\\quendra.exe"; }
  std::uint32_t MissingId() const override { return 4321; }
  std::uint32_t StartWaiting() override {
    machine_.AddProcess({.id = ++lastStarted_, .parent = OwnId(), .name = "waiting.exe"});
    return lastStarted_;
  }
  bool HasEnded(std::uint32_t processId) override {
    Processes& processes = machine_.processes;
    const Handle process = processes.OpenProcess(1040, false, processId);
    if (process != kNoHandle) processes.CloseHandle(process);
    return process == kNoHandle;
  }
  void KeepInCache(const std::string& url) override { machine_.urlCache.Add(url); }
  std::optional<std::string> ContentOf(const std::string& path) override {
    const auto found = machine_.files.Contents.find(path);
    if (found == machine_.files.Contents.end()) return {};
    return found->second;
  }
  std::optional<std::string> Layout() const override { return machine_.keyboardLayout.Name; }
  std::uint16_t Listen() override {
    machine_.AddConnection({.state = 2, .localAddress = "127.0.0.1", .localPort = 1025, .owner = OwnId()});
    return 1025;
  }
  std::uint16_t Connect(std::uint16_t port) override {
    for (const bool near : {true, false})
      machine_.AddConnection({.state = 5,
                              .localAddress = "127.0.0.1",
                              .localPort = static_cast<std::uint16_t>(near ? 1026 : port),
                              .remoteAddress = "127.0.0.1",
                              .remotePort = static_cast<std::uint16_t>(near ? port : 1026),
                              .owner = OwnId()});
    return 1026;
  }
  forms::headless::HeadlessDesktop& Desktop() override { return desktop_; }
  SocketAddress Outside() override {
    // As on loopback: a sender that is faster than its reader has to wait now and then.
    server_.TakeAtMost(100'000);
    return {simulated::AddressOf("10.1.1.1"), 80};
  }
  std::unique_ptr<FarEnd> TakeConnection() override {
    if (taken_ == server_.Connections.size()) return nullptr;
    return std::make_unique<SimulatedFarEnd>(server_.Connections[taken_++]);
  }
  bool Until(const std::function<bool()>& condition) override {
    for (int round = 0; round < 10'000; ++round) {
      if (condition()) return true;
      desktop_.PumpOnce();
    }
    return false;
  }
  void Settle() override { desktop_.RunUntilIdle(); }

 private:
  static InterfaceRow Interface(std::uint32_t index, InterfaceKind kind) {
    InterfaceRow row;
    row.Set(InterfaceRow::kIndex, index);
    row.Set(InterfaceRow::kType, kind);
    return row;
  }

  std::uint32_t lastStarted_ = 2000;
  forms::headless::HeadlessDesktop desktop_;
  simulated::SimulatedMachine machine_{desktop_};
  simulated::SimulatedServer& server_ = machine_.sockets.Listen("10.1.1.1", 80);
  std::size_t taken_ = 0;
};

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

std::unique_ptr<Backend> MakeSimulatedBackend() { return std::make_unique<SimulatedBackend>(); }
std::unique_ptr<Backend> MakeLinuxBackend() { return std::make_unique<LinuxBackend>(); }

} // namespace quendra::platform
