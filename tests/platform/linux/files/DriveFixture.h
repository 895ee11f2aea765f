#pragma once

#include "platform/linux/LinuxFixture.h"
#include "platform/linux/files/LinuxFiles.h"
#include "platform/linux/system/Files.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>

#include <sched.h>
#include <sys/mount.h>
#include <sys/stat.h>

#include <algorithm>
#include <filesystem>

namespace quendra::platform::linux_ {

/// A drive C: in a folder of the test.
struct DriveTest : testing::Test {
  static constexpr const char* kFile = "C:\\WINDOWS\\bi.prf";

  TemporaryFolder folder;
  DriveFolder drive{folder / "data/quendra/drive_c"};
  LinuxFiles files{drive};

  /// The number of the fault that writing raises, 0 for none.
  int FaultOf(const std::string& path, const std::string& bytes = "text") {
    try {
      files.Output(path, bytes);
    } catch (const Fault& fault) {
      return fault.number;
    }
    return 0;
  }
  std::string Place(const std::string& name) const { return folder / "data/quendra/drive_c/" + name; }
  std::string Content(const std::string& name) const {
    return ReadFile(Place(name), 10'000'000).value_or("none");
  }
  /// Writes the file; its fault's number and what it holds afterwards.
  std::string Written(const std::string& bytes) {
    const int fault = FaultOf(kFile, bytes);
    return std::to_string(fault) + " " + Content("WINDOWS/bi.prf");
  }
  static unsigned ModeOf(const std::string& path) {
    struct stat status {};
    return ::stat(path.c_str(), &status) == 0 ? status.st_mode & 07777U : 0U;
  }
  /// Everything in a folder of the drive, by name.
  std::vector<std::string> Names(const std::string& name) const {
    std::vector<std::string> names;
    for (const auto& entry : std::filesystem::directory_iterator(Place(name)))
      names.push_back(entry.path().filename());
    std::ranges::sort(names);
    return names;
  }
  /// This process is a user without root's rights from now on, to whom the folder belongs.
  bool BecomeUser() const {
    constexpr uid_t kNobody = 65534;
    if (::geteuid() != 0) return true;
    for (const auto& entry : std::filesystem::recursive_directory_iterator(folder.Path()))
      if (::lchown(entry.path().c_str(), kNobody, kNobody) != 0) return false;
    return ::chown(folder.Path().c_str(), kNobody, kNobody) == 0 && ::setgid(kNobody) == 0 &&
           ::setuid(kNobody) == 0;
  }
  /// The folder is a disk of 128 KB from now on, which this process alone sees.
  bool MountSmallDisk() const {
    return ::unshare(CLONE_NEWNS) == 0 && ::mount("none", "/", nullptr, MS_REC | MS_PRIVATE, nullptr) == 0 &&
           ::mount("tmpfs", folder.Path().c_str(), "tmpfs", 0, "size=128k") == 0;
  }
};

} // namespace quendra::platform::linux_
