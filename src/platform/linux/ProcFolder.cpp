#include "platform/linux/ProcFolder.h"

#include "platform/linux/Files.h"

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

/// Splits on blanks, as the figures behind the name are.
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

std::optional<std::string> LinkText(int folder, const char* name) {
  std::array<char, PATH_MAX> text;
  const ssize_t length = ::readlinkat(folder, name, text.data(), text.size());
  if (length <= 0) return {};
  return std::string(text.data(), static_cast<std::size_t>(length));
}

std::uint32_t SocketAt(int folder, const char* name) {
  std::array<char, 64> text;
  const ssize_t length = ::readlinkat(folder, name, text.data(), text.size());
  if (length <= 0) return 0;
  std::string_view target(text.data(), static_cast<std::size_t>(length));
  if (!target.starts_with("socket:[") || !target.ends_with("]")) return 0;
  return WholeNumber(target.substr(8, target.size() - 9)).value_or(0);
}

std::optional<std::string> ExecutableAt(int folder, const char* name) {
  auto path = LinkText(folder, name);
  // The file that a process was started from may have been replaced by an update since; its path still names
  // it.
  constexpr std::string_view kDeleted = " (deleted)";
  if (path && path->ends_with(kDeleted)) path->resize(path->size() - kDeleted.size());
  return path;
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
  const Descriptor file(::openat(folder_.Number(), NameOf(processId, "stat").data(), O_RDONLY | O_CLOEXEC));
  if (!file) return {};
  char line[1024];
  const ssize_t count = ::read(file.Number(), line, sizeof line);
  if (count <= 0) return {};
  return ParseStat({line, static_cast<std::size_t>(count)});
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
  return ExecutableAt(folder_.Number(), NameOf(processId, "exe").data());
}

std::optional<std::string> ProcFolder::Executable(const Descriptor& processFolder) {
  return ExecutableAt(processFolder.Number(), "exe");
}

std::uint32_t ProcFolder::SocketOf(std::uint32_t processId, std::uint32_t descriptor) const {
  Name name;
  std::snprintf(name.data(), name.size(), "%u/fd/%u", processId, descriptor);
  return SocketAt(folder_.Number(), name.data());
}

std::optional<std::string> ProcFolder::File(const std::string& name) const {
  return ReadFile(root_ + "/" + name, kFileLimit);
}

ProcFolder::Descriptors::Descriptors(const ProcFolder& folder, std::uint32_t processId)
    : folder_(::openat(folder.folder_.Number(), NameOf(processId, "fd").data(),
                       O_RDONLY | O_DIRECTORY | O_CLOEXEC)) {}

void ProcFolder::Descriptors::List(std::vector<std::uint32_t>& numbers) const {
  numbers.clear();
  ForEachEntry(folder_.Number(), [&](std::string_view name, std::uint64_t) {
    if (const auto number = WholeNumber(name)) numbers.push_back(*number);
  });
}

std::uint32_t ProcFolder::Descriptors::SocketOf(std::uint32_t descriptor) const {
  std::array<char, 16> name;
  std::snprintf(name.data(), name.size(), "%u", descriptor);
  return SocketAt(folder_.Number(), name.data());
}

} // namespace quendra::platform::linux_
