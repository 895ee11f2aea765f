#pragma once

#include <cstdint>
#include <deque>
#include <map>
#include <string>

namespace quendra::platform::simulated {

/// Which calls a test has told to fail, how often each operation was called, and the number that
/// WSAGetLastError gives.
class SocketFailures {
 public:
  /// The next calls of an operation, by its name, fail with an error number.
  void Script(const std::string& operation, std::int32_t error, int times);
  /// Counts a call. True when it is told to fail; the last error is set then.
  bool TakeScripted(const std::string& operation);
  int Calls(const std::string& operation) const;

  /// Sets the last error and gives what a number that fails is.
  std::int32_t Refuse(std::int32_t error);
  std::int32_t LastError() const { return lastError_; }

 private:
  std::int32_t lastError_ = 0;
  std::map<std::string, std::deque<std::int32_t>> scripted_;
  std::map<std::string, int> calls_;
};

} // namespace quendra::platform::simulated
