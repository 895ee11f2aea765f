#include "TablePassBenchCrowd.h"

#include <net/if.h>
#include <netinet/in.h>
#include <sched.h>
#include <signal.h>
#include <sys/ioctl.h>
#include <sys/prctl.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cstring>
#include <stdexcept>
#include <utility>

namespace quendra::bench {

namespace {

constexpr unsigned kLongestSeconds = 900;

void Require(bool done, const char* what) {
  if (!done) throw std::runtime_error(what);
}

void EnterNetworkNamespace() {
  Require(::unshare(CLONE_NEWNET) == 0, "a network namespace can't be made (needs root)");
  const int socket = ::socket(AF_INET, SOCK_DGRAM, 0);
  ifreq request{};
  std::strcpy(request.ifr_name, "lo");
  request.ifr_flags = IFF_UP;
  Require(::ioctl(socket, SIOCSIFFLAGS, &request) == 0, "loopback can't be brought up");
  ::close(socket);
}

/// Makes the two ends of connections on loopback.
class Connections {
 public:
  Connections() : listener_(::socket(AF_INET, SOCK_STREAM, 0)) {
    address_.sin_family = AF_INET;
    address_.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    socklen_t length = sizeof address_;
    auto* address = reinterpret_cast<sockaddr*>(&address_);
    Require(::bind(listener_, address, length) == 0 && ::listen(listener_, 8) == 0 &&
                ::getsockname(listener_, address, &length) == 0,
            "no listener");
  }
  ~Connections() { ::close(listener_); }
  Connections(const Connections&) = delete;

  std::pair<int, int> Make() {
    const int near = ::socket(AF_INET, SOCK_STREAM, 0);
    Require(::connect(near, reinterpret_cast<const sockaddr*>(&address_), sizeof address_) == 0,
            "no connection");
    const int far = ::accept(listener_, nullptr, nullptr);
    Require(far >= 0, "no accepted connection");
    return {near, far};
  }

 private:
  int listener_;
  sockaddr_in address_{};
};

/// In the child: keeps what it holds and does nothing.
[[noreturn]] void Hold(const std::vector<int>& held, pid_t parent) {
  ::prctl(PR_SET_PDEATHSIG, SIGKILL);
  if (::getppid() != parent) ::_exit(0);
  unsigned next = 3;
  for (const int descriptor : held) {
    if (static_cast<unsigned>(descriptor) > next) ::syscall(SYS_close_range, next, descriptor - 1, 0);
    next = static_cast<unsigned>(descriptor) + 1;
  }
  ::syscall(SYS_close_range, next, ~0U, 0);
  ::alarm(kLongestSeconds);
  for (;;) ::pause();
}

} // namespace

TableCrowd::TableCrowd(int processes, int sockets) {
  EnterNetworkNamespace();
  Connections connections;
  const int pairs = (processes + 1) / 2;
  int left = (sockets + 1) / 2;
  for (int i = 0; i < pairs; ++i) {
    std::vector<int> near, far;
    const int share = (left + pairs - i - 1) / (pairs - i);
    for (int k = 0; k < share; ++k) {
      const auto [one, other] = connections.Make();
      near.push_back(one);
      far.push_back(other);
    }
    left -= share;
    for (auto* held : {&near, &far}) {
      std::sort(held->begin(), held->end());
      StartHolder(*held);
    }
    for (auto* held : {&near, &far})
      for (const int descriptor : *held) ::close(descriptor);
  }
}

void TableCrowd::StartHolder(const std::vector<int>& held) {
  const pid_t parent = ::getpid();
  const pid_t child = ::fork();
  Require(child >= 0, "no process");
  if (child == 0) Hold(held, parent);
  children_.push_back(child);
}

TableCrowd::~TableCrowd() {
  for (const pid_t child : children_) ::kill(child, SIGKILL);
  for (const pid_t child : children_) ::waitpid(child, nullptr, 0);
}

} // namespace quendra::bench
