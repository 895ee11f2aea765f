#pragma once

#include "integration/Packets.h"

#include <linux/if_packet.h>
#include <net/ethernet.h>
#include <net/if.h>
#include <stdexcept>
#include <string>
#include <sys/socket.h>
#include <unistd.h>
#include <vector>

namespace quendra::integration {

/// One end of a link, through which frames are sent as they are.
class RawLink {
 public:
  explicit RawLink(const std::string& interface)
      : descriptor_(socket(AF_PACKET, SOCK_RAW | SOCK_CLOEXEC, 0)) {
    sockaddr_ll address{};
    address.sll_family = AF_PACKET;
    address.sll_ifindex = static_cast<int>(if_nametoindex(interface.c_str()));
    if (descriptor_ < 0 || bind(descriptor_, reinterpret_cast<sockaddr*>(&address), sizeof address) != 0)
      throw std::runtime_error("no raw link on " + interface);
  }
  ~RawLink() { close(descriptor_); }
  RawLink(const RawLink&) = delete;
  RawLink& operator=(const RawLink&) = delete;

  void Send(const Bytes& frame) {
    if (send(descriptor_, frame.data(), frame.size(), 0) != static_cast<ssize_t>(frame.size()))
      throw std::runtime_error("a frame couldn't be sent");
  }
  /// In one call, so that nothing comes between them.
  void SendTogether(std::vector<Bytes> frames) {
    std::vector<iovec> parts(frames.size());
    std::vector<mmsghdr> messages(frames.size());
    for (std::size_t i = 0; i < frames.size(); ++i) {
      parts[i] = {frames[i].data(), frames[i].size()};
      messages[i].msg_hdr.msg_iov = &parts[i];
      messages[i].msg_hdr.msg_iovlen = 1;
    }
    if (sendmmsg(descriptor_, messages.data(), static_cast<unsigned>(messages.size()), 0) !=
        static_cast<int>(frames.size()))
      throw std::runtime_error("frames couldn't be sent");
  }

 private:
  int descriptor_;
};

} // namespace quendra::integration
