#pragma once

#include "winapi/Winapi.h"

namespace quendra::winapi {

/// A library of the system, loaded from the system's folder by its full path and from nowhere else, so that a
/// file of its name beside the program or in the working folder is never run. It stays loaded until the
/// program ends: libraries run threads of their own, as for a look-up of a name, and one of these may be at
/// its last steps in the library's code when all that we asked for is over.
class SystemLibrary {
 public:
  /// A file name, such as L"iphlpapi.dll".
  explicit SystemLibrary(const wchar_t* fileName);
  /// One that lies elsewhere than in the system's folder, by its full path.
  static SystemLibrary At(const Text& path);

  bool IsThere() const { return module_ != nullptr; }
  HMODULE Module() const { return module_; }
  /// nullptr where this system's library has no such call.
  template <typename Function> Function* Find(const char* name) const {
    return reinterpret_cast<Function*>(reinterpret_cast<void*>(Address(name)));
  }

 private:
  explicit SystemLibrary(HMODULE module) : module_(module) {}
  FARPROC Address(const char* name) const { return module_ ? ::GetProcAddress(module_, name) : nullptr; }

  HMODULE module_ = nullptr;
};

/// The same, put into `call`, a pointer to a function; false where there is none.
template <typename Call> bool Find(const SystemLibrary& library, const char* name, Call*& call) {
  call = library.Find<Call>(name);
  return call != nullptr;
}

/// The system's folder, without a separator behind it. Empty where the system doesn't tell.
Text SystemFolder();

} // namespace quendra::winapi
