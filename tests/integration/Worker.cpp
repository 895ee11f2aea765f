#include "integration/Worker.h"

#include "integration/TrafficClient.h"
#include "integration/TrafficServer.h"

#include <array>
#include <cerrno>
#include <csignal>
#include <cstdio>
#include <cstring>
#include <stdexcept>
#include <sys/prctl.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <utility>

namespace quendra::integration {

namespace {

constexpr std::size_t kMostPorts = 1024;

/// Never returns: a child must not run the test's own ends.
[[noreturn]] void Live(pid_t parent, const NetworkNamespace& space, int channel,
                       const std::function<void(int)>& work) {
  prctl(PR_SET_PDEATHSIG, SIGKILL);
  if (getppid() != parent) _exit(1);
  // A worker that nobody listens to any more ends here, at the latest.
  alarm(300);
  space.Enter();
  try {
    work(channel);
  } catch (const std::exception& fault) {
    std::fprintf(stderr, "worker %d: %s\n", getpid(), fault.what());
    _exit(1);
  }
  _exit(0);
}

} // namespace

Worker::Worker(const NetworkNamespace& space, const std::function<void(int)>& work) {
  int ends[2];
  if (socketpair(AF_UNIX, SOCK_SEQPACKET | SOCK_CLOEXEC, 0, ends) != 0)
    throw std::runtime_error("no channel to a worker");
  const pid_t parent = getpid();
  process_ = fork();
  if (process_ < 0) throw std::runtime_error("a worker couldn't be started");
  if (process_ == 0) {
    close(ends[0]);
    Live(parent, space, ends[1], work);
  }
  close(ends[1]);
  channel_ = ends[0];
}

Worker::Worker(Worker&& other) noexcept
    : process_(std::exchange(other.process_, -1)), channel_(std::exchange(other.channel_, -1)) {}

Worker::~Worker() {
  if (process_ < 0) return;
  close(channel_);
  kill(process_, SIGKILL);
  waitpid(process_, nullptr, 0);
}

Worker Worker::Server(const NetworkNamespace& space, const std::string& address, std::uint16_t port) {
  Worker server(space, [&](int channel) { TrafficServer(address, port).Run(channel); });
  // The server says so when it listens.
  std::uint16_t listening = 0;
  if (recv(server.channel_, &listening, sizeof listening, 0) != sizeof listening)
    throw std::runtime_error("a server doesn't listen");
  return server;
}

Worker Worker::Client(const NetworkNamespace& space, const std::string& serverAddress, std::uint16_t port) {
  return Worker(space, [&](int channel) { TrafficClient(serverAddress, port).Run(channel); });
}

void Worker::Tell(const Order& order) {
  if (send(channel_, &order, sizeof order, 0) != sizeof order)
    throw std::runtime_error("a worker can't be told");
}

bool Worker::HasAnswered(Answer& answer) {
  std::array<std::uint16_t, kMostPorts> ports;
  const ssize_t size = recv(channel_, ports.data(), sizeof ports, MSG_DONTWAIT);
  if (size < 0 && (errno == EAGAIN || errno == EINTR)) return false;
  if (size <= 0) throw std::runtime_error("worker " + std::to_string(process_) + " has gone");
  // An answer is one word that means nothing, then its ports.
  answer.done = true;
  answer.localPorts.assign(ports.begin() + 1, ports.begin() + size / 2);
  return true;
}

} // namespace quendra::integration
