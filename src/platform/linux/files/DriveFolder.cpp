#include "platform/linux/files/DriveFolder.h"

#include "platform/linux/system/Files.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <cerrno>

namespace quendra::platform::linux_ {

namespace {

/// No right to list the folder is needed to name a file in it.
constexpr int kAsPlace = O_PATH | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC;

} // namespace

int DriveFolder::Enter(const std::vector<std::string>& folders, Descriptor& folder) const {
  folder = Descriptor(::open(path_.c_str(), kAsPlace));
  for (const std::string& name : folders)
    if (folder) folder = Descriptor(::openat(folder.Number(), name.c_str(), kAsPlace));
  return folder ? 0 : errno;
}

int DriveFolder::OpenFolderOf(const DrivePath& path, Descriptor& folder) const {
  if (const int error = MakeFolders(path_)) return error;
  const int error = Enter(path.folders, folder);
  const bool isToBeMade = error == ENOENT && path.folders == std::vector<std::string>{kWindows};
  if (!isToBeMade) return error;
  if (::mkdir((path_ + "/" + kWindows).c_str(), 0700) != 0 && errno != EEXIST) return errno;
  return Enter(path.folders, folder);
}

std::string DriveFolder::FileOf(const std::string& systemPath) const {
  const auto path = ParseDrivePath(systemPath);
  Descriptor folder;
  struct stat file {};
  if (!path || Enter(path->folders, folder) != 0 ||
      ::fstatat(folder.Number(), path->name.c_str(), &file, AT_SYMLINK_NOFOLLOW) != 0 ||
      !S_ISREG(file.st_mode))
    return {};
  std::string found = path_;
  for (const std::string& name : path->folders) found += "/" + name;
  return found + "/" + path->name;
}

} // namespace quendra::platform::linux_
