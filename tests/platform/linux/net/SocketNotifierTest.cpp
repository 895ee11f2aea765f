#include "platform/linux/net/SocketNotifier.h"
#include "platform/linux/LinuxFixture.h"
#include "platform/net/RealSocketsFixture.h"

#include <arpa/inet.h>
#include <linux/filter.h>
#include <linux/seccomp.h>
#include <sys/prctl.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <cerrno>
#include <cstddef>

namespace quendra::platform::linux_ {

namespace {

/// A connection to a peer that is no socket of the library.
class SocketNotifierTest : public RealSocketsTest {
 protected:
  void SetUp() override {
    RealSocketsTest::SetUp();
    const Descriptor listener(::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0));
    ASSERT_EQ(::listen(listener.Number(), 1), 0);
    sockaddr_in address{};
    socklen_t size = sizeof address;
    ASSERT_EQ(::getsockname(listener.Number(), reinterpret_cast<sockaddr*>(&address), &size), 0);
    near = NewSocket();
    Select(near);
    sockets.connect(near, At(ntohs(address.sin_port)));
    peer = Descriptor(::accept(listener.Number(), nullptr, nullptr));
    ASSERT_TRUE(Saw(near, kFdWrite));
    seen.clear();
  }
  void PeerSends(const std::string& bytes, int flags = 0) {
    ASSERT_EQ(::send(peer.Number(), bytes.data(), bytes.size(), flags | MSG_NOSIGNAL),
              static_cast<ssize_t>(bytes.size()));
  }
  void PeerCloses() { peer = Descriptor(); }
  /// What is read until the end is told.
  std::string ReadToTheEnd() {
    std::string all;
    int reads = 0;
    Until([&] {
      for (; reads < Count(near, kFdRead); ++reads) all += Read(near, 100);
      return Count(near, kFdClose) > 0;
    });
    return all;
  }

  Descriptor peer;
};

TEST_F(SocketNotifierTest, Data_behind_an_urgent_byte_is_read_before_the_end_is_told) {
  PeerSends("before");
  PeerSends("!", MSG_OOB);
  PeerSends("behind");
  PeerCloses();
  EXPECT_EQ(ReadToTheEnd(), "beforebehind");
  EXPECT_EQ(Count(near, kFdClose), 1);
}

TEST_F(SocketNotifierTest, Data_behind_several_urgent_bytes_is_read_before_the_end_is_told) {
  for (int i = 0; i < 3; ++i) {
    PeerSends("!", MSG_OOB);
    PeerSends("piece.");
  }
  PeerCloses();
  const std::string read = ReadToTheEnd();
  // The kernel keeps one urgent byte aside; those before it are data like any other.
  EXPECT_EQ(std::count(read.begin(), read.end(), '.'), 3) << read;
  EXPECT_EQ(Count(near, kFdClose), 1);
}

TEST_F(SocketNotifierTest, An_urgent_byte_alone_is_no_data) {
  PeerSends("!", MSG_OOB);
  Settle();
  EXPECT_TRUE(seen.empty());
  PeerCloses();
  EXPECT_EQ(ReadToTheEnd(), "");
  EXPECT_EQ(Count(near, kFdRead), 0);
}

TEST_F(SocketNotifierTest, A_reset_behind_an_urgent_byte_loses_no_data) {
  PeerSends("!", MSG_OOB);
  PeerSends("behind");
  const linger forced{1, 0};
  ::setsockopt(peer.Number(), SOL_SOCKET, SO_LINGER, &forced, sizeof forced);
  PeerCloses();
  ASSERT_TRUE(Saw(near, kFdRead));
  EXPECT_EQ(Read(near, 100), "behind");
  EXPECT_TRUE(Saw(near, kFdClose, 10054));
}

TEST_F(SocketNotifierTest, An_end_that_comes_while_nothing_is_asked_for_is_told_after_the_next_selection) {
  Select(near, 0);
  PeerSends("late");
  PeerCloses();
  Settle();
  EXPECT_TRUE(seen.empty());
  Select(near);
  ASSERT_TRUE(Saw(near, kFdRead));
  EXPECT_EQ(Read(near, 100), "late");
  EXPECT_TRUE(Saw(near, kFdClose));
}

// A kernel that watches no more sockets.

/// While it lives the process can open one more descriptor and no second one.
class OneDescriptorLeft {
 public:
  OneDescriptorLeft() {
    const Descriptor next(::dup(STDERR_FILENO));
    ::getrlimit(RLIMIT_NOFILE, &before_);
    rlimit lowered = before_;
    lowered.rlim_cur = static_cast<rlim_t>(next.Number()) + 1;
    ::setrlimit(RLIMIT_NOFILE, &lowered);
  }
  ~OneDescriptorLeft() { ::setrlimit(RLIMIT_NOFILE, &before_); }

