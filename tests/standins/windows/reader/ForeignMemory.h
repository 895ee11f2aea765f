#pragma once

#include "runtime/Text.h"
#include "winapi/Winapi.h"

#include <optional>

namespace quendra::standins {

/// What a window of another program answers; none when it doesn't within its time, being busy or gone.
std::optional<LRESULT> Ask(HWND window, UINT message, WPARAM wParam = 0, LPARAM lParam = 0);

/// Memory in the program that owns a window, for questions whose records the system doesn't carry from one
/// program to another.
class ForeignMemory {
 public:
  explicit ForeignMemory(HWND window);
  ~ForeignMemory();
  ForeignMemory(const ForeignMemory&) = delete;
  ForeignMemory& operator=(const ForeignMemory&) = delete;

  static constexpr std::size_t kBytes = 8192;
  /// Where records end and texts begin.
  static constexpr std::size_t kTextAt = 1024;
  static constexpr int kMostCharacters = (kBytes - kTextAt) / sizeof(wchar_t);

  bool IsThere() const { return place_ != nullptr; }
  LPARAM Address() const { return reinterpret_cast<LPARAM>(place_); }
  wchar_t* TextAddress() const { return reinterpret_cast<wchar_t*>(static_cast<char*>(place_) + kTextAt); }
  template <typename Record> bool Put(const Record& record) const {
    return ::WriteProcessMemory(process_, place_, &record, sizeof record, nullptr);
  }
  template <typename Record> bool Take(Record& record) const {
    return ::ReadProcessMemory(process_, place_, &record, sizeof record, nullptr);
  }
  /// The text behind the record, up to its NUL.
  Text TakeText() const;

 private:
  HANDLE process_;
  void* place_;
};

} // namespace quendra::standins
