#include "platform/BackendFixture.h"
#include "platform/net/HostNames.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

// What the sockets of every machine must tell alike, whatever stands behind them.

namespace quendra::platform {
namespace {

struct Told {
  std::int32_t event;
  std::int32_t error;
  friend bool operator==(const Told&, const Told&) = default;
};

void PrintTo(const Told& told, std::ostream* out) {
  *out << "event " << told.event << " error " << told.error;
}

/// One socket, a window that writes down what is told of it, and the far end of its connection.
class SocketsBehaviour : public BackendTest {
 protected:
  static constexpr std::uint32_t kMessage = 32769;

  SocketsBehaviour() {
    window_ = backend->Desktop().Windows.Create();
    using Procedure = forms::WindowProcedure::element_type;
    backend->Desktop().Windows.Replace(
        window_, std::make_shared<Procedure>([this](auto, auto, std::uint32_t, std::uint32_t lParam) {
          told.push_back(
              {static_cast<std::int32_t>(lParam & 0xFFFF), static_cast<std::int32_t>(lParam >> 16)});
          return 0;
        }));
    sockets.WSAStartup(257);
    socket = sockets.socket(2, 1, 6);
  }
  ~SocketsBehaviour() override { sockets.WSACleanup(); }

  /// As early as the machine can tell of the connection.
  void StartConnection() {
    const SocketAddress outside = backend->Outside();
    ASSERT_EQ(sockets.WSAAsyncSelect(socket, window_, kMessage, 59), 0);
    ASSERT_EQ(sockets.connect(socket, outside), kSocketError);
    ASSERT_EQ(sockets.WSAGetLastError(), kWouldBlock);
    far = backend->TakeConnection();
    if (!far) Until([&] { return (far = backend->TakeConnection()) != nullptr; });
    ASSERT_TRUE(far);
  }
  void Connect() {
    StartConnection();
    ASSERT_TRUE(Saw({kFdWrite, 0}));
    backend->Settle();
    told.clear();
  }
  bool Until(const std::function<bool()>& condition) { return backend->Until(condition); }
  int Count(Told event) { return static_cast<int>(std::count(told.begin(), told.end(), event)); }
  bool Saw(Told event) {
    return Until([&] { return Count(event) > 0; });
  }
  /// Sends until the system takes no more.
  void SendUntilRefused() {
    const std::vector<std::uint8_t> block(1'000'000);
    while (sockets.send(socket, block, 0) > 0) {
    }
    ASSERT_EQ(sockets.WSAGetLastError(), kWouldBlock);
  }
  std::string Read(std::size_t size) {
    std::string text(size, ' ');
    const std::int32_t read = sockets.recv(socket, {reinterpret_cast<std::uint8_t*>(text.data()), size}, 0);
    return read < 0 ? "error " + std::to_string(sockets.WSAGetLastError())
                    : text.substr(0, static_cast<std::size_t>(read));
  }

  Sockets& sockets = machine.sockets;
  SocketHandle socket = kNoSocket;
  std::unique_ptr<FarEnd> far;
  std::vector<Told> told;

 private:
  forms::WindowHandle window_;
};

TEST_P(SocketsBehaviour, FD_CLOSE_comes_once_and_only_when_all_data_was_read) {
  Connect();
  far->Send("abcdef");
  far->CloseSending();
  for (const std::string piece : {"abc", "def"}) {
    ASSERT_TRUE(Saw({kFdRead, 0}));
    backend->Settle();
    EXPECT_EQ(told, (std::vector<Told>{{kFdRead, 0}}));
    told.clear();
    EXPECT_EQ(Read(3), piece);
  }
  ASSERT_TRUE(Saw({kFdClose, 0}));
  EXPECT_EQ(Read(3), "");
  backend->Settle();
  EXPECT_EQ(told, (std::vector<Told>{{kFdClose, 0}}));
}

TEST_P(SocketsBehaviour, A_send_refused_before_the_peers_half_close_gets_its_FD_WRITE) {
  Connect();
  SendUntilRefused();
  far->CloseSending();
  ASSERT_TRUE(Saw({kFdClose, 0}));
  EXPECT_TRUE(Until([&] {
    far->Drain();
    return Count({kFdWrite, 0}) == 1;
  }));
  EXPECT_GT(sockets.send(socket, std::vector<std::uint8_t>{1}, 0), 0);
}

TEST_P(SocketsBehaviour, A_send_refused_after_the_peers_half_close_gets_its_FD_WRITE) {
  Connect();
  far->CloseSending();
  ASSERT_TRUE(Saw({kFdClose, 0}));
  SendUntilRefused();
  EXPECT_TRUE(Until([&] {
    far->Drain();
    return Count({kFdWrite, 0}) == 1;
  }));
  EXPECT_GT(sockets.send(socket, std::vector<std::uint8_t>{1}, 0), 0);
}

TEST_P(SocketsBehaviour, A_connection_reset_before_it_is_told_of_is_told_and_then_its_end_with_10054) {
  StartConnection();
  far->Reset();
  ASSERT_TRUE(Saw({kFdClose, 10054}));
  backend->Settle();
  std::erase(told, Told{kFdWrite, 0});
  EXPECT_EQ(told, (std::vector<Told>{{kFdConnect, 0}, {kFdClose, 10054}}));
}

TEST_P(SocketsBehaviour, Data_of_a_connection_reset_before_it_is_told_of_is_read_before_its_end) {
  StartConnection();
  far->Send("last");
  far->Reset();
  ASSERT_TRUE(Saw({kFdRead, 0}));
  backend->Settle();
  EXPECT_EQ(Count({kFdClose, 10054}), 0);
  EXPECT_EQ(Read(10), "last");
  EXPECT_TRUE(Saw({kFdClose, 10054}));
}

TEST_P(SocketsBehaviour, A_connection_that_was_reset_keeps_both_addresses_and_reads_as_10054) {
  StartConnection();
  far->Reset();
  ASSERT_TRUE(Saw({kFdClose, 10054}));
  SocketAddress local;
  SocketAddress peer;
  EXPECT_EQ(sockets.getsockname(socket, local), 0);
  EXPECT_NE(local.port, 0);
  EXPECT_EQ(sockets.getpeername(socket, peer), 0);
  EXPECT_NE(peer.port, 0);
  EXPECT_EQ(Read(10), "error 10054");
}

INSTANTIATE_TEST_SUITE_P(, SocketsBehaviour, kEveryBackend, NameOfBackend);

} // namespace
} // namespace quendra::platform
