#pragma once

#include "platform/linux/programs/FolderWatch.h"
#include "platform/linux/system/UserFolders.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace quendra::platform::linux_ {

/// Finds icons by name: in the user's theme and those it builds on, then in "hicolor", then among the icons
/// that belong to no theme. 32 pixels are wanted, then 48, 64, drawings of any size, larger ones, smaller
/// ones.
class IconTheme {
 public:
  explicit IconTheme(UserFolders folders, Clock clock = CoarseMilliseconds);

  /// The file of a name, or the file itself for an absolute path; nothing when there is none.
  std::optional<std::string> Find(const std::string& icon);
  /// Looks, every few seconds at most, whether the themes have changed; they are read anew then.
  bool Refresh();

  static constexpr std::size_t kThemeBytes = 1 << 18;
  static constexpr std::size_t kMostThemes = 16;

 private:
  void Load();
  void AddTheme(const std::string& name);
  std::optional<std::string> FindIn(const std::vector<std::string>& folders, const std::string& name) const;
  std::string NameOfUserTheme() const;

  UserFolders folders_;
  FolderWatch watch_;
  std::vector<std::string> bases_;
  std::vector<std::string> themes_;
  std::vector<std::vector<std::string>> themeFolders_; ///< of each theme, the best size first
  bool loaded_ = false;
};

/// How far a folder of icons is from what is wanted, the best 0. `type` is a theme's word for it.
int IconSizeRank(int size, int scale, std::string_view type);

} // namespace quendra::platform::linux_
