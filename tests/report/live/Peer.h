#pragma once

#include <string>
#include <sys/types.h>
#include <vector>

namespace quendra::report {

/// A server that isn't the program's, run by its own executable in the thread's network namespace. It leads a
/// process group of its own, which ends with the object, and dies with the test.
class Peer {
 public:
  explicit Peer(const std::vector<std::string>& command);
  ~Peer();
  Peer(const Peer&) = delete;

  /// What it prints first, without the line end; throws when nothing comes in ten seconds.
  std::string FirstLine();
  /// Until something accepts connections at this port of loopback; throws after ten seconds.
  void AwaitPort(int port);
  bool IsAlive();

 private:
  pid_t process_ = -1;
  int output_ = -1;
};

/// Empty for a program that isn't installed.
std::string PathOfProgram(const std::string& name);

} // namespace quendra::report
