// Frames for the live benchmark: real connections between real processes on both ends of a link, and frames
// of these connections sent at a fixed rate. The frames carry a hardware address that nobody has, so both
// hosts pass them over and only those who listen to the link see them.
//
//   live-traffic NEAR-NS FAR-NS NEAR-ADDRESS FAR-ADDRESS NEAR-LINK FAR-LINK CLIENTS CONNECTIONS
//
// Prints "ready", then obeys lines on its input: "send RATE SECONDS" answers "sent FRAMES SECONDS". Ends with
// its input.

#include <arpa/inet.h>
#include <array>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <iostream>
#include <linux/if_packet.h>
#include <net/if.h>
#include <sched.h>
#include <stdexcept>
#include <string>
#include <sys/prctl.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

namespace {

constexpr std::uint16_t kServerPort = 80;
constexpr int kBatch = 64;

struct Setup {
  std::string nearSpace, farSpace, nearAddress, farAddress, nearLink, farLink;
  int clients = 0;
  int connections = 0;
};

using Frame = std::vector<unsigned char>;

int Check(int result, const char* what) {
  if (result < 0) throw std::runtime_error(std::string(what) + ": " + std::strerror(errno));
  return result;
}

void EnterNamespace(const std::string& name) {
  const int space = Check(open(("/run/netns/" + name).c_str(), O_RDONLY | O_CLOEXEC), "the namespace");
  Check(setns(space, CLONE_NEWNET), "entering the namespace");
  close(space);
}

sockaddr_in AddressOf(const std::string& text, std::uint16_t port) {
  sockaddr_in address{};
  address.sin_family = AF_INET;
  address.sin_port = htons(port);
  inet_pton(AF_INET, text.c_str(), &address.sin_addr);
  return address;
}

/// A child process that ends with its parent.
template <typename Work> pid_t StartChild(Work work) {
  const pid_t parent = getpid();
  const pid_t child = Check(fork(), "fork");
  if (child != 0) return child;
  prctl(PR_SET_PDEATHSIG, SIGKILL);
  if (getppid() != parent) _exit(1);
  try {
    work();
  } catch (const std::exception& fault) {
    std::fprintf(stderr, "live-traffic: %s\n", fault.what());
    _exit(1);
  }
  _exit(0);
}

int Listen(const Setup& setup) {
  EnterNamespace(setup.farSpace);
  const int listener = Check(socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0), "socket");
  const sockaddr_in address = AddressOf(setup.farAddress, kServerPort);
  Check(bind(listener, reinterpret_cast<const sockaddr*>(&address), sizeof address), "bind");
  Check(listen(listener, 1024), "listen");
  return listener;
}

void Serve(int listener) {
  while (accept(listener, nullptr, nullptr) >= 0) {
  }
}

/// Connects, tells the local ports and holds the connections.
void HoldConnections(const Setup& setup, int count, int report) {
  const sockaddr_in server = AddressOf(setup.farAddress, kServerPort);
  for (int i = 0; i < count; ++i) {
    const int connection = Check(socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0), "socket");
    Check(connect(connection, reinterpret_cast<const sockaddr*>(&server), sizeof server), "connect");
    sockaddr_in local{};
    socklen_t size = sizeof local;
    getsockname(connection, reinterpret_cast<sockaddr*>(&local), &size);
    const std::uint16_t port = ntohs(local.sin_port);
    Check(static_cast<int>(write(report, &port, sizeof port)), "report");
  }
  for (;;) pause();
}

std::vector<std::uint16_t> ConnectClients(const Setup& setup) {
  int report[2];
  Check(pipe2(report, O_CLOEXEC), "pipe");
  EnterNamespace(setup.nearSpace);
  std::vector<std::uint16_t> ports(static_cast<std::size_t>(setup.connections));
  const int each = setup.connections / setup.clients;
  for (int i = 0; i < setup.clients; ++i) StartChild([&] { HoldConnections(setup, each, report[1]); });
  ports.resize(static_cast<std::size_t>(each * setup.clients));
  for (auto& port : ports)
    if (read(report[0], &port, sizeof port) != sizeof port) throw std::runtime_error("a client failed");
  return ports;
}

Frame TcpFrame(const sockaddr_in& source, const sockaddr_in& target, std::size_t payload) {
  Frame frame(54 + payload);
  const std::array<unsigned char, 14> link = {2, 0xFF, 0, 0, 0, 9, 2, 0xFF, 0, 0, 0, 8, 8, 0};
  std::copy(link.begin(), link.end(), frame.begin());
  const std::size_t total = 40 + payload;
  frame[14] = 0x45;
  frame[16] = static_cast<unsigned char>(total >> 8);
  frame[17] = static_cast<unsigned char>(total);
  frame[22] = 64;
  frame[23] = 6;
  std::memcpy(&frame[26], &source.sin_addr, 4);
  std::memcpy(&frame[30], &target.sin_addr, 4);
  std::memcpy(&frame[34], &source.sin_port, 2);
  std::memcpy(&frame[36], &target.sin_port, 2);
  frame[46] = 0x50;
  frame[47] = 0x10;
  return frame;
}

