#pragma once

#include <string>
#include <vector>

namespace quendra::architecture {

/// A source below src/: its path from there, with "/" between folders, and its text.
struct Source {
  std::string path;
  std::string text;
};

/// What a source includes against the rules of the layers, one sentence each with the path and the line; and
/// which preprocessor lines ask for an operating system above the backends.
std::vector<std::string> ViolationsOf(const Source& source);

} // namespace quendra::architecture
