#pragma once

#include "platform/EventLoop.h"
#include "platform/Machine.h"

#include <memory>

namespace quendra::platform::windows {

/// This machine: the operations that the program asks for, handed to the system.
class WindowsMachine {
 public:
  explicit WindowsMachine(EventLoop& loop);
  ~WindowsMachine();

  Machine Operations();

 private:
  struct Parts;
  std::unique_ptr<Parts> parts_;
};

} // namespace quendra::platform::windows
