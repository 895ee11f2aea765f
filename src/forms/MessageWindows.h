#pragma once

#include "forms/WindowProcedures.h"

#include <string>

namespace quendra::forms {

/// Windows of a desktop. Beside those of its forms, some that nobody sees: they exist to receive messages.
class MessageWindows : public WindowProcedures {
 public:
  /// The new window's handle, kNoWindow on failure. Its procedure answers 0 to everything.
  virtual WindowHandle Create();
  /// False for a handle that is no window.
  virtual bool Destroy(WindowHandle window) { return Remove(window); }
  /// The number of the messages of that name, the same at each call, from the range that the platform keeps
  /// for names.
  std::uint32_t RegisterMessage(const std::string& name) {
    constexpr std::uint32_t kFirst = 0xC000;
    return messages_.emplace(name, kFirst + static_cast<std::uint32_t>(messages_.size())).first->second;
  }

 private:
  std::map<std::string, std::uint32_t> messages_;
};

} // namespace quendra::forms
