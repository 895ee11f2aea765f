#include "platform/linux/process/ExecutableFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <climits>
#include <string_view>

namespace quendra::platform::linux_ {

namespace {

/// What the kernel writes after the path of a file that has no name any more.
constexpr std::string_view kDeleted = " (deleted)";

std::optional<std::string> TargetOf(int folder, const std::string& link) {
  std::array<char, PATH_MAX> text;
  const ssize_t length = ::readlinkat(folder, link.c_str(), text.data(), text.size());
  if (length <= 0) return {};
  return std::string(text.data(), static_cast<std::size_t>(length));
}

std::optional<struct stat> FileAt(int folder, const std::string& path) {
  struct stat file {};
  if (::fstatat(folder, path.c_str(), &file, 0) != 0) return {};
  return file;
}

bool IsSame(const struct stat& left, const std::optional<struct stat>& right) {
  return right && left.st_dev == right->st_dev && left.st_ino == right->st_ino;
}

} // namespace

std::optional<ExecutableFile> ReadExecutableFile(int folder, const std::string& link) {
  auto path = TargetOf(folder, link);
  if (!path) return {};
  ExecutableFile file{std::move(*path)};
  // Following the link gives the file itself, wherever it lies.
  const auto running = FileAt(folder, link);
  const auto there = FileAt(AT_FDCWD, file.path);
  file.isHere = running && IsSame(*running, there);
  // A file may really be named like that.
  if (file.isHere || !file.path.ends_with(kDeleted)) return file;
  file.path.resize(file.path.size() - kDeleted.size());
  const auto successor = FileAt(AT_FDCWD, file.path);
  // An update keeps the owner; a file of another user is not the program in a new version.
  file.isHere = running && (!successor || successor->st_uid == running->st_uid);
  return file;
}

} // namespace quendra::platform::linux_
