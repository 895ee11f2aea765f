#include "platform/linux/system/SessionBus.h"

#include <chrono>

namespace quendra::platform::linux_ {

namespace {

using std::chrono::microseconds;
using std::chrono::steady_clock;

constexpr microseconds kPatience{SessionBus::kSecond};

/// Whether the bus has let us in; one that listens and never answers is given up.
bool LetsUsIn(const BusLibrary& library, void* bus) {
  const auto end = steady_clock::now() + kPatience;
  for (auto now = steady_clock::now(); now < end; now = steady_clock::now()) {
    if (library.is_ready(bus) > 0) return true;
    const int handled = library.process(bus, nullptr);
    if (handled < 0) return false;
    const auto left = std::chrono::duration_cast<microseconds>(end - now).count();
    if (handled == 0 && library.wait(bus, static_cast<std::uint64_t>(left)) < 0) return false;
  }
  return false;
}

} // namespace

SessionBus::SessionBus() {
  void* opened = nullptr;
  if (!library_.isThere || library_.open_user(&opened) < 0) return;
  bus_ = {opened, library_.close_unref};
  if (!LetsUsIn(library_, opened)) bus_.reset();
}

} // namespace quendra::platform::linux_
