#pragma once

#include "TestName.h"
#include "foundation/WorldFixture.h"

#include "runtime/Fault.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <stdexcept>

namespace quendra::foundation {

/// One suite of behaviour for the simulated network and for real sockets on loopback.
class SocketSuite : public testing::TestWithParam<MakeWorld> {
 protected:
  void SetUp() override {
    const std::string why = world->WhyNot(NameOfTest(*testing::UnitTest::GetInstance()->current_test_info()));
    if (!why.empty()) GTEST_SKIP() << why;
  }
  /// An index that is connected, and the far end of its connection.
  std::unique_ptr<FarEnd> Connected(const Variant& index = 1) {
    program->ArrayAdd(index);
    program->Connect(index, Text(u"127.0.0.1"), server->Port());
    if (!program.Until("Connect " + NameOf(index))) throw std::runtime_error("no connection");
    std::unique_ptr<FarEnd> far;
    if (!world->Until([&] { return (far = server->TakeConnection()) != nullptr; }))
      throw std::runtime_error("nobody came");
    return far;
  }
  /// An index that listens; its port.
  std::int32_t Listening(const Variant& index) {
    program->ArrayAdd(index);
    program->Listen(index);
    return program->LocalPort(index);
  }
  int FaultOf(const std::function<void()>& work) {
    try {
      work();
    } catch (const Fault& fault) {
      return fault.number;
    }
    return 0;
  }
  bool UntilReceived(FarEnd& far, const std::string& bytes) {
    return world->Until([&] { return far.Received() == bytes; });
  }
  bool UntilState(const Variant& index, SocketState state) {
    return world->Until([&] { return program->State(index) == state; });
  }

  std::unique_ptr<World> world = GetParam()();
  Program program{*world};
  std::unique_ptr<FarServer> server = world->Listen();
};

inline std::string NameOfWorld(const testing::TestParamInfo<MakeWorld>& world) {
  return world.index == 0 ? "Simulated" : "Real";
}

/// Runs a suite over the simulated network and over real sockets on loopback.
#define QUENDRA_OVER_BOTH_NETWORKS(suite)                                                                    \
  INSTANTIATE_TEST_SUITE_P(OverBothNetworks, suite, testing::Values(&MakeSimulatedWorld, &MakeRealWorld),    \
                           NameOfWorld)

} // namespace quendra::foundation
