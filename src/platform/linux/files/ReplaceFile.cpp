#include "platform/linux/files/ReplaceFile.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <cerrno>
#include <cstdio>
#include <string_view>

namespace quendra::platform::linux_ {

namespace {

constexpr int kMostLeftovers = 1000;

/// 0 where nothing stands or a file that may be written over.
int WhyNotReplaced(const Descriptor& folder, const char* name) {
  struct stat file {};
  if (::fstatat(folder.Number(), name, &file, AT_SYMLINK_NOFOLLOW) != 0) return errno == ENOENT ? 0 : errno;
  if (!S_ISREG(file.st_mode)) return EEXIST;
  return ::faccessat(folder.Number(), name, W_OK, AT_EACCESS) == 0 ? 0 : errno;
}

/// A new file under a name that nothing has, not even what an earlier run left.
int OpenPart(const Descriptor& folder, std::string& name, Descriptor& part) {
  for (int number = 1; number <= kMostLeftovers; ++number) {
    name = ".part-" + std::to_string(::getpid()) + "-" + std::to_string(number);
    part = Descriptor(
        ::openat(folder.Number(), name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC, 0600));
    if (part) return 0;
    if (errno != EEXIST) return errno;
  }
  return EEXIST;
}

/// All of it, down to the disk.
int Write(const Descriptor& file, std::string_view bytes) {
  while (!bytes.empty()) {
    const ssize_t count = ::write(file.Number(), bytes.data(), bytes.size());
    if (count < 0 && errno == EINTR) continue;
    if (count < 0) return errno;
    if (count == 0) return EIO;
    bytes.remove_prefix(static_cast<std::size_t>(count));
  }
  return ::fsync(file.Number()) == 0 ? 0 : errno;
}

} // namespace

int ReplaceFile(const Descriptor& folder, const std::string& name, const std::string& bytes) {
  if (const int error = WhyNotReplaced(folder, name.c_str())) return error;
  std::string partName;
  Descriptor part;
  if (const int error = OpenPart(folder, partName, part)) return error;
  int error = Write(part, bytes);
  if (error == 0 && ::renameat(folder.Number(), partName.c_str(), folder.Number(), name.c_str()) != 0)
    error = errno;
  if (error != 0) ::unlinkat(folder.Number(), partName.c_str(), 0);
  return error;
}

} // namespace quendra::platform::linux_
