#pragma once

#include "platform/windows/process/SystemHandle.h"
#include "platform/windows/system/LazyLibrary.h"

namespace quendra::platform::windows {

/// Where the program of a process lies, as the system itself remembers it: that of 64 bits too, whose modules
/// one of 32 bits isn't told. From Vista on.
class ImagePath {
 public:
  bool IsThere() { return Query() != nullptr; }
  /// As a program of 32 bits finds it; empty on failure, for a reason that the system has.
  Text Of(Handle process);

 private:
  using QueryName = BOOL WINAPI(HANDLE process, DWORD flags, wchar_t* name, DWORD* length);
  QueryName* Query() { return kernel32_.Find<QueryName>("QueryFullProcessImageNameW"); }
  bool IsRedirected();

  LazyLibrary kernel32_{L"kernel32.dll"};
};

/// On a system of 64 bits a program of 32 that opens a file of the system's folder gets another folder's. The
/// folder itself has a second name for it.
Text PastRedirection(const Text& path, const Text& systemFolder);

/// XP has the programs that it starts first under names of its kernel's, by which no file can be opened.
Text WithoutKernelsNames(const Text& path, const Text& systemFolder);

} // namespace quendra::platform::windows
