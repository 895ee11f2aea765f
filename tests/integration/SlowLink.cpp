#include "integration/SlowLink.h"

#include "integration/SocketHelpers.h"

#include <linux/if.h>
#include <linux/if_tun.h>
#include <poll.h>
#include <sys/ioctl.h>

namespace quendra::integration {

namespace {

int OpenEnd(const NetworkNamespace& host, const char* name) {
  host.Enter();
  const int end = Check(open("/dev/net/tun", O_RDWR | O_CLOEXEC | O_NONBLOCK), "tun");
  ifreq request{};
  request.ifr_flags = IFF_TUN | IFF_NO_PI;
  std::strncpy(request.ifr_name, name, IFNAMSIZ - 1);
  Check(ioctl(end, TUNSETIFF, &request), name);
  host.Leave();
  return end;
}

std::optional<Bytes> ReadPacket(int end) {
  Bytes packet(65536);
  const ssize_t size = read(end, packet.data(), packet.size());
  if (size <= 0) return {};
  packet.resize(static_cast<std::size_t>(size));
  return packet;
}

} // namespace

SlowLink::SlowLink(const NetworkNamespace& near, const NetworkNamespace& far, Rule rule)
    : rule_(std::move(rule)), near_(OpenEnd(near, "qfwd")), far_(OpenEnd(far, "qback")) {
  Check(pipe2(stop_, O_CLOEXEC), "pipe");
  thread_ = std::thread([this] { Carry(); });
}

SlowLink::~SlowLink() {
  close(stop_[1]);
  thread_.join();
  for (const int end : {stop_[0], near_, far_}) close(end);
}

void SlowLink::Carry() {
  while (true) {
    pollfd ends[]{{near_, POLLIN, 0}, {far_, POLLIN, 0}, {stop_[0], POLLIN, 0}};
    poll(ends, 3, MillisecondsToNext());
    if (ends[2].revents != 0) return;
    TakeFromNear();
    TakeFromFar();
    DeliverDue();
  }
}

void SlowLink::TakeFromNear() {
  const auto packet = ReadPacket(near_);
  if (!packet) return;
  const Passing passing = rule_(*packet);
  for (const Bytes& forged : passing.forged) waiting_.insert({Clock::now(), {near_, forged}});
  if (passing.delay)
    waiting_.insert({Clock::now() + std::chrono::milliseconds(*passing.delay), {far_, *packet}});
}

void SlowLink::TakeFromFar() {
  if (auto packet = ReadPacket(far_)) waiting_.insert({Clock::now(), {near_, std::move(*packet)}});
}

void SlowLink::DeliverDue() {
  while (!waiting_.empty() && waiting_.begin()->first <= Clock::now()) {
    const Waiting& next = waiting_.begin()->second;
    // A packet that the host can't take is lost, as on any link.
    [[maybe_unused]] const ssize_t written = write(next.end, next.packet.data(), next.packet.size());
    waiting_.erase(waiting_.begin());
  }
}

int SlowLink::MillisecondsToNext() const {
  if (waiting_.empty()) return -1;
  const auto left = waiting_.begin()->first - Clock::now();
  return std::max(0, static_cast<int>(std::chrono::ceil<std::chrono::milliseconds>(left).count()));
}

} // namespace quendra::integration
