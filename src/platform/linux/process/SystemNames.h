#pragma once

#include "runtime/Text.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>

namespace quendra::platform::linux_ {

/// A file's or process's name, raw bytes of this system, in the code page. Control characters and marks that
/// change the direction of what follows become "?", like any other character that such a name can't hold.
std::string SystemName(std::string_view raw);

/// A text of a file for people to read: controls become blanks, direction marks go, 255 code units stay.
Text ReadableText(std::string_view utf8);

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
