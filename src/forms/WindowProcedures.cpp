#include "forms/WindowProcedures.h"

#include <algorithm>
#include <utility>

namespace quendra::forms {

namespace {

/// Puts a value back however its scope is left: a handler may end the program.
template <typename Value> class Restored {
 public:
  Restored(Value& place, Value now) : place_(place), before_(std::exchange(place, now)) {}
  ~Restored() { place_ = before_; }
  Restored(const Restored&) = delete;
  Restored& operator=(const Restored&) = delete;

 private:
  Value& place_;
  Value before_;
};

} // namespace

WindowHandle WindowProcedures::Add(const WindowProcedure& own) {
  const WindowHandle window(++last_);
  windows_[window] = {own, own};
  return window;
}

bool WindowProcedures::Remove(WindowHandle window) { return windows_.erase(window) > 0; }

WindowProcedure WindowProcedures::Procedure(WindowHandle window) const {
  const auto found = windows_.find(window);
  return found == windows_.end() ? nullptr : found->second.current;
}

WindowProcedure WindowProcedures::OwnProcedure(WindowHandle window) const {
  const auto found = windows_.find(window);
  return found == windows_.end() ? nullptr : found->second.own;
}

WindowProcedure WindowProcedures::Replace(WindowHandle window, WindowProcedure procedure) {
  const auto found = windows_.find(window);
  if (found == windows_.end()) return nullptr;
  if (!procedure) procedure = found->second.own;
  return std::exchange(found->second.current, std::move(procedure));
}

std::int32_t WindowProcedures::Dispatch(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                                        std::uint32_t lParam) const {
  const WindowProcedure procedure = Procedure(window);
  if (!procedure) return 0;
  Handlers handlers;
  const Restored<Handlers*> underWay(handlers_, &handlers);
  return Run(procedure, window, message, wParam, lParam);
}

std::int32_t WindowProcedures::Call(const WindowProcedure& procedure, WindowHandle window,
                                    std::uint32_t message, std::uint32_t wParam, std::uint32_t lParam) const {
  const Handler handler{procedure.get(), window, message};
  const bool handlesIt =
      handlers_ && std::find(handlers_->begin(), handlers_->end(), handler) != handlers_->end();
  const WindowProcedure next = procedure && !handlesIt ? procedure : OwnProcedure(window);
  return next ? Run(next, window, message, wParam, lParam) : 0;
}

// The procedure is held by the caller: it may replace itself or destroy its window.
std::int32_t WindowProcedures::Run(const WindowProcedure& procedure, WindowHandle window,
                                   std::uint32_t message, std::uint32_t wParam, std::uint32_t lParam) const {
  if (!handlers_) return (*procedure)(window, message, wParam, lParam);
  Handlers& handlers = *handlers_;
  handlers.push_back({procedure.get(), window, message});
  struct Leaves {
    Handlers& handlers;
    ~Leaves() { handlers.pop_back(); }
  } leaves{handlers};
  return (*procedure)(window, message, wParam, lParam);
}

} // namespace quendra::forms
