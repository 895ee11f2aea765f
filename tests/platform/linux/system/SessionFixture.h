#pragma once

#include "platform/linux/LinuxFixture.h"

#include <gtest/gtest.h>

#include <memory>

namespace quendra::platform::linux_ {

/// A session of the test's own: what its environment tells, the programs that it has and a bus for itself.
class SessionTest : public testing::Test {
 protected:
  /// No program, no bus, no display.
  SessionTest();

  /// A program of the session that writes down what it is given.
  void AddProgram(const std::string& name);
  /// Waits for the program, long on a machine that is busy; "not started" when it isn't.
  std::string GivenTo(const std::string& name);
  /// Within two seconds.
  bool WasStarted(const std::string& name);

  /// Starts the session's bus. A service that `AddService` tells of can be started by it.
  void StartBus();
  /// Runs a stand-in for a service on the bus; returns when it can be asked.
  void StartService(const std::string& arguments);
  /// One that the bus starts when it is first asked; to be told of before the bus is started.
  void AddService(const std::string& name, const std::string& arguments);
  /// What the service was asked, a line each.
  std::string Asked();

  TemporaryFolder folder;
  Environment environment;

 private:
  std::string Log() { return folder / "asked"; }
  std::string StandIn(const std::string& arguments);

  std::unique_ptr<Child> bus_;
  std::vector<std::unique_ptr<Child>> services_;
};

} // namespace quendra::platform::linux_
