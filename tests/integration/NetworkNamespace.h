#pragma once

#include <cstdlib>
#include <fcntl.h>
#include <fstream>
#include <sched.h>
#include <stdexcept>
#include <string>
#include <unistd.h>

namespace quendra::integration {

/// Puts the calling thread in a network namespace of its own, where nothing but what the test makes is to be
/// heard, and back in the old one at the end. The namespace goes with its last process.
class NetworkNamespace {
 public:
  static constexpr const char* kSkipReason = "network namespaces can't be made here (needs root)";

  NetworkNamespace() : outside_(open("/proc/thread-self/ns/net", O_RDONLY | O_CLOEXEC)) {
    if (outside_ < 0 || unshare(CLONE_NEWNET) != 0) {
      if (outside_ >= 0) close(outside_);
      throw std::runtime_error(kSkipReason);
    }
    inside_ = open("/proc/thread-self/ns/net", O_RDONLY | O_CLOEXEC);
    // Router solicitations and the like would come at times of their own.
    Set("net/ipv6/conf/default/disable_ipv6", "1");
    Set("net/ipv6/conf/all/disable_ipv6", "1");
  }
  ~NetworkNamespace() {
    setns(outside_, CLONE_NEWNET);
    close(outside_);
    close(inside_);
  }
  NetworkNamespace(const NetworkNamespace&) = delete;
  NetworkNamespace& operator=(const NetworkNamespace&) = delete;

  /// The thread goes in or out for a while.
  void Enter() const { setns(inside_, CLONE_NEWNET); }
  void Leave() const { setns(outside_, CLONE_NEWNET); }
  int Descriptor() const { return inside_; }

  /// Whether this process may make one.
  static bool Possible() {
    try {
      const NetworkNamespace attempt;
      return true;
    } catch (const std::runtime_error&) {
      return false;
    }
  }

  /// A setting under /proc/sys of the thread's namespace.
  static bool Set(const std::string& setting, const std::string& value) {
    std::ofstream file("/proc/sys/" + setting);
    return static_cast<bool>(file << value << std::flush);
  }

 private:
  int outside_ = -1;
  int inside_ = -1;
};

/// Runs a command of the shell in the thread's namespace.
inline void RunCommand(const std::string& command) {
  if (std::system(command.c_str()) != 0) throw std::runtime_error("failed: " + command);
}

} // namespace quendra::integration
