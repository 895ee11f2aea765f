#pragma once

#include "runtime/Text.h"

#include <string>
#include <string_view>
#include <unordered_map>

namespace quendra::platform::linux_ {

/// A file's or process's name, raw bytes of this system, in the code page. Control characters and marks that
/// change the direction of what follows become "?", like any other character that such a name can't hold.
std::string SystemName(std::string_view raw);

/// A text of a file for people to read: controls become blanks, direction marks go, 255 code units stay.
Text ReadableText(std::string_view utf8);

/// Paths in the code page, and the way back to the files that they stand for.
class SystemPaths {
 public:
  /// The path in the code page, cut to `limit` bytes, remembered where it differs from the file's own.
  std::string ToSystem(const std::string& rawPath, std::size_t limit = std::string::npos);
  /// The file's own path; the same text for one that nobody was given.
  std::string ToRaw(const std::string& systemPath) const;

 private:
  static constexpr std::size_t kMostRemembered = 4096;
  std::unordered_map<std::string, std::string> rawOf_;
};

} // namespace quendra::platform::linux_
