#pragma once

#include <cstdint>
#include <string>
#include <unordered_map>

namespace quendra::platform::linux_ {

/// Paths in the code page, and the way back to the files that they stand for. No two files ever have the same
/// one: names and icons go by it.
class SystemPaths {
 public:
  /// The path in the code page, at most `limit` bytes. One that the code page can't hold, or that doesn't
  /// fit, gets "//", a number of its own and what there is room for; no file's own path begins like that. Who
  /// has less room than the system's paths may take (kPathRoom) asks for the start of a path and gets it.
  std::string ToSystem(const std::string& rawPath, std::size_t limit = std::string::npos);
  /// The file's own path; empty for a number that is forgotten.
  std::string ToRaw(const std::string& systemPath) const;

 private:
  std::string Number(const std::string& rawPath);

  static constexpr std::size_t kMostRemembered = 4096;
  std::unordered_map<std::string, std::string> numberOf_;
  std::unordered_map<std::string, std::string> rawOf_; ///< by number
  std::uint64_t lastNumber_ = 0;                       ///< never given again
};

} // namespace quendra::platform::linux_
