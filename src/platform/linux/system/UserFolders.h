#pragma once

#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// Where a session keeps its programs' entries, icons and settings.
struct UserFolders {
  std::string home;
  std::string configHome;
  std::vector<std::string> configDirs;
  std::vector<std::string> dataDirs; ///< the user's own first
  std::vector<std::string> programDirs;
  std::string dataHome{};
  std::string cacheHome{};

  /// As the environment of this program tells.
  static UserFolders OfEnvironment();
};

} // namespace quendra::platform::linux_
