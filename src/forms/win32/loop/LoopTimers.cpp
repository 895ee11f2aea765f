#include "forms/win32/loop/LoopTimers.h"

#include <algorithm>

namespace quendra::forms::win32 {

class LoopTimers::Running : public platform::EventLoop::Subscription {
 public:
  Running(std::shared_ptr<Table> table, UINT_PTR number) : table_(std::move(table)), number_(number) {}
  ~Running() override {
    table_->ticks.erase(number_);
    if (table_->window) ::KillTimer(table_->window, number_);
  }

 private:
  std::shared_ptr<Table> table_;
  UINT_PTR number_;
};

std::unique_ptr<platform::EventLoop::Subscription> LoopTimers::Start(int milliseconds, Tick tick) {
  const UINT_PTR number = ++table_->last;
  table_->ticks[number] = std::make_shared<const Tick>(std::move(tick));
  auto running = std::make_unique<Running>(table_, number);
  ::SetTimer(table_->window, number, static_cast<UINT>(std::max(milliseconds, 1)), nullptr);
  return running;
}

std::shared_ptr<const LoopTimers::Tick> LoopTimers::TickOf(UINT_PTR number) const {
  const auto found = table_->ticks.find(number);
  return found == table_->ticks.end() ? nullptr : found->second;
}

} // namespace quendra::forms::win32
