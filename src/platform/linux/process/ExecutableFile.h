#pragma once

#include <optional>
#include <string>

namespace quendra::platform::linux_ {

/// The file that a process runs.
struct ExecutableFile {
  std::string path;
  /// The path leads, seen from here, to that very file, or the file is gone and the path leads to what took
  /// its place, or to nothing. A process with folders of its own can run another file under any path.
  bool isHere = false;
};

/// Reads the kernel's link to it, `link` below `folder`; nothing when there is none or it may not be seen.
std::optional<ExecutableFile> ReadExecutableFile(int folder, const std::string& link);

} // namespace quendra::platform::linux_
