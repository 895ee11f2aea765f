#pragma once

#include "forms/headless/HeadlessDesktop.h"
#include "foundation/CSocketPlus.h"

#include <memory>
#include <string>
#include <vector>

namespace quendra::foundation {

/// The far end of a connection, outside the program.
class FarEnd {
 public:
  virtual ~FarEnd() = default;
  virtual void Send(const std::string& bytes) = 0;
  virtual void Close() = 0;
  virtual void Reset() = 0;
  /// All that came so far.
  virtual const std::string& Received() = 0;
  /// The program's end has gone.
  virtual bool Ended() = 0;
};

/// Somebody outside the program who listens.
class FarServer {
 public:
  virtual ~FarServer() = default;
  virtual std::int32_t Port() = 0;
  /// The next connection, nullptr while there is none.
  virtual std::unique_ptr<FarEnd> TakeConnection() = 0;
};

/// Somebody outside the program with a datagram socket.
class FarDatagrams {
 public:
  virtual ~FarDatagrams() = default;
  virtual std::int32_t Port() = 0;
  virtual void SendTo(std::int32_t port, const std::string& bytes) = 0;
  /// What came, one text a datagram.
  virtual const std::vector<std::string>& Received() = 0;
};

/// A network that the program's sockets live in: a simulated one, or this machine's loopback.
class World {
 public:
  explicit World(std::unique_ptr<forms::headless::HeadlessDesktop> desktop)
      : desktop_(std::move(desktop)), Desktop(*desktop_) {}
  virtual ~World() = default;

  /// Why a test, "Suite.Name", can't be passed in it; empty for most.
  virtual std::string WhyNot(const std::string& /*test*/) const { return {}; }
  virtual platform::Sockets& Sockets() = 0;
  virtual platform::HostNames& Names() = 0;
  virtual std::unique_ptr<FarServer> Listen() = 0;
  virtual std::unique_ptr<FarEnd> Dial(std::int32_t port) = 0;
  virtual std::unique_ptr<FarDatagrams> OpenDatagrams() = 0;
  /// A port of this machine where nobody listens.
  virtual std::int32_t ClosedPort() = 0;
  /// Lets the loop run until the condition holds; false when it doesn't in time.
  virtual bool Until(const std::function<bool()>& condition) = 0;
  /// Lets all happen that is under way.
  virtual void Settle() = 0;

 private:
  std::unique_ptr<forms::headless::HeadlessDesktop> desktop_;

 public:
  forms::headless::HeadlessDesktop& Desktop;
};

using MakeWorld = std::unique_ptr<World> (*)();
std::unique_ptr<World> MakeSimulatedWorld();
std::unique_ptr<World> MakeRealWorld();

/// An object in a world, with a record of its events: "Connect 1", "DataArrival 1 5", "Error 1 10061 source".
class Program {
 public:
  explicit Program(World& world)
      : world_(world), module(world.Sockets(), world.Names(), world.Desktop),
        sockets_(std::make_unique<CSocketPlus>(module)) {
    Record(*sockets_);
  }

  CSocketPlus& operator*() { return *sockets_; }
  CSocketPlus* operator->() { return sockets_.get(); }
  void End() { sockets_.reset(); }
  void Record(CSocketPlus& sockets);
  bool Saw(const std::string& event) const;
  bool Until(const std::string& event) {
    return world_.Until([&] { return Saw(event); });
  }
  /// Takes what waits at an index as bytes of text.
  std::string Take(const Variant& index);

 private:
  World& world_;

 public:
  std::vector<std::string> Events;
  modSocketPlus module;

 private:
  std::unique_ptr<CSocketPlus> sockets_;
};

/// What a fault says: "40020 description [source]"; empty without one.
std::string FaultText(const std::function<void()>& work);
std::string NameOf(const Variant& index);
ByteArray BytesFrom(const std::string& text);

} // namespace quendra::foundation
