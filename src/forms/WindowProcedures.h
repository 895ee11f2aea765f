#pragma once

#include "runtime/OpaqueHandle.h"

#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <vector>

namespace quendra::forms {

using quendra::kNoWindow;
using quendra::WindowHandle;

/// What answers the messages that reach a window: window, message, wParam, lParam.
using WindowProcedure = std::shared_ptr<
    const std::function<std::int32_t(WindowHandle, std::uint32_t, std::uint32_t, std::uint32_t)>>;

/// The procedures of all windows of a desktop, those of its forms too. Each can be replaced; the window's own
/// one stays behind it.
class WindowProcedures {
 public:
  virtual ~WindowProcedures() = default;

  /// A window that answers by this procedure of its own.
  WindowHandle Add(const WindowProcedure& own);
  /// False for a handle that is no window.
  bool Remove(WindowHandle window);

  /// The procedure that stands there now. Empty for a handle that is no window.
  WindowProcedure Procedure(WindowHandle window) const;
  /// The procedure that stood there before. An empty one puts the window's own back.
  WindowProcedure Replace(WindowHandle window, WindowProcedure procedure);
  /// A message reaches the window; one for a window that has gone is lost.
  std::int32_t Dispatch(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                        std::uint32_t lParam) const;
  /// Passes a message on to the procedure that stood there before. An empty one stands for the window's own,
  /// and so does one that handles this message already: a procedure that became its own predecessor would
  /// never come to an end.
  std::int32_t Call(const WindowProcedure& procedure, WindowHandle window, std::uint32_t message,
                    std::uint32_t wParam, std::uint32_t lParam) const;

  int Count() const { return static_cast<int>(windows_.size()); }

 private:
  struct Window {
    WindowProcedure own;
    WindowProcedure current;
  };
  /// A procedure that handles a message.
  struct Handler {
    const void* procedure;
    WindowHandle window;
    std::uint32_t message;
    friend bool operator==(const Handler&, const Handler&) = default;
  };
  /// Those that handle one message, the first to get it first.
  using Handlers = std::vector<Handler>;

  std::int32_t Run(const WindowProcedure& procedure, WindowHandle window, std::uint32_t message,
                   std::uint32_t wParam, std::uint32_t lParam) const;
  WindowProcedure OwnProcedure(WindowHandle window) const;

  std::map<WindowHandle, Window> windows_;
  std::uint32_t last_ = 0x40000;
  mutable Handlers* handlers_ = nullptr; ///< of the message under way
};

} // namespace quendra::forms
