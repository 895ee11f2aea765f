#pragma once

#include "platform/EventLoop.h"
#include "platform/net/HostNames.h"
#include "platform/net/Sockets.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// Name look-ups on threads of their own, a bounded number at a time; what they find comes through the loop.
class NameLookUps {
 public:
  static constexpr int kMostThreads = 16;

  /// The addresses or an error number of the socket library.
  using Done = std::function<void(std::int32_t error, const std::vector<Ipv4Address>& addresses)>;

  NameLookUps(EventLoop& loop, HostNames& hostNames);
  /// Look-ups under way end without a call of `done`.
  ~NameLookUps();

  /// The look-up's handle, kNoLookUp when the system has no thread for it. `done` runs from the loop, never
  /// before this returns.
  LookUpHandle Start(const std::string& name, Done done);
  /// False when it isn't under way any more.
  bool Cancel(LookUpHandle lookUp);

 private:
  struct Shared;
  static void Work(const std::shared_ptr<Shared>& shared);

  HostNames& hostNames_;
  std::shared_ptr<Shared> shared_;
};

} // namespace quendra::platform::linux_
