#pragma once

#include "winapi/Winapi.h"

#include <functional>
#include <vector>

namespace quendra::app::windows {

/// Where the executables of this build lie.
Text FolderOfBuild();
/// The program as it is shipped.
Text ProgramFile();
/// Looks until the condition holds; false when it doesn't within ten seconds.
bool Until(const std::function<bool()>& condition);

/// A program that was started, and somebody in front of it. It ends with the object.
class StartedProgram {
 public:
  explicit StartedProgram(const Text& path, const Text& workingFolder = {}, const Text& arguments = {});
  ~StartedProgram();
  StartedProgram(const StartedProgram&) = delete;

  DWORD Id() const { return started_.dwProcessId; }
  HANDLE Process() const { return started_.hProcess; }
  /// Waits for it.
  bool Ends() const { return ::WaitForSingleObject(started_.hProcess, 10'000) == WAIT_OBJECT_0; }
  bool Runs() const { return ::WaitForSingleObject(started_.hProcess, 0) == WAIT_TIMEOUT; }
  DWORD Status() const;
  void Kill() const { ::TerminateProcess(started_.hProcess, 1); }

  /// The window of this text that can be seen, at the top or in another; nullptr for none.
  HWND Find(const Text& text) const;
  /// Waits for a window of this text.
  bool Shows(const Text& text) const;
  /// Waits for the window of this text and clicks into its middle. False when it doesn't come.
  bool Click(const Text& text) const;
  /// The files that it has loaded under this name, in small letters.
  std::vector<Text> Loaded(const Text& name) const;

 private:
  PROCESS_INFORMATION started_{};
};

} // namespace quendra::app::windows
