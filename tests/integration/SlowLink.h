#pragma once

#include "integration/NetworkNamespace.h"
#include "integration/Packets.h"

#include <chrono>
#include <functional>
#include <map>
#include <optional>
#include <thread>

namespace quendra::integration {

/// A link of two hosts, carried by the test itself: it may delay or lose what the near host sends, and make
/// up what the near host hears.
class SlowLink {
 public:
  struct Passing {
    std::optional<int> delay = 0; ///< in milliseconds; nothing for a packet that is lost
    std::vector<Bytes> forged{};  ///< reach the near host at once
  };
  /// Called for each packet of the near host, on a thread of the link's own.
  using Rule = std::function<Passing(const Bytes& packet)>;

  /// Makes the link "qfwd" on the near host and "qback" on the far one, which both wait for their addresses.
  SlowLink(const NetworkNamespace& near, const NetworkNamespace& far, Rule rule);
  ~SlowLink();
  SlowLink(const SlowLink&) = delete;

 private:
  using Clock = std::chrono::steady_clock;
  struct Waiting {
    int end;
    Bytes packet;
  };

  void Carry();
  void TakeFromNear();
  void TakeFromFar();
  void DeliverDue();
  int MillisecondsToNext() const;

  Rule rule_;
  int near_;
  int far_;
  int stop_[2];
  std::multimap<Clock::time_point, Waiting> waiting_;
  std::thread thread_;
};

} // namespace quendra::integration
