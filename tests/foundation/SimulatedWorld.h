#pragma once

#include "foundation/WorldFixture.h"
#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

#include <optional>

namespace quendra::foundation {

class SimulatedWorld : public World {
 public:
  SimulatedWorld();

  platform::Sockets& Sockets() override { return Machine.sockets; }
  platform::HostNames& Names() override { return Machine.hostNames; }
  std::unique_ptr<FarServer> Listen() override;
  std::unique_ptr<FarEnd> Dial(std::int32_t port) override;
  std::unique_ptr<FarDatagrams> OpenDatagrams() override;
  std::int32_t ClosedPort() override { return 9; }
  bool Until(const std::function<bool()>& condition) override;
  void Settle() override { Desktop.RunUntilIdle(); }

  platform::simulated::SimulatedMachine Machine{Desktop};

 private:
  std::uint16_t lastPort_ = 7000;
};

/// One object on a simulated machine with a server at 10.1.1.1, port 80, that accepts and stays silent.
class SocketTest : public testing::Test {
 protected:
  void Add(const Variant& index, SocketProtocol protocol = sckTCPProtocol);
  void Connect(const Variant& index);
  platform::simulated::SimulatedSockets& Net() { return World.Machine.sockets; }
  platform::simulated::SimulatedPeer& Peer() { return *Server.Connections.back(); }
  void Settle() { World.Settle(); }
  using Events = std::vector<std::string>;

  SimulatedWorld World;
  platform::simulated::SimulatedServer& Server = World.Machine.sockets.Listen("10.1.1.1", 80);
  Program Object{World};
};

} // namespace quendra::foundation
