#pragma once

#include "runtime/OpaqueHandle.h"

#include <cstdint>

namespace quendra::foundation {

/// What the owner of a `cSubCls` does with the messages that it sees.
class iSubCls {
 public:
  virtual ~iSubCls() = default;

  /// After the procedure that stood there before: `lReturn` holds what that returned, and what is left in it
  /// goes back to the sender.
  virtual void Despues(std::int32_t& lReturn, WindowHandle hWnd, std::uint32_t uMsg, std::uint32_t wParam,
                       std::uint32_t lParam) = 0;
  /// Before it. Both references come as 0; with another `bHandled` that procedure doesn't see the message,
  /// and `lReturn` goes back to the sender.
  virtual void Antes(std::int32_t& bHandled, std::int32_t& lReturn, WindowHandle hWnd, std::uint32_t uMsg,
                     std::uint32_t wParam, std::uint32_t lParam) = 0;
};

} // namespace quendra::foundation
