#include "platform/windows/net/WindowsSockets.h"

#include "platform/windows/WindowsLoopFixture.h"
#include "platform/windows/net/NetworkEndsFixture.h"

#include <gtest/gtest.h>

#include <array>
#include <optional>

namespace quendra::platform::windows {

namespace {

/// Whom the library was asked to tell of a socket.
struct Selected {
  SOCKET socket = INVALID_SOCKET;
  HWND window = nullptr;
  UINT message = 0;
};
std::optional<Selected> selected;
decltype(&::ioctlsocket) setMode = nullptr;

/// In place of the library's: the test tells the events itself.
int WSAAPI Keep(SOCKET socket, HWND window, unsigned message, long) {
  selected = Selected{socket, window, message};
  u_long isOn = 1;
  return setMode(socket, static_cast<long>(FIONBIO), &isOn);
}

/// Whom the library was asked to tell of a look-up, which never ends by itself.
std::optional<Selected> lookedUp;
HANDLE WSAAPI KeepLookUp(HWND window, u_int message, const char*, char*, int) {
  lookedUp = Selected{INVALID_SOCKET, window, message};
  return reinterpret_cast<HANDLE>(std::uintptr_t{7});
}
int WSAAPI RefuseToStop(HANDLE) { return SOCKET_ERROR; }

TEST(WindowsLookUps, One_that_is_under_way_at_the_last_clean_up_tells_nothing_any_more) {
  WindowsLoop loop;
  SocketLibrary library;
  library.WSAAsyncGetHostByName = KeepLookUp;
  library.WSACancelAsyncRequest = RefuseToStop;
  WindowsSockets sockets(loop, library);
  int told = 0;
  using Procedure = forms::WindowProcedure::element_type;
  const WindowHandle window =
      loop.Windows.Add(std::make_shared<Procedure>([&](auto, auto, auto, auto) { return ++told, 0; }));
  std::array<std::uint8_t, 1024> buffer{};
  ASSERT_EQ(sockets.WSAStartup(257), 0);
  ASSERT_NE(sockets.WSAAsyncGetHostByName(window, 32769, "host", buffer), kNoLookUp);

  EXPECT_EQ(sockets.WSACleanup(), 0);

  constexpr LPARAM kFailed = MAKELPARAM(0, WSAHOST_NOT_FOUND);
  ::PostMessageW(lookedUp->window, lookedUp->message, 7, kFailed);
  loop.WaitFor([] { return false; }, 10);
  EXPECT_EQ(told, 0);
}

/// A connection whose events are those that the test says.
class ToldSockets : public testing::Test {
 protected:
  ToldSockets() {
    setMode = library.ioctlsocket;
    using Procedure = forms::WindowProcedure::element_type;
    window = loop.Windows.Add(std::make_shared<Procedure>([this](auto, auto, auto, std::uint32_t lParam) {
      told.push_back(EventOfMessage(lParam));
      return 0;
    }));
    sockets.WSAStartup(257);
    near = Connected();
  }
  ~ToldSockets() override { selected.reset(); }

  SocketHandle Connected() {
    const SocketHandle made = sockets.socket(kInternetFamily, kStreamSocket, 6);
    const SocketAddress outside = network.Outside();
    EXPECT_EQ(sockets.connect(made, outside), 0);
    far = network.TakeConnection();
    EXPECT_EQ(sockets.WSAAsyncSelect(made, window, 32769, 59), 0);
    return made;
  }
  void Tell(const Selected& whom, SocketEvent event) {
    ::PostMessageW(whom.window, whom.message, whom.socket, MAKELPARAM(event, 0));
    loop.WaitFor([] { return false; }, 10);
  }
  std::string Read(std::size_t size) {
    std::string text(size, ' ');
    const std::int32_t read = sockets.recv(near, {reinterpret_cast<std::uint8_t*>(text.data()), size}, 0);
    return text.substr(0, static_cast<std::size_t>(std::max(read, 0)));
  }
  void WaitForData() {
    std::uint32_t amount = 0;
    ASSERT_TRUE(loop.WaitFor(
        [&] { return sockets.ioctlsocket(near, kBytesWaiting, amount) == 0 && amount > 0; }, 5000));
  }

  WindowsLoop loop;
  SocketLibrary library = [] {
    SocketLibrary own;
    own.WSAAsyncSelect = Keep;
    return own;
  }();
  NetworkEnds network;
  WindowsSockets sockets{loop, library};
  WindowHandle window;
  std::vector<std::int32_t> told;
  SocketHandle near;
  std::unique_ptr<FarEnd> far;
};

TEST_F(ToldSockets, An_end_that_the_system_tells_while_data_waits_is_passed_on_behind_the_data) {
  far->Send("abcd");
  far->CloseSending();
  WaitForData();
  Tell(*selected, kFdRead);
  Tell(*selected, kFdClose);
  EXPECT_EQ(told, (std::vector<std::int32_t>{kFdRead}));
  EXPECT_EQ(Read(3), "abc");
  loop.PumpOnce();
  EXPECT_EQ(told, (std::vector<std::int32_t>{kFdRead}));
  EXPECT_EQ(Read(3), "d");
  loop.PumpOnce();
  EXPECT_EQ(told, (std::vector<std::int32_t>{kFdRead, kFdClose}));
}

TEST_F(ToldSockets, An_event_that_the_system_tells_twice_is_passed_on_once_until_it_may_come_again) {
  Tell(*selected, kFdRead);
  Tell(*selected, kFdRead);
  EXPECT_EQ(told.size(), 1u);
  Read(1);
  Tell(*selected, kFdRead);
  EXPECT_EQ(told.size(), 2u);
}

TEST_F(ToldSockets, A_message_about_a_socket_that_has_gone_does_not_reach_the_next_one_of_its_number) {
  const Selected gone = *selected;
  sockets.closesocket(near);
  near = Connected();
  ASSERT_NE(gone.message, selected->message);
  Tell({selected->socket, gone.window, gone.message}, kFdRead);
  EXPECT_TRUE(told.empty());
  Tell(*selected, kFdRead);
  EXPECT_EQ(told.size(), 1u);
}

TEST(WindowsSocketsTest, Without_its_library_nothing_starts) {
  WindowsLoop loop;
  const SocketLibrary library(L"no-such.dll");
  WindowsSockets sockets(loop, library);
  EXPECT_EQ(sockets.WSAStartup(257), kSubsystemUnavailable);
  EXPECT_EQ(sockets.socket(kInternetFamily, kStreamSocket, 6), kNoSocket);
  EXPECT_EQ(sockets.WSAGetLastError(), kNotStarted);
  EXPECT_FALSE(sockets.WSAIsBlocking());
}

TEST(WindowsSocketsTest, No_call_blocks_and_none_can_be_cancelled) {
  WindowsLoop loop;
  const SocketLibrary library;
  WindowsSockets sockets(loop, library);
  sockets.WSAStartup(257);
  EXPECT_FALSE(sockets.WSAIsBlocking());
  EXPECT_EQ(sockets.WSACancelBlockingCall(), kSocketError);
  EXPECT_EQ(sockets.WSAGetLastError(), kInvalidArgument);
}

} // namespace

} // namespace quendra::platform::windows
