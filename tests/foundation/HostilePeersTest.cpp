#include "foundation/WorldFixture.h"

#include <arpa/inet.h>
#include <dirent.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <atomic>
#include <thread>

namespace quendra::foundation {
namespace {

/// Peers on loopback that mean no good. Each plays on a thread of its own, over plain sockets.
class HostilePeers : public testing::Test {
 protected:
  ~HostilePeers() override {
    stop_ = true;
    if (peer_.joinable()) peer_.join();
    if (listener_ >= 0) close(listener_);
  }

  /// Listens, and plays `play` with the first connection.
  std::int32_t Serve(std::function<void(int)> play) {
    const std::int32_t port = Listen();
    PlayWithTheFirst(std::move(play));
    return port;
  }
  std::int32_t Listen() {
    listener_ = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    sockaddr_in address = Loopback(0);
    socklen_t size = sizeof address;
    EXPECT_EQ(bind(listener_, reinterpret_cast<const sockaddr*>(&address), sizeof address), 0);
    EXPECT_EQ(listen(listener_, 4096), 0);
    getsockname(listener_, reinterpret_cast<sockaddr*>(&address), &size);
    return ntohs(address.sin_port);
  }
  void PlayWithTheFirst(std::function<void(int)> play) {
    Play([this, play = std::move(play)] {
      const int connection = accept(listener_, nullptr, nullptr);
      if (connection < 0) return;
      play(connection);
      close(connection);
    });
  }
  void ConnectTo(std::int32_t port) {
    program->ArrayAdd(1);
    program->Connect(1, Text(u"127.0.0.1"), port);
  }
  bool Until(const std::function<bool()>& condition) { return world->Until(condition); }
  void Play(std::function<void()> play) { peer_ = std::thread(std::move(play)); }
  static sockaddr_in Loopback(std::int32_t port) {
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    address.sin_port = htons(static_cast<std::uint16_t>(port));
    return address;
  }
  static bool SendAll(int connection, const std::string& bytes) {
    for (std::size_t sent = 0; sent < bytes.size();) {
      const auto count = send(connection, bytes.data() + sent, bytes.size() - sent, MSG_NOSIGNAL);
      if (count <= 0) return false;
      sent += static_cast<std::size_t>(count);
    }
    return true;
  }
  static int OpenDescriptors() {
    DIR* folder = opendir("/proc/self/fd");
    int count = 0;
    while (readdir(folder) != nullptr) ++count;
    closedir(folder);
    return count;
  }

  std::unique_ptr<World> world = MakeRealWorld();
  Program program{*world};

 private:
  int listener_ = -1;
  std::thread peer_;

