#pragma once

#include "platform/files/Files.h"
#include "platform/simulated/SimulatedCore.h"
#include "runtime/Fault.h"

#include <algorithm>
#include <optional>

namespace quendra::platform::simulated {

/// Files by their paths. Writing stands in the machine's Calls, as in "Output C:\WINDOWS\file.txt".
class SimulatedFiles : public Files {
 public:
  explicit SimulatedFiles(Core& core) : core_(core) {}

  std::string WindowsDirectory = "C:\\WINDOWS";
  /// A length that the directory query gives whatever the directory is.
  std::optional<std::uint32_t> DirectoryAnswer;
  std::map<std::string, std::string> Contents;
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
    core_.calls.push_back("Output " + path);
    if (OutputFault != 0) throw Fault(OutputFault);
    Contents[path] = bytes;
  }

 private:
  Core& core_;
};

} // namespace quendra::platform::simulated
