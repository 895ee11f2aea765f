#pragma once

#include "platform/DescriptorWatch.h"
#include "platform/Machine.h"

#include <memory>
#include <string>

namespace quendra::platform::linux_ {

class LinuxCapture;

/// This machine: the operations that the program asks for, made from /proc, netlink, desktop entries and
/// libpcap.
class LinuxMachine {
 public:
  /// `procRoot` is where the processes are found; tests give a folder of their own making.
  LinuxMachine(EventLoop& loop, DescriptorWatch& descriptors, const std::string& procRoot = "/proc");
  ~LinuxMachine();

  Machine Operations();
  /// For its counters.
  LinuxCapture& Capture();

 private:
  struct Parts;
  std::unique_ptr<Parts> parts_;
};

} // namespace quendra::platform::linux_
