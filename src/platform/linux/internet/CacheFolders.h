#pragma once

#include "platform/linux/system/Descriptor.h"

#include <dirent.h>

#include <memory>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// How the files of a cache folder are made.
enum class CacheForm { Firefox, Chromium };

/// An open folder of a browser that holds one entry of its cache a file.
struct CacheFolder {
  CacheForm form = CacheForm::Firefox;
  Descriptor descriptor;
  std::string path; ///< for people, and for entries that tell no address
};

/// The names in an open folder, "." and ".." left out.
class FolderReader {
 public:
  explicit FolderReader(int folder);
  /// nullptr behind the last.
  const dirent* Next();

 private:
  struct Close {
    void operator()(DIR* stream) const { ::closedir(stream); }
  };
  std::unique_ptr<DIR, Close> stream_;
};

/// The cache folders of the browsers that the user has, below the user's cache folder. No link below that is
/// followed.
std::vector<std::shared_ptr<CacheFolder>> FindCacheFolders(const std::string& cacheHome);

/// Whether a file of that name holds an entry: not an index, nor a file that many entries share.
bool IsCacheEntryName(CacheForm form, const char* name);

} // namespace quendra::platform::linux_
