#pragma once

#include "runtime/Text.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace quendra::platform::linux_ {

/// What a desktop entry tells of the program that it starts.
struct DesktopEntry {
  Text name;    ///< in Hebrew where the entry has it; fit to be read
  Text comment; ///< likewise, may be empty
  std::string icon;
  std::string program;         ///< the first word of the command line: a name or a path
  std::string requiredProgram; ///< the program without which the entry doesn't hold; may be empty
  bool hasArguments = false;   ///< the command line has more than the program and the places for files
  bool isShown = true;         ///< menus show it
};

/// Reads an entry of an application; nothing for other kinds, for deleted ones and for those without a name
/// or command.
std::optional<DesktopEntry> ParseDesktopEntry(std::string_view text);

/// The words of an entry's command line: parted by blanks, which double quotes keep together.
std::vector<std::string> ExecWords(std::string_view exec);

} // namespace quendra::platform::linux_
