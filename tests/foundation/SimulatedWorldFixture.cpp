#include "foundation/WorldFixture.h"
#include "platform/simulated/SimulatedMachine.h"

namespace quendra::foundation {

namespace {

using platform::simulated::SimulatedMachine;
using platform::simulated::SimulatedPeer;
using platform::simulated::SimulatedServer;

class SimulatedFarEnd : public FarEnd {
 public:
  explicit SimulatedFarEnd(std::shared_ptr<SimulatedPeer> peer) : peer_(std::move(peer)) {}
  ~SimulatedFarEnd() override { peer_->Close(); }
  void Send(const std::string& bytes) override { peer_->Send(bytes); }
  void Close() override { peer_->Close(); }
  void Reset() override { peer_->Reset(); }
  const std::string& Received() override { return peer_->Received; }
  bool Ended() override { return peer_->Ended; }

 private:
  std::shared_ptr<SimulatedPeer> peer_;
};

class SimulatedFarServer : public FarServer {
 public:
  SimulatedFarServer(SimulatedServer& server, std::int32_t port) : server_(server), port_(port) {
    // As on loopback: a sender that is faster than its reader has to wait now and then.
    server_.TakeAtMost(100'000);
  }
  std::int32_t Port() override { return port_; }
  std::unique_ptr<FarEnd> TakeConnection() override {
    if (taken_ == server_.Connections.size()) return nullptr;
    return std::make_unique<SimulatedFarEnd>(server_.Connections[taken_++]);
  }

 private:
  SimulatedServer& server_;
  std::int32_t port_;
  std::size_t taken_ = 0;
};

class SimulatedFarDatagrams : public FarDatagrams {
 public:
  SimulatedFarDatagrams(SimulatedMachine& machine, std::int32_t port) : machine_(machine), port_(port) {}
  std::int32_t Port() override { return port_; }
  void SendTo(std::int32_t port, const std::string& bytes) override {
    machine_.sockets.SendDatagram("127.0.0.1", static_cast<std::uint16_t>(port_),
                                  static_cast<std::uint16_t>(port), bytes);
  }
  const std::vector<std::string>& Received() override {
    received_.clear();
    for (const auto& sent : machine_.sockets.Datagrams)
      if (sent.to.port == port_) received_.push_back(sent.bytes);
    return received_;
  }

 private:
  SimulatedMachine& machine_;
  std::int32_t port_;
  std::vector<std::string> received_;
};

class SimulatedWorld : public World {
 public:
  SimulatedWorld() : machine_(Desktop) {
    machine_.hostNames.Addresses = {"127.0.0.1"};
    machine_.hostNames.Add("localhost", {"127.0.0.1"});
  }

  platform::Sockets& Sockets() override { return machine_.sockets; }
  platform::HostNames& Names() override { return machine_.hostNames; }
  std::unique_ptr<FarServer> Listen() override {
    const std::uint16_t port = ++lastPort_;
    return std::make_unique<SimulatedFarServer>(machine_.sockets.Listen("127.0.0.1", port), port);
  }
  std::unique_ptr<FarEnd> Dial(std::int32_t port) override {
    return std::make_unique<SimulatedFarEnd>(
        machine_.sockets.Dial(static_cast<std::uint16_t>(port), "127.0.0.1", ++lastPort_));
  }
  std::unique_ptr<FarDatagrams> OpenDatagrams() override {
    return std::make_unique<SimulatedFarDatagrams>(machine_, ++lastPort_);
  }
  std::int32_t ClosedPort() override { return 9; }
  bool Until(const std::function<bool()>& condition) override {
    for (int round = 0; round < 10'000; ++round) {
      if (condition()) return true;
      Desktop.PumpOnce();
    }
    return false;
  }
  void Settle() override { Desktop.RunUntilIdle(); }

 private:
  SimulatedMachine machine_;
  std::uint16_t lastPort_ = 7000;
};

} // namespace

std::unique_ptr<World> MakeSimulatedWorld() { return std::make_unique<SimulatedWorld>(); }

} // namespace quendra::foundation
