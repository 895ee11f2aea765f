#pragma once

#include "runtime/OpaqueHandle.h"

#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <string>

namespace quendra::forms {

using quendra::kNoWindow;
using quendra::WindowHandle;

/// What answers the messages that reach a window: window, message, wParam, lParam.
using WindowProcedure = std::shared_ptr<
    const std::function<std::int32_t(WindowHandle, std::uint32_t, std::uint32_t, std::uint32_t)>>;

/// Windows that nobody sees: they exist to receive messages, and their procedures can be replaced.
class MessageWindows {
 public:
  virtual ~MessageWindows() = default;

  /// The new window's handle, kNoWindow on failure. Its procedure answers 0 to everything.
  virtual WindowHandle Create();
  /// False for a handle that is no window.
  virtual bool Destroy(WindowHandle window);
  /// Empty for a handle that is no window.
  WindowProcedure Procedure(WindowHandle window) const;
  /// The procedure that stood there before.
  WindowProcedure Replace(WindowHandle window, WindowProcedure procedure);
  /// A message reaches the window; one for a window that has gone is lost.
  std::int32_t Dispatch(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                        std::uint32_t lParam) const;
  int Count() const { return static_cast<int>(procedures_.size()); }

 private:
  std::map<WindowHandle, WindowProcedure> procedures_;
  std::uint32_t last_ = 0x40000;
};

} // namespace quendra::forms
