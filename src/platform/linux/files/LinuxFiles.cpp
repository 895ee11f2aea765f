#include "platform/linux/files/LinuxFiles.h"

#include "platform/linux/files/ReplaceFile.h"
#include "runtime/Fault.h"

#include <algorithm>
#include <cerrno>

namespace quendra::platform::linux_ {

namespace {

/// The run-time's fault for an error of the system; `otherwise` for one that tells neither of rights nor of
/// room.
int FaultOf(int error, int otherwise) {
  switch (error) {
  case EACCES:
  case EPERM:
  case EROFS: return Fault::kPermissionDenied;
  case ENOSPC:
  case EDQUOT: return Fault::kDiskFull;
  default: return otherwise;
  }
}

} // namespace

std::uint32_t LinuxFiles::GetWindowsDirectoryA(std::span<char> buffer) {
  const std::string directory = std::string("C:\\") + DriveFolder::kWindows;
  const auto length = static_cast<std::uint32_t>(directory.size());
  if (buffer.size() <= length) return length + 1;
  std::ranges::copy(directory, buffer.begin());
  buffer[length] = '\0';
  return length;
}

void LinuxFiles::Output(const std::string& path, const std::string& bytes) {
  const auto parsed = ParseDrivePath(path);
  if (!parsed) throw Fault(Fault::kPathNotFound);
  Descriptor folder;
  if (const int error = drive_.OpenFolderOf(*parsed, folder))
    throw Fault(FaultOf(error, Fault::kPathNotFound));
  if (const int error = ReplaceFile(folder, parsed->name, bytes))
    throw Fault(FaultOf(error, Fault::kPathFileAccess));
}

} // namespace quendra::platform::linux_
