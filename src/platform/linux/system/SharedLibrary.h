#pragma once

#include <dlfcn.h>

#include <memory>

namespace quendra::platform::linux_ {

/// A library of the system, looked up at run time, so that the program also starts on a machine that lacks
/// it.
class SharedLibrary {
 public:
  explicit SharedLibrary(const char* name) : handle_(::dlopen(name, RTLD_NOW | RTLD_LOCAL), Close) {}

  /// False when the library isn't there or lacks it.
  template <typename Function> bool Find(const char* name, Function& function) const {
    function = handle_ ? reinterpret_cast<Function>(::dlsym(handle_.get(), name)) : nullptr;
    return function != nullptr;
  }

 private:
  static void Close(void* handle) { ::dlclose(handle); }

  std::unique_ptr<void, void (*)(void*)> handle_;
};

} // namespace quendra::platform::linux_
