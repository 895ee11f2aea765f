#pragma once

#include "platform/linux/files/DrivePath.h"
#include "platform/linux/system/Descriptor.h"

namespace quendra::platform::linux_ {

/// The folder that stands for drive C:. Nothing in it leads out of it: links aren't followed.
class DriveFolder {
 public:
  explicit DriveFolder(std::string path) : path_(std::move(path)) {}

  /// The system's directory, which is made when something is first put into it, as the drive itself is.
  static constexpr const char* kWindows = "WINDOWS";

  /// Opens the folder of a path, as a place to name files in; 0, or the system's error number.
  int OpenFolderOf(const DrivePath& path, Descriptor& folder) const;
  /// Where a file of the drive lies; empty unless it is there and no folder, link, pipe or device.
  std::string FileOf(const std::string& systemPath) const;

 private:
  int Enter(const std::vector<std::string>& folders, Descriptor& folder) const;

  std::string path_;
};

} // namespace quendra::platform::linux_
