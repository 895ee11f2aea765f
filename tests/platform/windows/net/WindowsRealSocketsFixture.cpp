#include "platform/net/RealSocketsFixture.h"
#include "platform/windows/WindowsLoopFixture.h"
#include "platform/windows/WineDeviations.h"
#include "platform/windows/net/WindowsSockets.h"

namespace quendra::platform {

namespace {

class WindowsRealSockets : public RealSockets {
 public:
  Sockets& Operations() override { return sockets_; }
  forms::headless::HeadlessDesktop& Desktop() override { return desktop_; }
  bool WaitFor(const std::function<bool()>& condition, int realMilliseconds) override {
    return desktop_.WaitFor(condition, realMilliseconds);
  }
  std::string WhyNot(const std::string& test) const override { return windows::WineDeviationIn(test); }

 private:
  windows::WindowsLoop desktop_;
  const windows::SocketLibrary library_;
  windows::WindowsSockets sockets_{desktop_, library_};
};

} // namespace

std::unique_ptr<RealSockets> MakeRealSockets() { return std::make_unique<WindowsRealSockets>(); }

} // namespace quendra::platform
