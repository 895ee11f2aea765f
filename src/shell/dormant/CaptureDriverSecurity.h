#pragma once

#include "runtime/Text.h"

namespace quendra::shell {

// Who may do what with the services of the capture driver: self-relative security descriptors of 184 bytes as
// text, two hexadecimal digits a byte with commas between. They differ in two bytes that nobody reads, behind
// the first trustee of the access list.

/// For the driver's own service.
Text NpfSecurity();
/// For the service of remote capture.
Text RpcapdSecurity();

/// A text with one character for each byte, its code in the code page.
Text FromHexBytes(const Text& hexBytes);

} // namespace quendra::shell
