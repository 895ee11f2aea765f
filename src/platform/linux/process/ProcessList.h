#pragma once

#include "platform/linux/process/ProcFolder.h"
#include "platform/linux/system/Clock.h"

#include <string>
#include <unordered_map>
#include <vector>

namespace quendra::platform::linux_ {

/// The running processes under the names that they go by: process 1 as "services.exe", the parent of the
/// kernel's threads as "System", the session's desktop shell as "explorer.exe", others by their executable's
/// file name, or the name that the kernel has for them where the executable can't be seen. Processes that
/// have ended and wait for their parent are left out.
class ProcessList {
 public:
  explicit ProcessList(const ProcFolder& folder, Clock clock = CoarseMilliseconds);

  struct Row {
    std::uint32_t processId = 0;
    std::uint32_t parentProcessId = 0;
    std::string name; ///< in the code page, at most 259 bytes
    std::uint64_t startTime = 0;
  };

  /// The processes of this moment, "System" first, then in the order in which they were started; false when
  /// they can't be listed. No parent is 0: that of "System" and of process 1 is "System", and for one that
  /// can't be seen there is an id that no process has. A process known from before is looked at again while
  /// it is young, since it may yet become another program, and from time to time later.
  bool Read(std::vector<Row>& rows);
  /// When the process of this id started, as it was last read; nothing when it wasn't there.
  std::optional<std::uint64_t> StartTimeOf(std::uint32_t processId) const;

  static constexpr std::uint64_t kYoungMilliseconds = 3000;
  static constexpr std::uint64_t kRereadMilliseconds = 15000;
  static constexpr std::size_t kNameLength = 259;

 private:
  struct Known {
    std::uint64_t node = 0;
    std::uint64_t firstSeen = 0;
    std::uint64_t readAt = 0;
    std::uint64_t startTime = 0;
    std::uint32_t parent = 0;
    int shellRank = 0; ///< 0 for no desktop shell; of the others the lowest is the best
    bool ended = false;
    bool isSystem = false;
    std::string comm;
    std::string name;
  };

  bool IsDue(const Known& known, const ProcFolder::Place& place, std::uint64_t now) const;
  bool Update(Known& known, const ProcFolder::Place& place, std::uint64_t now);
  void NameIt(Known& known, std::uint32_t processId, const ProcessStat& stat);
  bool BelongsToSession(std::uint32_t processId) const;
  void NameDesktopShell(std::vector<Row>& rows) const;
  void PutInOrder(std::vector<Row>& rows) const;

  const ProcFolder& folder_;
  Clock clock_;
  std::unordered_map<std::uint32_t, Known> known_, previous_;
  std::vector<ProcFolder::Place> places_;
  std::uint64_t lastRead_ = 0;
  std::size_t rereads_ = 0;
  std::size_t mostRereads_ = 0;
};

/// The place of a desktop shell in the order of preference, from 1; 0 for any other program.
int DesktopShellRank(std::string_view fileName);

} // namespace quendra::platform::linux_
