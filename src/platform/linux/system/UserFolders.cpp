#include "platform/linux/system/UserFolders.h"

#include "platform/linux/system/Files.h"

#include <cstdlib>

namespace quendra::platform::linux_ {

namespace {

std::string Variable(const char* name, const std::string& otherwise) {
  const char* value = std::getenv(name);
  return value == nullptr || *value == '\0' ? otherwise : value;
}

/// A relative folder would depend on where the program was started, so it is passed over.
std::vector<std::string> Absolute(const std::string& list) {
  std::vector<std::string> folders;
  for (auto& folder : Split(list, ':'))
    if (folder.starts_with('/')) folders.push_back(std::move(folder));
  return folders;
}

/// The folder that a variable names, or that below the user's own.
std::string HomeFolder(const char* name, const std::string& otherwise) {
  const auto named = Absolute(Variable(name, ""));
  return named.empty() ? otherwise : named.front();
}

} // namespace

UserFolders UserFolders::OfEnvironment() {
  UserFolders folders;
  folders.home = Variable("HOME", "/");
  folders.configHome = Variable("XDG_CONFIG_HOME", folders.home + "/.config");
  folders.dataHome = HomeFolder("XDG_DATA_HOME", folders.home + "/.local/share");
  folders.cacheHome = HomeFolder("XDG_CACHE_HOME", folders.home + "/.cache");
  folders.configDirs = Absolute(Variable("XDG_CONFIG_DIRS", "/etc/xdg"));
  folders.dataDirs = Absolute(Variable("XDG_DATA_DIRS", "/usr/local/share:/usr/share"));
  folders.dataDirs.insert(folders.dataDirs.begin(),
                          Variable("XDG_DATA_HOME", folders.home + "/.local/share"));
  folders.programDirs = Absolute(Variable("PATH", "/usr/local/bin:/usr/bin:/bin"));
  return folders;
}

} // namespace quendra::platform::linux_
