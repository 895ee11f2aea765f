#pragma once

#include "platform/DescriptorWatch.h"
#include "platform/Machine.h"

#include <functional>
#include <memory>
#include <string>

namespace quendra::platform::linux_ {

class LinuxCapture;

/// This machine: the operations that the program asks for, made from /proc, netlink, desktop entries and
/// libpcap.
class LinuxMachine {
 public:
  /// Hears under which path a damaged file is kept.
  using DamagedFileNotice = std::function<void(const std::string& keptAs)>;

  /// `tellOfDamagedRegistry` is called in the midst of an operation of the registry.
  LinuxMachine(EventLoop& loop, DescriptorWatch& descriptors, DamagedFileNotice tellOfDamagedRegistry = {});
  ~LinuxMachine();

  Machine Operations();
  /// For its counters.
  LinuxCapture& Capture();

 private:
  struct Parts;
  std::unique_ptr<Parts> parts_;
};

} // namespace quendra::platform::linux_
