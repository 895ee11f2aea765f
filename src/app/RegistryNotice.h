#pragma once

#include "forms/MessageLoop.h"
#include "platform/EventLoop.h"

#include <string>

namespace quendra::app {

/// Tells the subscriber that the file of the registry was found damaged, where a system keeps it in one. It
/// is found in the midst of other work, so the box comes when that work lets events in.
class RegistryNotice {
 public:
  RegistryNotice(platform::EventLoop& events, forms::MessageLoop& boxes) : events_(&events), boxes_(&boxes) {}

  /// `keptAs` is the path of the damaged file, in UTF-8.
  void operator()(const std::string& keptAs) const;

 private:
  platform::EventLoop* events_;
  forms::MessageLoop* boxes_;
};

} // namespace quendra::app
