#include "platform/BackendFixture.h"
#include "platform/simulated/SimulatedMachine.h"

#include <utility>

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

} // namespace

std::unique_ptr<Backend> MakeSimulatedBackend() { return std::make_unique<SimulatedBackend>(); }

} // namespace quendra::platform
