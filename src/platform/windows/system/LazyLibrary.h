#pragma once

#include "winapi/SystemLibrary.h"

#include <optional>

namespace quendra::platform::windows {

/// A library of the system that is loaded when one of its calls is asked for: most of them never are, and
/// loading all takes longer than the start may.
class LazyLibrary {
 public:
  explicit LazyLibrary(const wchar_t* fileName) : fileName_(fileName) {}

  /// nullptr where this system lacks the library or the call.
  template <typename Function> Function* Find(const char* name) {
    if (!library_) library_.emplace(fileName_);
    return library_->template Find<Function>(name);
  }

 private:
  const wchar_t* fileName_;
  std::optional<winapi::SystemLibrary> library_;
};

} // namespace quendra::platform::windows
