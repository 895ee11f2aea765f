#pragma once

#include "forms/headless/HeadlessDesktop.h"
#include "platform/Machine.h"
#include "platform/net/Sockets.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace quendra::platform {

/// The far end of a connection, outside the machine.
class FarEnd {
 public:
  virtual ~FarEnd() = default;
  virtual void Send(const std::string& bytes) = 0;
  /// Nothing more comes from there; what comes there is still taken.
  virtual void CloseSending() = 0;
  virtual void Reset() = 0;
  /// Takes what has come so far and drops it.
  virtual void Drain() = 0;
};

/// A machine that a test can run on, and what the test must know of it.
class Backend {
 public:
  virtual ~Backend() = default;

  virtual Machine Operations() = 0;
  /// Why a test, "Suite.Name", can't be passed on this machine through no fault of ours; empty for most.
  virtual std::string WhyNot(const std::string& /*test*/) const { return {}; }

  // The process that asks.
  virtual std::uint32_t OwnId() const = 0;
  virtual std::uint32_t OwnParent() const = 0;
  virtual std::string OwnName() const = 0;
  virtual std::string OwnPath() const = 0;
  /// An id that no process has.
  virtual std::uint32_t MissingId() const = 0;

  /// Starts a process that waits to be ended, and says whether one has ended.
  virtual std::uint32_t StartWaiting() = 0;
  virtual bool HasEnded(std::uint32_t processId) = 0;

  /// A browser has kept what it loaded from there.
  virtual void KeepInCache(const std::string& url) = 0;
  /// What a file holds that has a path as the machine names it; nothing where there is no such file.
  virtual std::optional<std::string> ContentOf(const std::string& path) = 0;
  /// The layout with which the user types now; nothing where the machine can't tell it.
  virtual std::optional<std::string> Layout() const = 0;

  /// The asking process listens on 127.0.0.1; gives the port.
  virtual std::uint16_t Listen() = 0;
  /// The asking process connects to a port that it listens on; gives the port of the near end.
  virtual std::uint16_t Connect(std::uint16_t port) = 0;

  // The network, for the machine's sockets. Their messages go to the desktop's windows.

  virtual forms::headless::HeadlessDesktop& Desktop() = 0;
  /// Where somebody outside listens.
  virtual SocketAddress Outside() = 0;
  /// The next connection that came there; nullptr while there is none.
  virtual std::unique_ptr<FarEnd> TakeConnection() = 0;
  /// Waits for what the machine does on its own; false when it doesn't come.
  virtual bool Until(const std::function<bool()>& condition) = 0;
  /// Lets all happen that is under way.
  virtual void Settle() = 0;
};

struct Kind {
  const char* name;
  std::unique_ptr<Backend> (*make)();
};

std::unique_ptr<Backend> MakeSimulatedBackend();
/// The machine of the system that the tests are built for, under that system's name.
Kind KindOfThisSystem();

/// A test that runs over each backend.
struct BackendTest : testing::TestWithParam<Kind> {
  void SetUp() override;

  std::unique_ptr<Backend> backend = GetParam().make();
  Machine machine = backend->Operations();
};

/// For suites that derive from BackendTest.
inline const auto kEveryBackend =
    testing::Values(Kind{"Simulated", MakeSimulatedBackend}, KindOfThisSystem());
inline std::string NameOfBackend(const testing::TestParamInfo<Kind>& tested) { return tested.param.name; }

} // namespace quendra::platform
