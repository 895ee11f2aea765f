#pragma once

#include "platform/linux/process/ProcessList.h"
#include "platform/linux/system/Descriptor.h"
#include "platform/process/Processes.h"
#include "platform/process/SystemErrors.h"

#include <map>
#include <variant>
#include <vector>

namespace quendra::platform::linux_ {

/// A process that was opened, by its folder, which answers nothing more once the process has ended, also when
/// another one takes over its id.
struct OpenedProcess {
  Descriptor folder;
  /// By which it can be ended, where that was asked for.
  Descriptor process{};
};

/// A process list as it was, and how far it has been walked.
struct Snapshot {
  std::vector<ProcessList::Row> rows;
  std::size_t next = 0;
};

/// The access token of this program's own process.
struct OwnToken {};

/// The open handles of one program, and the error of the last call.
class HandleTable {
 public:
  using Object = std::variant<OpenedProcess, Snapshot, OwnToken>;

  Handle Add(Object object);
  /// nullptr when the handle is none, or one of another kind.
  template <typename Kind> Kind* Find(Handle handle) {
    const auto found = objects_.find(handle);
    return found == objects_.end() ? nullptr : std::get_if<Kind>(&found->second);
  }
  bool Close(Handle handle) { return objects_.erase(handle) != 0; }
  std::size_t Count() const { return objects_.size(); }

  std::uint32_t lastError = 0;

 private:
  std::uint32_t next_ = 0;
  std::map<Handle, Object> objects_;
};

} // namespace quendra::platform::linux_
