#pragma once

#include "runtime/Text.h"

namespace quendra::forms {

/// Thrown by `MessageLoop::End` and by whatever pumps messages once the program has ended: unwinds every
/// handler under way. Only desktops catch it.
struct ProgramEnded {
  int status = 0;
};

/// Flags of a message box, as the platform numbers them.
enum BoxFlags : int {
  kYesNo = 0x4,
  kCritical = 0x10,
  kQuestion = 0x20,
  kExclamation = 0x30,
  kInformation = 0x40,
  kRightAligned = 0x80000,
  kRightToLeft = 0x100000,
  kHebrewBox = kRightAligned | kRightToLeft,
};

/// The loop that handles the program's messages, its end, and the boxes that wait in it for an answer.
class MessageLoop {
 public:
  virtual ~MessageLoop() = default;

  /// Waits for an answer; gives the pressed button's number, 1 for OK.
  virtual int MessageBox(const Text& text, int flags, const Text& title) = 0;
  /// Handles what waits in the message queue, then returns. Cheap when nothing waits.
  virtual void DoEvents() = 0;
  /// Ends the program at once: no further unloading. Throws ProgramEnded.
  [[noreturn]] virtual void End(int status = 0) = 0;
};

} // namespace quendra::forms
