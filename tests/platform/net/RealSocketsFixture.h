#pragma once

#include "forms/headless/HeadlessDesktop.h"
#include "platform/net/Sockets.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <memory>
#include <vector>

namespace quendra::platform {

/// The sockets of the system that the tests run on, and a loop in which real time passes.
class RealSockets {
 public:
  virtual ~RealSockets() = default;

  virtual Sockets& Operations() = 0;
  virtual forms::headless::HeadlessDesktop& Desktop() = 0;
  virtual bool WaitFor(const std::function<bool()>& condition, int realMilliseconds) = 0;
  /// Why a test, "Suite.Name", can't be passed on this system through no fault of ours; empty for most.
  virtual std::string WhyNot(const std::string& /*test*/) const { return {}; }
};
std::unique_ptr<RealSockets> MakeRealSockets();

inline constexpr std::uint32_t kLoopbackNumber = 0x7F000001;
inline constexpr std::uint32_t kMessage = 32769;
inline constexpr std::uint32_t kNameMessage = 32768;
inline constexpr std::int32_t kAllEvents = 59;

struct Seen {
  SocketHandle socket;
  std::int32_t event;
  std::int32_t error;
  friend bool operator==(const Seen&, const Seen&) = default;
};

/// Two sockets of the library that talk to each other over loopback, and a window that writes down what it is
/// told.
class RealSocketsTest : public testing::Test {
 protected:
  RealSocketsTest() {
    window_ = own_->Desktop().Windows.Create();
    using Procedure = forms::WindowProcedure::element_type;
    own_->Desktop().Windows.Replace(
        window_, std::make_shared<Procedure>([this](auto, std::uint32_t message, std::uint32_t wParam,
                                                    std::uint32_t lParam) {
          const auto high = static_cast<std::int32_t>(lParam >> 16);
          if (message == kMessage)
            seen.push_back({SocketHandle(wParam), static_cast<std::int32_t>(lParam & 0xFFFF), high});
          if (message == kNameMessage) names.push_back({SocketHandle(wParam), 0, high});
          return 0;
        }));
    sockets.WSAStartup(257);
  }
  void SetUp() override {
    const testing::TestInfo& test = *testing::UnitTest::GetInstance()->current_test_info();
    const std::string why = own_->WhyNot(std::string(test.test_suite_name()) + "." + test.name());
    if (!why.empty()) GTEST_SKIP() << why;
  }
  static SocketAddress At(std::uint16_t port) { return {Ipv4Address::FromHost(kLoopbackNumber), port}; }

  SocketHandle NewSocket(std::int32_t type = 1) { return sockets.socket(2, type, type == 1 ? 6 : 17); }
  void Select(SocketHandle socket, std::int32_t events = kAllEvents) {
    ASSERT_EQ(sockets.WSAAsyncSelect(socket, window_, kMessage, events), 0);
  }
  SocketHandle Listen(std::int32_t backlog = 5) {
    const SocketHandle listener = NewSocket();
    EXPECT_EQ(sockets.bind(listener, At(0)), 0);
    Select(listener);
    EXPECT_EQ(sockets.listen(listener, backlog), 0);
    return listener;
  }
  std::uint16_t PortOf(SocketHandle socket) {
    SocketAddress local;
    EXPECT_EQ(sockets.getsockname(socket, local), 0);
    return local.port;
  }
  bool Until(const std::function<bool()>& condition) { return own_->WaitFor(condition, 10'000); }
  int Count(SocketHandle socket, std::int32_t event, std::int32_t error = 0) {
    return static_cast<int>(std::count(seen.begin(), seen.end(), Seen{socket, event, error}));
  }
  bool Saw(SocketHandle socket, std::int32_t event, std::int32_t error = 0) {
    return Until([&] { return Count(socket, event, error) > 0; });
  }
  void Settle() {
    own_->WaitFor([] { return false; }, 30);
  }
  /// Connects `near` and `far`, with nothing seen yet.
  void Pair() {
    const SocketHandle listener = Listen();
    near = NewSocket();
    Select(near);
    sockets.connect(near, At(PortOf(listener)));
    ASSERT_TRUE(Saw(listener, kFdAccept));
    far = sockets.accept(listener);
    ASSERT_TRUE(Saw(near, kFdConnect));
    ASSERT_TRUE(Saw(far, kFdWrite));
    sockets.closesocket(listener);
    Settle();
    seen.clear();
  }
  std::int32_t Send(SocketHandle socket, const std::string& text) {
    return sockets.send(socket, {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()}, 0);
  }
  std::string Read(SocketHandle socket, std::size_t size, std::int32_t flags = 0) {
    std::string text(size, ' ');
    const std::int32_t read =
        sockets.recv(socket, {reinterpret_cast<std::uint8_t*>(text.data()), size}, flags);
    return read < 0 ? "error " + std::to_string(sockets.WSAGetLastError())
                    : text.substr(0, static_cast<std::size_t>(read));
  }
  int LastError() { return sockets.WSAGetLastError(); }

 private:
  const std::unique_ptr<RealSockets> own_ = MakeRealSockets();
  forms::WindowHandle window_;

 protected:
  forms::WindowHandle Window() const { return window_; }
  Sockets& sockets = own_->Operations();
  std::vector<Seen> seen;
  std::vector<Seen> names;
  SocketHandle near = kNoSocket;
  SocketHandle far = kNoSocket;
};

} // namespace quendra::platform
