#include "foundation/SimulatedWorld.h"

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
    for (const auto& sent : machine_.sockets.Datagrams())
      if (sent.to.port == port_) received_.push_back(sent.bytes);
    return received_;
  }

 private:
  SimulatedMachine& machine_;
  std::int32_t port_;
  std::vector<std::string> received_;
};

} // namespace

SimulatedWorld::SimulatedWorld() : World(std::make_unique<forms::headless::HeadlessDesktop>()) {
  Machine.hostNames.Addresses = {"127.0.0.1"};
  Machine.hostNames.Add("localhost", {"127.0.0.1"});
}

std::unique_ptr<FarServer> SimulatedWorld::Listen() {
  const std::uint16_t port = ++lastPort_;
  return std::make_unique<SimulatedFarServer>(Machine.sockets.Listen("127.0.0.1", port), port);
}

std::unique_ptr<FarEnd> SimulatedWorld::Dial(std::int32_t port) {
  return std::make_unique<SimulatedFarEnd>(
      Machine.sockets.Dial(static_cast<std::uint16_t>(port), "127.0.0.1", ++lastPort_));
}

std::unique_ptr<FarDatagrams> SimulatedWorld::OpenDatagrams() {
  return std::make_unique<SimulatedFarDatagrams>(Machine, ++lastPort_);
}

bool SimulatedWorld::Until(const std::function<bool()>& condition) {
  for (int round = 0; round < 10'000; ++round) {
    if (condition()) return true;
    Desktop.PumpOnce();
  }
  return false;
}

std::unique_ptr<World> MakeSimulatedWorld() { return std::make_unique<SimulatedWorld>(); }

} // namespace quendra::foundation
