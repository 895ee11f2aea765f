#include "platform/simulated/net/SocketFailures.h"

#include "platform/net/SocketNumbers.h"

namespace quendra::platform::simulated {

void SocketFailures::Script(const std::string& operation, std::int32_t error, int times) {
  auto& failures = scripted_[operation];
  failures.insert(failures.end(), static_cast<std::size_t>(times), error);
}

bool SocketFailures::TakeScripted(const std::string& operation) {
  ++calls_[operation];
  const auto failures = scripted_.find(operation);
  if (failures == scripted_.end() || failures->second.empty()) return false;
  lastError_ = failures->second.front();
  failures->second.pop_front();
  return true;
}

int SocketFailures::Calls(const std::string& operation) const {
  const auto found = calls_.find(operation);
  return found == calls_.end() ? 0 : found->second;
}

std::int32_t SocketFailures::Refuse(std::int32_t error) {
  lastError_ = error;
  return kSocketError;
}

} // namespace quendra::platform::simulated
