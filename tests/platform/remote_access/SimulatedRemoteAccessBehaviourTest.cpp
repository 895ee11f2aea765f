#include "platform/remote_access/RemoteAccessBehaviour.h"
#include "platform/simulated/SimulatedMachine.h"

namespace quendra::platform {
namespace {

/// The simulated machine, whose dials connect or are refused as by a wrong password.
class SimulatedRemoteAccessBackend : public RemoteAccessBackend {
 public:
  explicit SimulatedRemoteAccessBackend(bool connects) : connects_(connects) {
    machine_.ras.Devices = {{"pppoe", "pppoe"}, {"vpn", "vpn"}};
    if (connects) return;
    for (const char* name : {"Home", "Other"}) machine_.ras.Dial(name).Then(0).Then(5).ThenError(691);
  }
  PhoneBook& Book() override { return machine_.ras; }
  Dialling& Dials() override { return machine_.ras; }
  forms::headless::HeadlessDesktop& Desktop() override { return desktop_; }
  bool Until(const std::function<bool()>& condition) override {
    for (int round = 0; round < 1000 && !condition(); ++round) desktop_.PumpOnce();
    return condition();
  }
  bool Connects() const override { return connects_; }

 private:
  forms::headless::HeadlessDesktop desktop_;
  simulated::SimulatedMachine machine_{desktop_};
  const bool connects_;
};

std::unique_ptr<RemoteAccessBackend> MakeConnecting(std::string&) {
  return std::make_unique<SimulatedRemoteAccessBackend>(true);
}
std::unique_ptr<RemoteAccessBackend> MakeFailing(std::string&) {
  return std::make_unique<SimulatedRemoteAccessBackend>(false);
}

INSTANTIATE_TEST_SUITE_P(, RemoteAccessBehaviourTest,
                         testing::Values(RemoteAccessKind{"Simulated", MakeConnecting},
                                         RemoteAccessKind{"SimulatedWithoutALine", MakeFailing}),
                         [](const auto& tested) { return tested.param.name; });

} // namespace
} // namespace quendra::platform
