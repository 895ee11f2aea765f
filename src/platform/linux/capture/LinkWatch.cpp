#include "platform/linux/capture/LinkWatch.h"

#include <cerrno>
#include <linux/netlink.h>
#include <linux/rtnetlink.h>
#include <sys/socket.h>

namespace quendra::platform::linux_ {

namespace {

/// Bounds one turn of the loop; what is left rings again.
constexpr int kMostMessages = 256;

Descriptor OpenLinkSocket() {
  Descriptor opened(::socket(AF_NETLINK, SOCK_RAW | SOCK_NONBLOCK | SOCK_CLOEXEC, NETLINK_ROUTE));
  sockaddr_nl address{};
  address.nl_family = AF_NETLINK;
  address.nl_groups = RTMGRP_LINK | RTMGRP_IPV4_IFADDR;
  if (!opened || ::bind(opened.Number(), reinterpret_cast<sockaddr*>(&address), sizeof address) != 0)
    return {};
  return opened;
}

/// The bytes of a message are of no interest, so each is cut to nothing.
void DiscardMessages(int descriptor) {
  for (int i = 0; i < kMostMessages; ++i) {
    char nothing = 0;
    // An overflow of the kernel's buffer is told as a failure, once.
    if (::recv(descriptor, &nothing, sizeof nothing, MSG_TRUNC) < 0 && errno != ENOBUFS) return;
  }
}

} // namespace

LinkWatch::LinkWatch(DescriptorWatch& descriptors, std::function<void()> changed)
    : socket_(OpenLinkSocket()) {
  if (!socket_) return;
  watch_ = descriptors.WatchDescriptor(socket_.Number(),
                                       [descriptor = socket_.Number(), changed = std::move(changed)] {
                                         DiscardMessages(descriptor);
                                         changed();
                                       });
}

} // namespace quendra::platform::linux_
