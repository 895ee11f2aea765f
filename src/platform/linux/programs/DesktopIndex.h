#pragma once

#include "platform/linux/programs/DesktopEntry.h"
#include "platform/linux/programs/FolderWatch.h"
#include "platform/linux/system/UserFolders.h"

#include <string>
#include <unordered_map>

namespace quendra::platform::linux_ {

/// The desktop entries of a session by the executable file that each starts. Made at the first question, and
/// again when one of the folders has changed.
class DesktopIndex {
 public:
  explicit DesktopIndex(UserFolders folders, Clock clock = CoarseMilliseconds);

  /// The entry that starts this file; nullptr when there is none. Of several, the one that menus show, that
  /// starts the file without arguments, and whose folder comes first. Holds until the next question.
  const DesktopEntry* EntryFor(const std::string& executable);
  /// Grows whenever the index was made anew.
  int Generation() const { return generation_; }

  static constexpr std::size_t kEntryBytes = 65536;
  static constexpr int kMostEntries = 8192;
  static constexpr int kMostDepth = 4;

 private:
  struct Ranked {
    DesktopEntry entry;
    std::string program; ///< the file that it starts
    int rank = 0;
  };

  void Build();
  void AddFolder(const std::string& folder, int depth);
  void AddEntry(const std::string& path);
  std::string Resolve(const std::string& program) const;

  UserFolders folders_;
  FolderWatch watch_;
  std::unordered_map<std::string, Ranked> entryOf_;
  std::unordered_map<std::string, Ranked> entryOfScript_; ///< by the name of a script that the entry starts
  int generation_ = 0;
  int entriesRead_ = 0;
};

} // namespace quendra::platform::linux_