 private:
  rlimit before_{};
};

/// From now on the kernel refuses this process to watch or unwatch anything.
bool RefuseToWatch(unsigned error) {
  sock_filter program[] = {BPF_STMT(BPF_LD | BPF_W | BPF_ABS, offsetof(seccomp_data, nr)),
                           BPF_JUMP(BPF_JMP | BPF_JEQ | BPF_K, SYS_epoll_ctl, 0, 1),
                           BPF_STMT(BPF_RET | BPF_K, SECCOMP_RET_ERRNO | error),
                           BPF_STMT(BPF_RET | BPF_K, SECCOMP_RET_ALLOW)};
  const sock_fprog filter{4, program};
  return ::prctl(PR_SET_NO_NEW_PRIVS, 1, 0, 0, 0) == 0 &&
         ::prctl(PR_SET_SECCOMP, SECCOMP_MODE_FILTER, &filter, 0, 0) == 0;
}

class UnwatchedSockets : public RealSocketsTest {
 protected:
  std::string SelectionOf(SocketHandle socket) {
    const bool failed = sockets.WSAAsyncSelect(socket, Window(), kMessage, kAllEvents) == kSocketError;
    return failed ? std::to_string(LastError()) : "selected";
  }
};

TEST_F(UnwatchedSockets, A_selection_without_a_descriptor_for_the_watch_fails_with_10024_and_works_later) {
  // A sanitizer looks at a kind of object through a pipe when it meets the first: that must have been before
  // the descriptors run out.
  SocketHandle socket = NewSocket();
  ASSERT_EQ(SelectionOf(kNoSocket), "10038");
  sockets.closesocket(socket);
  {
    const OneDescriptorLeft scarcity;
    socket = NewSocket();
    ASSERT_NE(socket, kNoSocket);
    EXPECT_EQ(SelectionOf(socket), "10024");
  }
  EXPECT_EQ(SelectionOf(socket), "selected");
  EXPECT_EQ(sockets.bind(socket, At(0)), 0);
  EXPECT_EQ(sockets.listen(socket, 5), 0);
  sockets.connect(NewSocket(), At(PortOf(socket)));
  EXPECT_TRUE(Saw(socket, kFdAccept));
}

TEST_F(UnwatchedSockets, A_selection_that_the_kernel_has_no_room_to_watch_fails_with_10055) {
  for (const unsigned error : {ENOSPC, ENOMEM}) {
    const Child child([&] {
      const SocketHandle socket = NewSocket();
      return RefuseToWatch(error) ? SelectionOf(socket) : "no filter";
    });
    EXPECT_EQ(child.Answer(), "10055");
  }
}

TEST_F(UnwatchedSockets, An_accepted_connection_that_the_kernel_has_no_room_to_watch_is_refused_and_closed) {
  const Child child([&]() -> std::string {
    const SocketHandle listener = Listen();
    const SocketHandle socket = NewSocket();
    Select(socket);
    sockets.connect(socket, At(PortOf(listener)));
    if (!Saw(listener, kFdAccept) || !Saw(socket, kFdWrite)) return "no connection";
    if (!RefuseToWatch(ENOSPC)) return "no filter";
    return sockets.accept(listener) == kNoSocket ? std::to_string(LastError()) : "accepted";
  });
  EXPECT_EQ(child.Answer(), "10055");
}

} // namespace

} // namespace quendra::platform::linux_
