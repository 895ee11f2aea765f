#include "forms/MessageWindows.h"

#include <utility>

namespace quendra::forms {

WindowHandle MessageWindows::Create() {
  using Procedure = WindowProcedure::element_type;
  const WindowHandle window(++last_);
  procedures_[window] = std::make_shared<Procedure>([](auto...) { return 0; });
  return window;
}

bool MessageWindows::Destroy(WindowHandle window) { return procedures_.erase(window) > 0; }

WindowProcedure MessageWindows::Procedure(WindowHandle window) const {
  const auto found = procedures_.find(window);
  return found == procedures_.end() ? nullptr : found->second;
}

WindowProcedure MessageWindows::Replace(WindowHandle window, WindowProcedure procedure) {
  const auto found = procedures_.find(window);
  return found == procedures_.end() ? nullptr : std::exchange(found->second, std::move(procedure));
}

std::int32_t MessageWindows::Dispatch(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                                      std::uint32_t lParam) const {
  // Held by a copy: the procedure may replace itself or destroy its window.
  const WindowProcedure procedure = Procedure(window);
  return procedure ? (*procedure)(window, message, wParam, lParam) : 0;
}

} // namespace quendra::forms
