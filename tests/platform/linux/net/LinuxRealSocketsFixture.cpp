#include "forms/headless/posix/PolledDesktop.h"
#include "platform/linux/net/LinuxHostNames.h"
#include "platform/linux/net/LinuxSockets.h"
#include "platform/net/RealSocketsFixture.h"

namespace quendra::platform {

namespace {

class LinuxRealSockets : public RealSockets {
 public:
  Sockets& Operations() override { return sockets_; }
  forms::headless::HeadlessDesktop& Desktop() override { return desktop_; }
  bool WaitFor(const std::function<bool()>& condition, int realMilliseconds) override {
    return desktop_.WaitFor(condition, realMilliseconds);
  }

 private:
  forms::headless::PolledDesktop desktop_;
  const linux_::ProcFolder folder_;
  linux_::LinuxHostNames hostNames_{folder_};
  linux_::LinuxSockets sockets_{desktop_, desktop_, hostNames_};
};

} // namespace

std::unique_ptr<RealSockets> MakeRealSockets() { return std::make_unique<LinuxRealSockets>(); }

} // namespace quendra::platform
