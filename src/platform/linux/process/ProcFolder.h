#pragma once

#include "platform/linux/process/ExecutableFile.h"
#include "platform/linux/system/Descriptor.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace quendra::platform::linux_ {

/// The process that the system starts first and that no other has started.
inline constexpr std::uint32_t kFirstProcess = 1;

/// What /proc tells of one process in its line of figures.
struct ProcessStat {
  std::string comm;
  char state = '?';
  std::uint32_t parent = 0;
  bool isKernelThread = false;
  std::uint64_t startTime = 0;

  bool HasEnded() const { return state == 'Z' || state == 'X'; }
};

/// Reads that line. The name in it may hold brackets, blanks and line breaks; nothing when the line is no
/// such line.
std::optional<ProcessStat> ParseStat(std::string_view line);

/// The processes under /proc. All answers are of the moment: a process can be gone before the next question.
class ProcFolder {
 public:
  explicit ProcFolder(std::string root = "/proc");

  /// A process's folder. The node number stays the same while the process lives, as far as the kernel
  /// remembers the folder, and a process that takes over the id has another one; 0 when unknown.
  struct Place {
    std::uint32_t processId = 0;
    std::uint64_t node = 0;
  };

  /// In ascending order of the ids; false when /proc can't be read.
  bool List(std::vector<Place>& places) const;
  std::optional<ProcessStat> Stat(std::uint32_t processId) const;
  static std::optional<ProcessStat> Stat(const Descriptor& processFolder);
  /// The process's folder, to be asked about this very process even when its id is taken over.
  Descriptor Open(std::uint32_t processId) const;
  /// The effective user id.
  std::optional<std::uint32_t> UserOf(std::uint32_t processId) const;
  /// Whether one of its threads runs: the figures of a process are those of its first one.
  bool HasLivingThread(std::uint32_t processId) const;
  /// The path of the executable; nothing when there is none or it may not be known.
  std::optional<std::string> Executable(std::uint32_t processId) const;
  static std::optional<ExecutableFile> Executable(const Descriptor& processFolder);
  /// The socket that a descriptor of the process stands for, by its node number; 0 when it is no socket or
  /// can't be read.
  std::uint32_t SocketOf(std::uint32_t processId, std::uint32_t descriptor) const;
  /// The content of a file of the folder, up to 1 MB.
  std::optional<std::string> File(const std::string& name) const;

  /// The descriptors of one process.
  class Descriptors {
   public:
    Descriptors(const ProcFolder& folder, std::uint32_t processId);
    /// False when the process is gone or its descriptors may not be seen.
    explicit operator bool() const { return static_cast<bool>(folder_); }
    void List(std::vector<std::uint32_t>& numbers);
    std::uint32_t SocketOf(std::uint32_t descriptor) const;

   private:
    Descriptor OfThread() const;

    int processes_;
    std::uint32_t processId_;
    Descriptor folder_;
  };

 private:
  std::string root_;
  Descriptor folder_;
};

} // namespace quendra::platform::linux_
