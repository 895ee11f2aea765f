#pragma once

#include <optional>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// A file of drive C: by the names that this system has for its folders and for itself.
struct DrivePath {
  std::vector<std::string> folders{};
  std::string name{};
  friend bool operator==(const DrivePath&, const DrivePath&) = default;
};

/// The parts of a path such as "C:\WINDOWS\name", which is in the code page and ends at its first NUL.
/// Nothing for a path of another kind and for one with a part that is empty or no plain name: "." and "..",
/// and what holds a "/" or a ":".
std::optional<DrivePath> ParseDrivePath(const std::string& systemPath);

} // namespace quendra::platform::linux_
