#pragma once

#include "platform/EventLoop.h"
#include "platform/Machine.h"

#include <cstdint>
#include <memory>
#include <string>

namespace quendra::platform {

/// A machine that a test can run on, and what the test must know of it.
class Backend {
 public:
  virtual ~Backend() = default;

  virtual Machine Operations() = 0;

  // The process that asks.
  virtual std::uint32_t OwnId() const = 0;
  virtual std::uint32_t OwnParent() const = 0;
  virtual std::string OwnName() const = 0;
  virtual std::string OwnPath() const = 0;
  /// An id that no process has.
  virtual std::uint32_t MissingId() const = 0;

  /// The asking process listens on 127.0.0.1; gives the port.
  virtual std::uint16_t Listen() = 0;
  /// The asking process connects to a port that it listens on; gives the port of the near end.
  virtual std::uint16_t Connect(std::uint16_t port) = 0;
};

std::unique_ptr<Backend> MakeSimulatedBackend();
std::unique_ptr<Backend> MakeLinuxBackend();

} // namespace quendra::platform
