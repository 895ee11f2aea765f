#pragma once

#include "winapi/SystemLibrary.h"

#include <vector>

namespace quendra::winapi {

/// Keeps files out that lie beside the program, or in the folder that it works in, under the names of the
/// system's libraries. We ask for each by its full path; the system's own ask for others by their mere names,
/// and those are searched for beside the program first. One that is loaded already is not searched for.
class TrustedLibraries {
 public:
  /// Before anything else is asked of the system: what its windows and their controls ask for.
  TrustedLibraries();

  /// What networks, the shell and the like ask for, later.
  void LoadTheOthers();

 private:
  std::vector<SystemLibrary> loaded_;
};

} // namespace quendra::winapi
