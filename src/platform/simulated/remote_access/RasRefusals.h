#pragma once

#include "platform/remote_access/RemoteAccessNumbers.h"

#include <map>
#include <string>

namespace quendra::platform::simulated {

/// Operations that a test makes fail, by their names, and how often each was called.
class RasRefusals {
 public:
  void Refuse(const std::string& operation, std::uint32_t error, int after) {
    refused_[operation] = {error, Calls(operation) + after};
  }
  void Allow(const std::string& operation) { refused_.erase(operation); }
  int Calls(const std::string& operation) const {
    const auto found = calls_.find(operation);
    return found == calls_.end() ? 0 : found->second;
  }
  /// Counts a call. 0 when it may go on.
  std::uint32_t Enter(const std::string& operation) {
    const int call = calls_[operation]++;
    const auto found = refused_.find(operation);
    return found == refused_.end() || call < found->second.from ? 0 : found->second.error;
  }

 private:
  struct Refusal {
    std::uint32_t error;
    int from; ///< the first call that is refused, counted from 0
  };
  std::map<std::string, Refusal> refused_;
  std::map<std::string, int> calls_;
};

} // namespace quendra::platform::simulated