/// One end of the link with the frames that leave from it in turn.
class Sender {
 public:
  Sender(const std::string& space, const std::string& link) {
    EnterNamespace(space);
    descriptor_ = Check(socket(AF_PACKET, SOCK_RAW | SOCK_CLOEXEC, 0), "packet socket");
    sockaddr_ll address{};
    address.sll_family = AF_PACKET;
    address.sll_ifindex = static_cast<int>(if_nametoindex(link.c_str()));
    Check(bind(descriptor_, reinterpret_cast<sockaddr*>(&address), sizeof address), "the link");
  }

  void Add(Frame frame) { frames_.push_back(std::move(frame)); }

  void Send(int count) {
    std::array<mmsghdr, kBatch> messages{};
    std::array<iovec, kBatch> parts{};
    for (int i = 0; i < count; ++i) {
      Frame& frame = frames_[next_++ % frames_.size()];
      parts[i] = {frame.data(), frame.size()};
      messages[i].msg_hdr.msg_iov = &parts[i];
      messages[i].msg_hdr.msg_iovlen = 1;
    }
    for (int done = 0; done < count;) {
      const int sent = sendmmsg(descriptor_, &messages[done], static_cast<unsigned>(count - done), 0);
      if (sent > 0)
        done += sent;
      else if (errno != ENOBUFS && errno != EAGAIN && errno != EINTR)
        Check(sent, "sending");
    }
  }

 private:
  int descriptor_ = -1;
  std::vector<Frame> frames_;
  std::size_t next_ = 0;
};

/// Both ways in turn, two full frames and an acknowledgement each way: what bulk traffic on a link looks
/// like.
void AddFrames(Sender& near, Sender& far, const Setup& setup, const std::vector<std::uint16_t>& ports) {
  const sockaddr_in server = AddressOf(setup.farAddress, kServerPort);
  for (const std::size_t payload : {1460, 1460, 0}) {
    for (const std::uint16_t port : ports) {
      const sockaddr_in client = AddressOf(setup.nearAddress, port);
      near.Add(TcpFrame(client, server, payload));
      far.Add(TcpFrame(server, client, payload));
    }
  }
}

void SendAtRate(Sender& near, Sender& far, long rate, double seconds) {
  using Clock = std::chrono::steady_clock;
  const auto start = Clock::now();
  const long all = static_cast<long>(rate * seconds);
  long sent = 0;
  bool fromNear = false;
  while (sent < all) {
    const double passed = std::chrono::duration<double>(Clock::now() - start).count();
    long due = std::min(all, static_cast<long>(passed * rate)) - sent;
    while (due >= kBatch || (due > 0 && sent + due == all)) {
      const int count = static_cast<int>(std::min<long>(due, kBatch));
      (fromNear ? near : far).Send(count);
      fromNear = !fromNear;
      sent += count;
      due -= count;
    }
    const timespec rest{0, 500000};
    nanosleep(&rest, nullptr);
  }
  std::printf("sent %ld %.3f\n", sent, std::chrono::duration<double>(Clock::now() - start).count());
  std::fflush(stdout);
}

void RunTraffic(const Setup& setup) {
  const int listener = Listen(setup);
  StartChild([&] { Serve(listener); });
  close(listener);
  const auto ports = ConnectClients(setup);
  Sender near(setup.nearSpace, setup.nearLink);
  Sender far(setup.farSpace, setup.farLink);
  AddFrames(near, far, setup, ports);
  std::puts("ready");
  std::fflush(stdout);

  std::string word;
  long rate = 0;
  double seconds = 0;
  while (std::cin >> word >> rate >> seconds) SendAtRate(near, far, rate, seconds);
}

} // namespace

int main(int argc, char** argv) {
  if (argc != 9) {
    std::fprintf(stderr,
                 "usage: live-traffic NEAR-NS FAR-NS NEAR-ADDRESS FAR-ADDRESS NEAR-LINK FAR-LINK CLIENTS "
                 "CONNECTIONS\n");
    return 2;
  }
  try {
    RunTraffic(
        {argv[1], argv[2], argv[3], argv[4], argv[5], argv[6], std::atoi(argv[7]), std::atoi(argv[8])});
  } catch (const std::exception& fault) {
    std::fprintf(stderr, "live-traffic: %s\n", fault.what());
    return 1;
  }
  return 0;
}
