#pragma once

#include "runtime/Fault.h"

namespace quendra::foundation {

/// The program's text for a system error number of the sockets; "Unknown error." for any other number.
Text SystemErrorText(std::int32_t number);

/// A system error raised to a caller: number, its text, the raising procedure.
Fault SystemError(std::int32_t number, Text source);

/// Errors that the socket class raises on misuse.
enum SocketMisuse : int {
  kWrongProtocolOrState = 40006,
  kInvalidArgumentFault = 40014,
  kUnsupportedType = 40018,
  kInvalidAtCurrentState = 40020,
  kUnsupportedIndexType = 40027,
  kUnknownIndex = 40029,
};

/// With the class's own text of the number.
Fault Misuse(SocketMisuse number, Text source);

} // namespace quendra::foundation
