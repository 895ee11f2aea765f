#pragma once

#include <functional>
#include <utility>

namespace quendra::forms {

/// An event of a control or a form: one handler, or none.
template <typename... Args> class Event {
 public:
  template <typename Handler> Event& operator=(Handler handler) {
    handler_ = std::move(handler);
    return *this;
  }
  void operator()(Args... args) const {
    // A copy: the handler may replace or drop itself, as when its form unloads.
    if (const auto handler = handler_) handler(args...);
  }
  explicit operator bool() const { return static_cast<bool>(handler_); }

 private:
  std::function<void(Args...)> handler_;
};

} // namespace quendra::forms
