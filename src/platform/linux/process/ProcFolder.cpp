#include "platform/linux/process/ProcFolder.h"

#include "platform/linux/system/Files.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/syscall.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <climits>
#include <cstddef>
#include <cstdio>
#include <cstring>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint32_t kKernelThreadFlag = 0x00200000;
constexpr std::size_t kFileLimit = 1 << 20;
constexpr std::size_t kMostThreads = 8;

struct DirectoryEntry {
  std::uint64_t node;
  std::int64_t offset;
  std::uint16_t length;
  std::uint8_t type;
};
constexpr std::size_t kNameOffset = offsetof(DirectoryEntry, type) + 1;

/// Calls `visit(name, node)` for each entry. The C library's reader allocates for each folder that it opens,
/// which shows when thousands are read.
template <typename Visit> bool ForEachEntry(int folder, Visit visit) {
  if (::lseek(folder, 0, SEEK_SET) < 0) return false;
  alignas(8) char buffer[32768];
  for (;;) {
    const long count = ::syscall(SYS_getdents64, folder, buffer, sizeof buffer);
    if (count < 0) return false;
    if (count == 0) return true;
    for (long at = 0; at < count;) {
      DirectoryEntry entry;
      std::memcpy(&entry, buffer + at, kNameOffset);
      visit(std::string_view(buffer + at + kNameOffset), entry.node);
      at += entry.length;
    }
  }
}

/// Splits on blanks, which separate the figures after the name.
class Fields {
 public:
  explicit Fields(std::string_view text) : rest_(text) {}
  std::string_view Next() {
    while (rest_.starts_with(' ')) rest_.remove_prefix(1);
    const auto field = rest_.substr(0, rest_.find_first_of(" \n"));
    rest_.remove_prefix(field.size());
    return field;
  }
  void Skip(int count) {
    while (count-- > 0) Next();
  }
  template <typename Number> bool Read(Number& value) {
    const auto field = Next();
    return std::from_chars(field.data(), field.data() + field.size(), value).ec == std::errc();
  }

 private:
  std::string_view rest_;
};

using Name = std::array<char, 48>;

Name NameOf(std::uint32_t processId, const char* file) {
  Name name;
  std::snprintf(name.data(), name.size(), file[0] == '\0' ? "%u" : "%u/%s", processId, file);
  return name;
}

std::uint32_t SocketAt(int folder, const char* name) {
  std::array<char, 64> text;
  const ssize_t length = ::readlinkat(folder, name, text.data(), text.size());
  if (length <= 0) return 0;
  std::string_view target(text.data(), static_cast<std::size_t>(length));
  if (!target.starts_with("socket:[") || !target.ends_with("]")) return 0;
  return WholeNumber(target.substr(8, target.size() - 9)).value_or(0);
}

std::optional<ProcessStat> StatAt(int folder, const char* name) {
  const Descriptor file(::openat(folder, name, O_RDONLY | O_CLOEXEC));
  if (!file) return {};
  char line[1024];
  const ssize_t count = ::read(file.Number(), line, sizeof line);
  if (count <= 0) return {};
  return ParseStat({line, static_cast<std::size_t>(count)});
}

