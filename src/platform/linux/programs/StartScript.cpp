#include "platform/linux/programs/StartScript.h"

#include <sys/stat.h>

#include <string_view>

namespace quendra::platform::linux_ {

namespace {

std::string FolderOf(const std::string& path) { return path.substr(0, path.rfind('/')); }
std::string_view FileNameOf(std::string_view path) { return path.substr(path.rfind('/') + 1); }

bool IsAdministrators(const std::string& path) {
  struct stat file {};
  if (::lstat(path.c_str(), &file) != 0 || file.st_uid != 0) return false;
  const bool othersWrite = (file.st_mode & (S_IWGRP | S_IWOTH)) != 0;
  // Others may add to such a folder, but not replace what isn't theirs.
  const bool keepsFiles = S_ISDIR(file.st_mode) && (file.st_mode & S_ISVTX) != 0;
  return !othersWrite || keepsFiles;
}

/// The file and every folder above it.
bool IsOutOfUsersHands(std::string path) {
  if (!path.starts_with('/')) return false;
  for (; !path.empty(); path = FolderOf(path))
    if (!IsAdministrators(path)) return false;
  return IsAdministrators("/");
}

/// /usr/lib/NAME/NAME beside /usr/bin/NAME, or /opt/NAME/NAME above /opt/NAME/bin/NAME.
bool LieInOnePackage(const std::string& executable, const std::string& script) {
  const std::string folder = FolderOf(executable);
  if (FileNameOf(folder) != FileNameOf(executable)) return false;
  if (script.starts_with(folder + "/")) return true;
  const std::string prefix = FolderOf(FolderOf(script));
  const std::string above = FolderOf(folder);
  return above == prefix + "/lib" || above == prefix + "/lib64" || above == prefix + "/libexec" ||
         above == prefix + "/share";
}

} // namespace

bool IsProgramOfScript(const std::string& executable, const std::string& script) {
  return LieInOnePackage(executable, script) && IsOutOfUsersHands(executable) && IsOutOfUsersHands(script);
}

} // namespace quendra::platform::linux_
