#include "platform/linux/process/HandleTable.h"

namespace quendra::platform::linux_ {

Handle HandleTable::Add(Object object) {
  // Multiples of 4, as the system's are, passing over those in use and those that mean "none".
  do next_ += 4;
  while (Handle(next_) == kNoHandle || objects_.contains(Handle(next_)));
  objects_.emplace(Handle(next_), std::move(object));
  return Handle(next_);
}

} // namespace quendra::platform::linux_
