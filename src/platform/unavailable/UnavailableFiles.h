#pragma once

#include "platform/files/Files.h"
#include "runtime/Fault.h"

namespace quendra::platform::unavailable {

/// A system without files.
class UnavailableFiles : public Files {
 public:
  std::uint32_t GetWindowsDirectoryA(std::span<char>) override { return 0; }
  void Output(const std::string&, const std::string&) override { throw Fault(Fault::kPathNotFound); }
};

} // namespace quendra::platform::unavailable
