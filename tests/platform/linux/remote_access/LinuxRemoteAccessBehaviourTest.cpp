#include "forms/headless/posix/PolledDesktop.h"
#include "platform/linux/network_manager/PrivateBusFixture.h"
#include "platform/linux/remote_access/LinuxDialling.h"
#include "platform/linux/remote_access/LinuxPhoneBook.h"
#include "platform/remote_access/RemoteAccessBehaviour.h"

namespace quendra::platform {

namespace {

/// A NetworkManager of this system's packages, in namespaces of its own. Its lines lead nowhere.
class NetworkManagerBackend : public RemoteAccessBackend {
 public:
  NetworkManagerBackend() {
    if (!manager_.Start()) throw std::runtime_error("NetworkManager doesn't start: " + manager_.Log());
  }

  PhoneBook& Book() override { return phoneBook_; }
  Dialling& Dials() override { return dialling_; }
  forms::headless::HeadlessDesktop& Desktop() override { return desktop_; }
  bool Until(const std::function<bool()>& condition) override { return desktop_.WaitFor(condition, 20'000); }
  bool Connects() const override { return false; }

 private:
  linux_::RealNetworkManager manager_;
  forms::headless::PolledDesktop desktop_;
  linux_::NetworkManagerBus bus_{desktop_, desktop_};
  linux_::ConnectionBook book_{bus_};
  linux_::LinuxPhoneBook phoneBook_{book_, bus_};
  linux_::LinuxDialling dialling_{book_, bus_, desktop_};
};

std::unique_ptr<RemoteAccessBackend> MakeNetworkManager(std::string& whyNot) {
  whyNot = linux_::RealNetworkManager::Missing();
  return whyNot.empty() ? std::make_unique<NetworkManagerBackend>() : nullptr;
}

INSTANTIATE_TEST_SUITE_P(Linux, RemoteAccessBehaviourTest,
                         testing::Values(RemoteAccessKind{"NetworkManager", MakeNetworkManager}),
                         [](const auto& tested) { return tested.param.name; });

} // namespace

} // namespace quendra::platform
