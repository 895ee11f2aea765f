#pragma once

#include "platform/linux/net/SocketDiagnostics.h"
#include "platform/linux/process/ProcFolder.h"
#include "platform/linux/system/Clock.h"

#include <span>
#include <unordered_map>
#include <unordered_set>
#include <vector>

namespace quendra::platform::linux_ {

/// Which process has a socket. Reading every descriptor of every process costs a hundred times what the rest
/// of a table does, so what is known is kept and looked at again from time to time, and what is new is
/// searched where it is likely.
class SocketOwners {
 public:
  struct Rights {
    bool everyProcess = false; ///< may read the descriptors of all processes
    std::uint32_t user = 0;    ///< else of this user's alone
  };

  SocketOwners(const ProcFolder& folder, Rights rights, Clock clock = CoarseMilliseconds);

  /// Brings the owners up to date for a new list of sockets. Those missing in it are forgotten.
  void Update(std::span<const TcpSocket> sockets);
  /// 0 for a socket without a known owner. Of several processes that inherited a socket it is the one that
  /// handed it down; process 1, which opens sockets for services, only when nobody else has it.
  std::uint32_t OwnerOf(std::uint32_t socketNode) const;

  /// Processes whose descriptors the last update read.
  std::size_t ProcessesRead() const { return processesRead_; }

  /// An owner is looked at again after the first of these, then after twice as long, up to the second.
  static constexpr std::uint64_t kFirstCheckMilliseconds = 1000;
  static constexpr std::uint64_t kLastCheckMilliseconds = 8000;
  /// A socket whose owner wasn't found is searched again after the first of these, then after twice as long,
  /// up to the second.
  static constexpr std::uint64_t kFirstRetryMilliseconds = 2000;
  static constexpr std::uint64_t kLastRetryMilliseconds = 64000;

 private:
  struct Owner {
    std::uint32_t processId = 0; ///< 0 while nobody was found
    std::uint32_t descriptor = 0;
    std::uint64_t due = 0;
    std::uint64_t wait = 0;
    std::uint32_t update = 0;
  };

  void Note(const TcpSocket& socket);
  void CheckAgain(std::uint32_t node, Owner& owner);
  void ForgetMissing();
  void Search();
  bool SearchIn(std::uint32_t processId);
  void Found(std::uint32_t node, std::uint32_t processId, std::uint32_t descriptor);
  std::vector<std::uint32_t> LikelyProcesses();
  std::uint32_t ParentOf(std::uint32_t processId);
  static std::uint64_t PlaceKey(std::uint32_t processId, std::uint32_t descriptor) {
    return (std::uint64_t{processId} << 32) | descriptor;
  }

  const ProcFolder& folder_;
  Rights rights_;
  Clock clock_;
  std::unordered_map<std::uint32_t, Owner> owners_;
  std::unordered_set<std::uint64_t> knownDescriptors_;
  std::unordered_map<std::uint32_t, std::uint32_t>
      lastFind_; ///< the update in which a process last had a new socket
  std::unordered_map<std::uint32_t, std::uint64_t> seenNodes_; ///< the processes at the last search
  std::unordered_map<std::uint32_t, std::uint32_t> parents_;   ///< asked in this update

  std::unordered_set<std::uint32_t> unknown_; ///< sockets to search in this update
  std::unordered_set<std::uint32_t> read_;    ///< processes whose descriptors this update has read
  std::vector<std::uint32_t> numbers_;
  std::uint64_t now_ = 0;
  std::uint32_t update_ = 0;
  std::size_t checks_ = 0;
  std::size_t mostChecks_ = 0;
  std::size_t processesRead_ = 0;
};

} // namespace quendra::platform::linux_
