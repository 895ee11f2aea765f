#pragma once

#include "platform/linux/system/Clock.h"

#include <sys/types.h>

#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// A folder of a test's own, gone with the object.
class TemporaryFolder {
 public:
  TemporaryFolder();
  ~TemporaryFolder();
  TemporaryFolder(const TemporaryFolder&) = delete;

  const std::string& Path() const { return path_; }
  std::string operator/(const std::string& name) const { return path_ + "/" + name; }
  /// Writes a file, making the folders above it; gives its path.
  std::string Write(const std::string& name, const std::string& content, bool isProgram = false) const;

 private:
  std::string path_;
};

/// Changes of this process's environment, undone with the object.
class Environment {
 public:
  Environment() = default;
  ~Environment();
  Environment(const Environment&) = delete;

  /// Without a value the variable is taken away.
  void Set(const std::string& name, const std::optional<std::string>& value);

 private:
  std::map<std::string, std::optional<std::string>> before_;
};

/// A made-up /proc.
class FakeProc {
 public:
  struct Process {
    std::string comm;
    std::uint32_t parent = 1;
    std::string executable{}; ///< empty for one that can't be seen
    char state = 'S';
    bool isKernelThread = false;
    std::uint64_t startTime = 100;
  };

  const std::string& Path() const { return folder_.Path(); }
  void Add(std::uint32_t processId, const Process& process);
  /// Writes the figures anew, as when a process becomes another program; the folder stays.
  void Change(std::uint32_t processId, const Process& process);
  /// Another process under the id, in a folder of its own.
  void TakeOver(std::uint32_t processId, const Process& process);
  void Remove(std::uint32_t processId);
  void AddDescriptor(std::uint32_t processId, std::uint32_t descriptor, const std::string& target);
  void AddSocket(std::uint32_t processId, std::uint32_t descriptor, std::uint32_t node);
  void RemoveDescriptor(std::uint32_t processId, std::uint32_t descriptor);
  /// A thread of the process with figures, an executable and descriptors of its own.
  void AddThread(std::uint32_t processId, std::uint32_t threadId, const Process& figures);
  void AddSocketOfThread(std::uint32_t processId, std::uint32_t threadId, std::uint32_t descriptor,
                         std::uint32_t node);
  std::string FolderOf(std::uint32_t processId) const { return folder_ / std::to_string(processId); }

 private:
  TemporaryFolder folder_;
};

/// A clock that stands until the test moves it.
struct TestClock {
  std::uint64_t now = 1'000'000;
  Clock AsClock() {
    return [this] { return now; };
  }
};

/// A process of the test's own that runs `work` after it has said that it is there, and then waits to be
/// ended.
class Child {
 public:
  /// Returns when the child's `work` has returned. What `work` returns is in Answer().
  explicit Child(const std::function<std::string()>& work);
  /// A program; returns when it runs in place of the child.
  explicit Child(const std::vector<std::string>& command);
  ~Child();
  Child(const Child&) = delete;

  pid_t Id() const { return id_; }
  const std::string& Answer() const { return answer_; }
  void End();

 private:
  pid_t id_ = -1;
  std::string answer_;
};

/// Runs each of these in a process of its own, all at the same time; gives what they returned.
std::vector<std::string> AtOnce(const std::vector<std::function<std::string()>>& works);

/// A process of the test's own whose first thread has ended while another waits to be ended. It inherits what
/// the test has open.
class ProcessWithoutFirstThread {
 public:
  ProcessWithoutFirstThread();
  ~ProcessWithoutFirstThread();
  ProcessWithoutFirstThread(const ProcessWithoutFirstThread&) = delete;

  std::uint32_t Id() const { return static_cast<std::uint32_t>(id_); }

 private:
  pid_t id_ = -1;
};

/// Asks again until `done` says so, for two seconds at most; false when the time ran out.
bool Wait(const std::function<bool()>& done);

/// Runs a command of the shell, bounded by its own nature; true for status 0.
bool RunShell(const std::string& command);

/// Bytes as they lie in memory, for records that tests put together.
template <typename Record> void Append(std::vector<std::uint8_t>& bytes, const Record& record) {
  const auto* start = reinterpret_cast<const std::uint8_t*>(&record);
  for (std::size_t i = 0; i < sizeof record; ++i) bytes.push_back(start[i]);
}

} // namespace quendra::platform::linux_
