#include "platform/linux/system/SessionBus.h"

namespace quendra::platform::linux_ {

SessionBus::SessionBus() {
  void* opened = nullptr;
  if (!library_.isThere || library_.open_user(&opened) < 0) return;
  bus_ = {opened, library_.close_unref};
  if (!library_.LetsUsIn(opened, kSecond)) bus_.reset();
}

} // namespace quendra::platform::linux_
