#include "report/live/Peer.h"

#include "integration/SocketHelpers.h"

#include <chrono>
#include <csignal>
#include <fcntl.h>
#include <poll.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

namespace quendra::report {

namespace {

using Clock = std::chrono::steady_clock;
constexpr auto kPatience = std::chrono::seconds(10);

[[noreturn]] void Become(const std::vector<std::string>& command, int output) {
  prctl(PR_SET_PDEATHSIG, SIGKILL);
  setpgid(0, 0);
  dup2(output, STDOUT_FILENO);
  std::vector<char*> words;
  for (const std::string& word : command) words.push_back(const_cast<char*>(word.c_str()));
  words.push_back(nullptr);
  execvp(words[0], words.data());
  _exit(127);
}

bool Accepts(int port) {
  const int attempt = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
  const sockaddr_in address = integration::InetAddress("127.0.0.1", static_cast<std::uint16_t>(port));
  const bool connected = connect(attempt, integration::Generic(address), sizeof address) == 0;
  close(attempt);
  return connected;
}

} // namespace

Peer::Peer(const std::vector<std::string>& command) {
  int ends[2];
  integration::Check(pipe2(ends, O_CLOEXEC), "pipe");
  process_ = integration::Check(fork(), "fork");
  if (process_ == 0) Become(command, ends[1]);
  setpgid(process_, process_);
  close(ends[1]);
  output_ = ends[0];
}

Peer::~Peer() {
  kill(-process_, SIGTERM);
  const auto end = Clock::now() + std::chrono::seconds(5);
  while (IsAlive() && Clock::now() < end) std::this_thread::sleep_for(std::chrono::milliseconds(10));
  kill(-process_, SIGKILL);
  if (process_ > 0) waitpid(process_, nullptr, 0);
  close(output_);
}

bool Peer::IsAlive() {
  siginfo_t info{};
  return waitid(P_PID, static_cast<id_t>(process_), &info, WEXITED | WNOHANG | WNOWAIT) == 0 &&
         info.si_pid == 0;
}

std::string Peer::FirstLine() {
  std::string line;
  for (;;) {
    pollfd waiting{output_, POLLIN, 0};
    char letter = 0;
    if (poll(&waiting, 1, 10'000) != 1 || read(output_, &letter, 1) != 1)
      throw std::runtime_error("the peer says nothing");
    if (letter == '\n') return line;
    line += letter;
  }
}

void Peer::AwaitPort(int port) {
  const auto end = Clock::now() + kPatience;
  while (!Accepts(port)) {
    if (!IsAlive()) throw std::runtime_error("the peer has ended");
    if (Clock::now() > end) throw std::runtime_error("the peer doesn't listen");
    std::this_thread::sleep_for(std::chrono::milliseconds(20));
  }
}

std::string PathOfProgram(const std::string& name) {
  for (const char* folder : {"/usr/sbin/", "/usr/bin/", "/usr/local/sbin/", "/usr/local/bin/"})
    if (access((folder + name).c_str(), X_OK) == 0) return folder + name;
  return {};
}

} // namespace quendra::report
