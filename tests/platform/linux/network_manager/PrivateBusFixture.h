#pragma once

#include "platform/linux/LinuxFixture.h"

#include <memory>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// A system's bus of the test's own, which everybody may use for everything, and services on it.
class PrivateBus {
 public:
  PrivateBus();

  /// False when it doesn't start.
  bool Start();
  void Stop() { bus_.reset(); }

  std::string Address() const { return "unix:path=" + (folder / "bus"); }

  TemporaryFolder folder;
  Environment environment;

 private:
  std::unique_ptr<Child> bus_;
};

/// A NetworkManager from this system's packages, on a bus and in namespaces of the test's own, so that it
/// touches nothing of this machine. It has two Ethernet links that lead to each other.
class RealNetworkManager {
 public:
  /// Why it can't run here; empty where it can.
  static std::string Missing();

  /// `links` are commands that make its network before it starts.
  explicit RealNetworkManager(std::string links = kTwoLinks);

  /// False when it doesn't come up. It keeps its connections from one start to the next.
  bool Start();
  void Kill() { manager_.reset(); }
  void StopForAWhile() const;
  void GoOn() const;

  /// What nmcli prints, errors too.
  std::string Nmcli(const std::string& arguments) const;
  /// The same, asked again a few times while `text` isn't in it: nmcli shows no secrets of a connection when
  /// it is told of the connection's last change while it reads.
  std::string NmcliWith(const std::string& text, const std::string& arguments) const;
  /// What a command of the shell prints in its network.
  std::string InItsNetwork(const std::string& command) const;
  std::string Log() const;
  /// Where it keeps its connections.
  std::string ConnectionFolder() const { return bus.folder / "connections"; }

  static constexpr const char* kTwoLinks =
      "ip link add qn0 type veth peer name qn1 && ip link set qn0 up && ip link set qn1 up";

  PrivateBus bus;

 private:
  std::unique_ptr<Child> manager_;
};

/// What a command of the shell prints.
std::string OutputOf(const std::string& command);

} // namespace quendra::platform::linux_
