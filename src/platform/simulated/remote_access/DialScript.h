#pragma once

#include "platform/remote_access/RemoteAccessNumbers.h"

#include <deque>
#include <functional>

namespace quendra::platform::simulated {

/// What a dial goes through, step by step, as in `Dial("Home").Then(5).ThenError(691)`. A script that ends
/// with neither an error nor a connection leaves the dial where it is.
class DialScript {
 public:
  struct Step {
    std::uint32_t state = 0;
    std::uint32_t error = 0;
    /// What happens in place of a change that is told.
    std::function<void()> meanwhile{};
  };

  DialScript& Then(std::uint32_t state) { return Add({state}); }
  /// The dial fails in the state that it had come to.
  DialScript& ThenError(std::uint32_t error) { return ThenError(error, LastState()); }
  DialScript& ThenError(std::uint32_t error, std::uint32_t state) { return Add({state, error}); }
  DialScript& ThenConnected() { return Then(kRasConnected); }
  DialScript& ThenDisconnected() { return Then(kRasDisconnected); }
  /// Another program does something, or the user.
  DialScript& Meanwhile(std::function<void()> action) { return Add({LastState(), 0, std::move(action)}); }

  bool IsEmpty() const { return steps_.empty(); }
  Step TakeFirst() {
    Step first = std::move(steps_.front());
    steps_.pop_front();
    return first;
  }
  void Append(const DialScript& more) { steps_.insert(steps_.end(), more.steps_.begin(), more.steps_.end()); }

 private:
  std::uint32_t LastState() const { return steps_.empty() ? kRasOpenPort : steps_.back().state; }
  DialScript& Add(Step step) {
    steps_.push_back(std::move(step));
    return *this;
  }

  std::deque<Step> steps_;
};

} // namespace quendra::platform::simulated