 protected:
  std::atomic<bool> stop_ = false;
};

constexpr std::size_t kHundredMegabytes = 100'000'000;

void SendHundredMegabytes(int connection) {
  const std::string block(1'000'000, 'x');
  for (std::size_t sent = 0; sent < kHundredMegabytes; sent += block.size())
    if (send(connection, block.data(), block.size(), MSG_NOSIGNAL | MSG_WAITALL) < 0) return;
}

TEST_F(HostilePeers, A_reply_of_100_MB_is_taken_by_a_handler_to_the_last_byte) {
  const std::int32_t port = Serve(SendHundredMegabytes);
  std::size_t taken = 0;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t total) {
    Variant data;
    program->GetData(index, data);
    EXPECT_EQ(data.Find<ByteArray>()->size(), static_cast<std::size_t>(total));
    taken += data.Find<ByteArray>()->size();
  };
  ConnectTo(port);
  ASSERT_TRUE(Until([&] { return program.Saw("CloseSck 1"); }));
  EXPECT_EQ(taken, kHundredMegabytes);
}

TEST_F(HostilePeers, A_reply_of_100_MB_that_nobody_takes_waits_whole) {
  const std::int32_t port = Serve(SendHundredMegabytes);
  program->Events.DataArrival = [](const Variant&, std::int32_t) {};
  ConnectTo(port);
  ASSERT_TRUE(Until([&] { return program.Saw("CloseSck 1"); }));
  EXPECT_EQ(program->BytesReceived(1), static_cast<std::int32_t>(kHundredMegabytes));
  program->CloseSck(1);
  EXPECT_EQ(program->BytesReceived(1), 0);
}

TEST_F(HostilePeers, Ten_thousand_tiny_pieces_all_arrive_in_order) {
  const std::int32_t port = Serve([](int connection) {
    for (int i = 0; i < 10'000; ++i) SendAll(connection, std::to_string(i % 10));
  });
  std::string taken;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) { taken += program.Take(index); };
  ConnectTo(port);
  ASSERT_TRUE(Until([&] { return program.Saw("CloseSck 1"); }));
  ASSERT_EQ(taken.size(), 10'000u);
  for (std::size_t i = 0; i < taken.size(); ++i) ASSERT_EQ(taken[i], static_cast<char>('0' + i % 10));
}

TEST_F(HostilePeers, A_reset_in_the_middle_of_a_reply_is_an_Error_and_not_the_programs_end) {
  const std::int32_t port = Serve([](int connection) {
    SendAll(connection, std::string(300'000, 'x'));
    const linger forced{1, 0};
    setsockopt(connection, SOL_SOCKET, SO_LINGER, &forced, sizeof forced);
  });
  ConnectTo(port);
  ASSERT_TRUE(Until([&] { return program.Saw("Error 1 10054 CSocketPlus.PostSocket"); }));
  EXPECT_EQ(program->State(1), sckError);
  EXPECT_FALSE(world->Desktop.Ended);
}

TEST_F(HostilePeers, A_reset_while_the_program_sends_is_an_Error) {
  const std::int32_t port = Serve([](int connection) {
    std::string buffer(1000, ' ');
    EXPECT_GT(recv(connection, buffer.data(), buffer.size(), 0), 0);
    const linger forced{1, 0};
    setsockopt(connection, SOL_SOCKET, SO_LINGER, &forced, sizeof forced);
  });
  program->Events.Connect = [&](const Variant& index) { program->SendData(index, ByteArray(50'000'000)); };
  ConnectTo(port);
  ASSERT_TRUE(Until([&] { return program->State(1) == sckError; }));
  EXPECT_TRUE(program.Events.back().starts_with("Error 1 10054 ")) << program.Events.back();
  EXPECT_FALSE(world->Desktop.Ended);
}

TEST_F(HostilePeers, A_peer_that_stops_sending_gets_only_what_was_under_way) {
  constexpr std::int32_t kSent = 50'000'000;
  std::atomic<bool> closing = false;
  std::atomic<std::int64_t> received = -1;
  const std::int32_t port = Serve([&](int connection) {
    char byte = 0;
    EXPECT_EQ(recv(connection, &byte, 1, MSG_PEEK), 1);
    shutdown(connection, SHUT_WR);
    while (!closing && !stop_) std::this_thread::yield();
    const timeval wait{0, 200'000};
    setsockopt(connection, SOL_SOCKET, SO_RCVTIMEO, &wait, sizeof wait);
    std::string buffer(1'000'000, ' ');
    std::int64_t total = 0;
    for (ssize_t count; (count = recv(connection, buffer.data(), buffer.size(), 0)) > 0;) total += count;
    received = total;
  });
  program->Events.Connect = [&](const Variant& index) { program->SendData(index, ByteArray(kSent)); };
  ConnectTo(port);
  ASSERT_TRUE(Until([&] { return program.Saw("CloseSck 1"); }));
  closing = true;
  ASSERT_TRUE(Until([&] { return received >= 0; }));
  EXPECT_GT(received, 0);
  EXPECT_LT(received, kSent);
  EXPECT_FALSE(program.Saw("SendComplete 1"));
  EXPECT_EQ(program->State(1), sckClosing);
}

TEST_F(HostilePeers, Nul_bytes_in_any_number_are_data_like_any_other) {
  const std::int32_t port = Serve([](int connection) { SendAll(connection, std::string(100'000, '\0')); });
  ConnectTo(port);
  Text taken;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    Variant data = Text();
    program->GetData(index, data);
    taken += *data.Find<Text>();
  };
  ASSERT_TRUE(Until([&] { return program.Saw("CloseSck 1"); }));
  EXPECT_EQ(taken, Text(100'000, u'\0'));
}

TEST_F(HostilePeers, Urgent_bytes_cost_no_data_and_do_not_hide_the_end) {
  const std::int32_t port = Serve([](int connection) {
    for (int i = 0; i < 100; ++i) {
      SendAll(connection, "piece.");
      EXPECT_EQ(send(connection, "!", 1, MSG_OOB | MSG_NOSIGNAL), 1);
    }
    SendAll(connection, "last.");
  });
  std::string taken;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) { taken += program.Take(index); };
  ConnectTo(port);
  ASSERT_TRUE(Until([&] { return program.Saw("CloseSck 1"); }));
  std::erase(taken, '!'); // the kernel keeps the latest aside and takes those before it for data
  std::string sent;
  for (int i = 0; i < 100; ++i) sent += "piece.";
  EXPECT_EQ(taken, sent + "last.");
  EXPECT_FALSE(world->Desktop.Ended);
}

TEST_F(HostilePeers, Without_a_descriptor_to_watch_a_socket_Connect_raises_10024_and_works_after_CloseSck) {
  const std::int32_t port = Listen();
  {
    // A sanitizer looks at a kind of object through a pipe when it meets the first: that must have been
    // before the descriptors run out.
    const auto rehearsal = MakeRealWorld();
    Program other(*rehearsal);
    other->ArrayAdd(1);
    other->Connect(1, Text(u"127.0.0.1"), rehearsal->ClosedPort());
    EXPECT_NE(FaultText([&] { other->Connect(1, Text(u"127.0.0.1"), rehearsal->ClosedPort()); }), "");
  }
  program->ArrayAdd(1);
  rlimit before{};
  getrlimit(RLIMIT_NOFILE, &before);
  const int next = dup(STDERR_FILENO);
  close(next);
  const rlimit lowered{static_cast<rlim_t>(next) + 1, before.rlim_max};
  setrlimit(RLIMIT_NOFILE, &lowered);
  const std::string fault = FaultText([&] { program->Connect(1, Text(u"127.0.0.1"), port); });
  setrlimit(RLIMIT_NOFILE, &before);
  EXPECT_EQ(fault, "10024 Too many open files. [modSocketPlus.RegisterSocket]");
  EXPECT_EQ(program->State(1), sckClosed);

  PlayWithTheFirst([](int connection) { SendAll(connection, "hello"); });
  program->CloseSck(1);
  program->Connect(1, Text(u"127.0.0.1"), port);
  EXPECT_TRUE(Until([&] { return program.Saw("DataArrival 1 5"); }));
}

TEST_F(HostilePeers, A_flood_of_500_connections_that_nobody_takes_is_all_turned_away) {
  program->ArrayAdd(1);
  program->Listen(1);
  const std::int32_t port = program->LocalPort(1);
  std::atomic<int> ended = 0;
  Play([&, port] {
    std::vector<std::thread> diallers;
    for (int i = 0; i < 5; ++i)
      diallers.emplace_back([&, port] {
        for (int j = 0; j < 100 && !stop_; ++j) {
          const int dialler = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
          const timeval wait{20, 0};
          setsockopt(dialler, SOL_SOCKET, SO_RCVTIMEO, &wait, sizeof wait);
          const sockaddr_in target = Loopback(port);
          char byte = 0;
          if (connect(dialler, reinterpret_cast<const sockaddr*>(&target), sizeof target) == 0 &&
              recv(dialler, &byte, 1, 0) <= 0)
            ++ended;
          close(dialler);
        }
      });
    for (auto& dialler : diallers) dialler.join();
  });
  const int before = OpenDescriptors();
  ASSERT_TRUE(Until([&] { return ended == 500; })) << ended;
  EXPECT_EQ(std::count(program.Events.begin(), program.Events.end(), "ConnectionRequest 1"), 500);
  EXPECT_EQ(program.module.SocketClassCount(), 1);
  EXPECT_LE(OpenDescriptors(), before);
  EXPECT_EQ(program->State(1), sckListening);
}

TEST_F(HostilePeers, A_flood_of_500_connections_that_are_all_taken_are_500_sockets) {
  program->ArrayAdd(Text(u"listener"));
  program->Listen(Text(u"listener"));
  const std::int32_t port = program->LocalPort(Text(u"listener"));
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    const Variant index = program->ArrayAdd();
    program->Accept(index, request);
    program->SendData(index, Text(u"!"));
  };
  Play([&, port] {
    // The system turns away a connection when five wait already, and the client's kernel tries again a second
    // later. So each waits for its greeting before the next one connects.
    std::vector<int> diallers;
    for (int i = 0; i < 500 && !stop_; ++i) {
      diallers.push_back(socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0));
      const timeval wait{20, 0};
      setsockopt(diallers.back(), SOL_SOCKET, SO_RCVTIMEO, &wait, sizeof wait);
      const sockaddr_in target = Loopback(port);
      char byte = 0;
      if (connect(diallers.back(), reinterpret_cast<const sockaddr*>(&target), sizeof target) == 0 &&
          recv(diallers.back(), &byte, 1, 0) == 1)
        SendAll(diallers.back(), "x");
    }
    for (const int dialler : diallers) close(dialler);
  });
  int closed = 0;
  int arrived = 0;
  program->Events.CloseSck = [&](const Variant&) { ++closed; };
  program->Events.DataArrival = [&](const Variant&, std::int32_t) { ++arrived; };
  ASSERT_TRUE(Until([&] { return closed == 500; })) << closed;
  EXPECT_EQ(arrived, 500);
  EXPECT_EQ(program->ArrayCount(), 501);
}

TEST_F(HostilePeers, A_thousand_sockets_of_one_object_connect_and_each_gets_its_own_answer) {
  constexpr std::int32_t kSockets = 1000;
  program->ArrayAdd(0);
  program->Listen(0);
  const std::int32_t port = program->LocalPort(0);
  const auto server = std::make_unique<CSocketPlus>(program.module);
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    server->Accept(server->ArrayAdd(), request);
  };
  server->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    Variant data;
    server->GetData(index, data);
    server->SendData(index, data);
  };
  std::int32_t next = 0;
  std::int32_t answered = 0;
  const auto start = [&] {
    if (next == kSockets) return;
    program->ArrayAdd(++next);
    program->Connect(next, Text(u"127.0.0.1"), port);
  };
  program->Events.Connect = [&](const Variant& index) {
    program->SendData(index, index.AsText());
    start();
  };
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    if (program.Take(index) == NameOf(index)) ++answered;
  };
  for (int i = 0; i < 4; ++i) start();
  ASSERT_TRUE(Until([&] { return answered == kSockets; })) << answered;
  EXPECT_EQ(program->ArrayCount(), kSockets + 1);
  for (std::int32_t i = 0; i <= kSockets; ++i) program->ArrayRemove(i);
  EXPECT_EQ(program->ArrayCount(), 0);
}

TEST_F(HostilePeers, A_thousand_exchanges_leave_no_descriptor_and_no_entry_behind) {
  program->ArrayAdd(0);
  program->Listen(0);
  const std::int32_t port = program->LocalPort(0);
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    program->Accept(program->ArrayAdd(2), request);
    program->SendData(2, Text(u"answer"));
    program->ArrayRemove(2);
  };
  int descriptors = 0;
  int entries = 0;
  for (int round = 0; round < 1000; ++round) {
    program->ArrayAdd(1);
    program.Events.clear();
    program->Connect(1, Text(u"localhost"), port);
    ASSERT_TRUE(Until([&] { return program.Saw("CloseSck 1"); })) << round;
    ASSERT_TRUE(program.Saw("DataArrival 1 6"));
    program->ArrayRemove(1);
    if (round == 10) {
      descriptors = OpenDescriptors();
      entries = program.module.SocketCount();
    }
  }
  EXPECT_EQ(OpenDescriptors(), descriptors);
  EXPECT_EQ(program.module.SocketCount(), entries);
  EXPECT_EQ(program.module.ResolveCount(), 1);
}

} // namespace
} // namespace quendra::foundation
