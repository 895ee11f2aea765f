#pragma once

#include "platform/files/Files.h"
#include "platform/simulated/SimulatedCore.h"
#include "runtime/Fault.h"

#include <algorithm>
#include <optional>
#include <set>

namespace quendra::platform::simulated {

/// Files by their paths, in folders that are there. Writing stands in the machine's Calls, as in "Output
/// C:\WINDOWS\file.txt".
class SimulatedFiles : public Files {
 public:
  explicit SimulatedFiles(Core& core) : core_(core) {}

  std::string WindowsDirectory = "C:\\WINDOWS";
  /// A length that the directory query gives whatever the directory is.
  std::optional<std::uint32_t> DirectoryAnswer;
  std::map<std::string, std::string> Contents;
  /// Folders beside the Windows directory and that of its drive.
  std::set<std::string> Folders;
  /// The fault that writing raises, 0 for none.
  int OutputFault = 0;

  std::uint32_t GetWindowsDirectoryA(std::span<char> buffer) override {
    const auto length = static_cast<std::uint32_t>(WindowsDirectory.size());
    if (buffer.size() <= length) return DirectoryAnswer.value_or(length + 1);
    std::ranges::copy(WindowsDirectory, buffer.begin());
    buffer[length] = '\0';
    return DirectoryAnswer.value_or(length);
  }
  void Output(const std::string& path, const std::string& bytes) override {
    const std::string file = CutText(path);
    core_.calls.push_back("Output " + file);
    if (OutputFault != 0) throw Fault(OutputFault);
    const std::size_t end = file.rfind('\\');
    if (end == std::string::npos || end + 1 == file.size() || !IsFolder(file.substr(0, end)))
      throw Fault(Fault::kPathNotFound);
    if (IsFolder(file)) throw Fault(Fault::kPathFileAccess);
    Contents[file] = bytes;
  }

 private:
  bool IsFolder(const std::string& path) const {
    return path == WindowsDirectory || path == WindowsDirectory.substr(0, 2) || Folders.contains(path);
  }

  Core& core_;
};

} // namespace quendra::platform::simulated
