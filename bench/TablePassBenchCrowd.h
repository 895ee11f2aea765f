#pragma once

#include <sys/types.h>

#include <vector>

namespace quendra::bench {

/// Idle processes with connected TCP sockets between them, in a network namespace into which the calling
/// process goes for good. They end with the object, and with the calling process however that ends.
class TableCrowd {
 public:
  /// Throws when the namespace, a process or a socket can't be made. Counts are rounded up to even ones.
  TableCrowd(int processes, int sockets);
  ~TableCrowd();
  TableCrowd(const TableCrowd&) = delete;

 private:
  void StartHolder(const std::vector<int>& held);

  std::vector<pid_t> children_;
};

} // namespace quendra::bench
