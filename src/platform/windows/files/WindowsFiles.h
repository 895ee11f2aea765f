#pragma once

#include "platform/files/Files.h"

namespace quendra::platform::windows {

/// Files by their full path on a drive. A file is written beside the one of its name and takes its place once
/// it is whole.
class WindowsFiles : public Files {
 public:
  std::uint32_t GetWindowsDirectoryA(std::span<char> buffer) override;
  void Output(const std::string& path, const std::string& bytes) override;
};

} // namespace quendra::platform::windows