/// Some threads of a process beside its first, by the names of their folders.
std::vector<std::string> ThreadsOf(int folder, const std::string& process) {
  const std::string threads = process + "/task";
  struct stat figures {};
  // A folder has two links of its own and one for each folder in it.
  if (::fstatat(folder, threads.c_str(), &figures, 0) != 0 || figures.st_nlink == 3) return {};
  const Descriptor list(::openat(folder, threads.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
  std::vector<std::string> names;
  ForEachEntry(list.Number(), [&](std::string_view name, std::uint64_t) {
    if (names.size() < kMostThreads && WholeNumber(name) && name != process)
      names.push_back(threads + "/" + std::string(name));
  });
  return names;
}

/// A process whose first thread has ended lives on in its others. The kernel then answers for each of them
/// but no longer for the process. Gives the first answer that isn't empty.
template <typename Ask> auto AskThreads(int folder, const std::string& process, Ask ask) {
  decltype(ask(process)) answer{};
  for (const std::string& thread : ThreadsOf(folder, process))
    if ((answer = ask(thread))) break;
  return answer;
}

std::optional<ExecutableFile> ExecutableAt(int folder, const std::string& process) {
  const auto ask = [folder](const std::string& task) { return ReadExecutableFile(folder, task + "/exe"); };
  if (auto file = ask(process)) return file;
  return AskThreads(folder, process, ask);
}

Descriptor OpenDescriptors(int folder, const std::string& process) {
  return Descriptor(::openat(folder, (process + "/fd").c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
}

} // namespace

std::optional<ProcessStat> ParseStat(std::string_view line) {
  const std::size_t open = line.find('(');
  const std::size_t close = line.rfind(')');
  if (open == std::string_view::npos || close == std::string_view::npos || close < open) return {};
  ProcessStat stat;
  stat.comm = line.substr(open + 1, close - open - 1);
  Fields fields(line.substr(close + 1));
  const auto state = fields.Next();
  if (state.size() != 1) return {};
  stat.state = state[0];
  std::uint32_t flags = 0;
  if (!fields.Read(stat.parent)) return {};
  fields.Skip(4);
  if (!fields.Read(flags)) return {};
  fields.Skip(12);
  if (!fields.Read(stat.startTime)) return {};
  stat.isKernelThread = (flags & kKernelThreadFlag) != 0;
  return stat;
}

ProcFolder::ProcFolder(std::string root)
    : root_(std::move(root)), folder_(::open(root_.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC)) {}

bool ProcFolder::List(std::vector<Place>& places) const {
  places.clear();
  if (!folder_) return false;
  const bool done = ForEachEntry(folder_.Number(), [&](std::string_view name, std::uint64_t node) {
    if (name[0] < '1' || name[0] > '9') return;
    // A kernel that can't tell the number gives 1.
    if (const auto id = WholeNumber(name)) places.push_back({*id, node > 1 ? node : 0});
  });
  const auto earlier = [](const Place& left, const Place& right) { return left.processId < right.processId; };
  if (!std::is_sorted(places.begin(), places.end(), earlier))
    std::sort(places.begin(), places.end(), earlier);
  return done;
}

std::optional<ProcessStat> ProcFolder::Stat(std::uint32_t processId) const {
  return StatAt(folder_.Number(), NameOf(processId, "stat").data());
}

std::optional<ProcessStat> ProcFolder::Stat(const Descriptor& processFolder) {
  return StatAt(processFolder.Number(), "stat");
}

bool ProcFolder::HasLivingThread(std::uint32_t processId) const {
  return AskThreads(folder_.Number(), std::to_string(processId), [this](const std::string& thread) {
    const auto stat = StatAt(folder_.Number(), (thread + "/stat").c_str());
    return stat && !stat->HasEnded();
  });
}

Descriptor ProcFolder::Open(std::uint32_t processId) const {
  return Descriptor(
      ::openat(folder_.Number(), NameOf(processId, "").data(), O_PATH | O_DIRECTORY | O_CLOEXEC));
}

std::optional<std::uint32_t> ProcFolder::UserOf(std::uint32_t processId) const {
  struct stat folder {};
  if (::fstatat(folder_.Number(), NameOf(processId, "").data(), &folder, 0) != 0) return {};
  return folder.st_uid;
}

std::optional<std::string> ProcFolder::Executable(std::uint32_t processId) const {
  auto file = ExecutableAt(folder_.Number(), std::to_string(processId));
  if (!file) return {};
  return std::move(file->path);
}

std::optional<ExecutableFile> ProcFolder::Executable(const Descriptor& processFolder) {
  return ExecutableAt(processFolder.Number(), ".");
}

std::uint32_t ProcFolder::SocketOf(std::uint32_t processId, std::uint32_t descriptor) const {
  Name name;
  std::snprintf(name.data(), name.size(), "%u/fd/%u", processId, descriptor);
  if (const std::uint32_t node = SocketAt(folder_.Number(), name.data())) return node;
  return AskThreads(folder_.Number(), std::to_string(processId), [&](const std::string& thread) {
    return SocketAt(folder_.Number(), (thread + "/fd/" + std::to_string(descriptor)).c_str());
  });
}

std::optional<std::string> ProcFolder::File(const std::string& name) const {
  return ReadFile(root_ + "/" + name, kFileLimit);
}

ProcFolder::Descriptors::Descriptors(const ProcFolder& folder, std::uint32_t processId)
    : processes_(folder.folder_.Number()), processId_(processId),
      folder_(OpenDescriptors(processes_, std::to_string(processId))) {
  if (!folder_) folder_ = OfThread();
}

Descriptor ProcFolder::Descriptors::OfThread() const {
  return AskThreads(processes_, std::to_string(processId_),
                    [this](const std::string& thread) { return OpenDescriptors(processes_, thread); });
}

void ProcFolder::Descriptors::List(std::vector<std::uint32_t>& numbers) {
  numbers.clear();
  const auto add = [&](std::string_view name, std::uint64_t) {
    if (const auto number = WholeNumber(name)) numbers.push_back(*number);
  };
  ForEachEntry(folder_.Number(), add);
  if (!numbers.empty()) return;
  if (Descriptor ofThread = OfThread()) {
    folder_ = std::move(ofThread);
    ForEachEntry(folder_.Number(), add);
  }
}

std::uint32_t ProcFolder::Descriptors::SocketOf(std::uint32_t descriptor) const {
  std::array<char, 16> name;
  std::snprintf(name.data(), name.size(), "%u", descriptor);
  return SocketAt(folder_.Number(), name.data());
}

} // namespace quendra::platform::linux_
