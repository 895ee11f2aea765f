#include "platform/remote_access/RemoteAccessBehaviour.h"
#include "platform/windows/remote_access/StandInRemoteAccess.h"

namespace quendra::platform {
namespace {

class WindowsRemoteAccessBackend : public RemoteAccessBackend {
 public:
  explicit WindowsRemoteAccessBackend(bool connects)
      : ras_(connects ? "*: 0 1 5 14 8192" : "*: 0 1 5 20ms 691"), connects_(connects) {}

  PhoneBook& Book() override { return ras_.Book; }
  Dialling& Dials() override { return ras_.Dials; }
  forms::headless::HeadlessDesktop& Desktop() override { return ras_.Desktop; }
  bool Until(const std::function<bool()>& condition) override { return ras_.Until(condition); }
  bool Connects() const override { return connects_; }

 private:
  windows::StandInRemoteAccess ras_;
  const bool connects_;
};

std::unique_ptr<RemoteAccessBackend> MakeConnecting(std::string&) {
  return std::make_unique<WindowsRemoteAccessBackend>(true);
}
std::unique_ptr<RemoteAccessBackend> MakeFailing(std::string&) {
  return std::make_unique<WindowsRemoteAccessBackend>(false);
}

INSTANTIATE_TEST_SUITE_P(Windows, RemoteAccessBehaviourTest,
                         testing::Values(RemoteAccessKind{"StandIn", MakeConnecting},
                                         RemoteAccessKind{"StandInWithoutALine", MakeFailing}),
                         [](const auto& tested) { return tested.param.name; });

} // namespace
} // namespace quendra::platform
