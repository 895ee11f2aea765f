#pragma once

#include <cstdint>
#include <span>
#include <string>

namespace quendra::platform {

/// Files under the system's own names for them, such as "C:\WINDOWS\name": bytes of the code page.
class Files {
 public:
  virtual ~Files() = default;

  /// Puts the directory with its NUL into the buffer. Its length without the NUL; the length with it, and
  /// nothing written, when the buffer is too small; 0 on failure.
  virtual std::uint32_t GetWindowsDirectoryA(std::span<char> buffer) = 0;
  /// Writes a file anew, in place of one that is there. A failure raises the run-time's fault for it: 76 for
  /// a folder that isn't there, 75 for what can't be opened, 70 for what isn't permitted, 61 for a full disk.
  virtual void Output(const std::string& path, const std::string& bytes) = 0;
};

} // namespace quendra::platform
