#pragma once

#include "monitor/MonitorPage.h"
#include "monitor/mdlFileInfo.h"
#include "platform/Machine.h"
#include "platform/process/Processes.h"

namespace quendra::forms {
class Desktop;
}

namespace quendra::monitor {

/// Adds the rows of the processes that one pass sees for the first time.
class ProcessRowAdder {
 public:
  ProcessRowAdder(const platform::Machine& machine, forms::Desktop& desktop, MonitorPage page,
                  mdlFileInfo& fileInfo)
      : machine_(machine), desktop_(desktop), page_(page), fileInfo_(fileInfo) {}

  void Add(const platform::Processes::Entry& entry, Text ports);

 private:
  void AddIconOf(const Text& path);
  int IconIndexOf(const Text& path) const;
  void AddCells(forms::ListRow& row, const Text& name, const Text& path, Text ports);
  std::int32_t Tick() const;

  platform::Machine machine_;
  forms::Desktop& desktop_;
  MonitorPage page_;
  mdlFileInfo& fileInfo_;
  // One text for the whole pass: a process of an unknown parent takes the class of the row added before it.
  Text class_;
};

} // namespace quendra::monitor
