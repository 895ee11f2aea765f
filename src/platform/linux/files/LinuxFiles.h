#pragma once

#include "platform/files/Files.h"
#include "platform/linux/files/DriveFolder.h"

namespace quendra::platform::linux_ {

/// Files of drive C:, for which a folder of the user's stands. Upper and lower case differ in their names, as
/// they do everywhere on this system.
class LinuxFiles : public Files {
 public:
  explicit LinuxFiles(const DriveFolder& drive) : drive_(drive) {}

  std::uint32_t GetWindowsDirectoryA(std::span<char> buffer) override;
  void Output(const std::string& path, const std::string& bytes) override;

 private:
  const DriveFolder& drive_;
};

} // namespace quendra::platform::linux_
