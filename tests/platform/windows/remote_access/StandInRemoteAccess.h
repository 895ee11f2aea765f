#pragma once

#include "platform/windows/WindowsLoopFixture.h"
#include "platform/windows/remote_access/WindowsDialling.h"
#include "platform/windows/remote_access/WindowsPhoneBook.h"

#include <functional>
#include <string>

namespace quendra::platform::windows {

/// The stand-in library of remote access, which lies in a folder below the tests.
winapi::SystemLibrary StandInRasLibrary();

/// Remote access by the stand-in library, with an empty phone book of its own and dials by a script.
class StandInRemoteAccess {
 public:
  explicit StandInRemoteAccess(const std::string& dials);
  ~StandInRemoteAccess();

  void Script(const std::string& dials);
  bool Until(const std::function<bool()>& condition) { return Desktop.WaitFor(condition, 10'000); }

  WindowsLoop Desktop;
  RasCalls Calls{&StandInRasLibrary};
  WindowsPhoneBook Book{Calls};
  WindowsDialling Dials{Calls, Desktop};

 private:
  const std::string file_;
};

} // namespace quendra::platform::windows
