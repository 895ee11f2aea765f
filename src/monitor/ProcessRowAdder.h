#pragma once

#include "forms/Canvas.h"
#include "monitor/TableControls.h"
#include "monitor/mdlFileInfo.h"
#include "platform/process/Icons.h"
#include "platform/process/Processes.h"
#include "platform/system/System.h"

namespace quendra::monitor {

/// Adds the rows of the processes that a pass sees for the first time.
class ProcessRowAdder {
 public:
  ProcessRowAdder(platform::Icons& icons, platform::System& system, forms::Canvas& canvas,
                  TableControls& controls, mdlFileInfo& fileInfo)
      : icons_(icons), system_(system), canvas_(canvas), controls_(controls), fileInfo_(fileInfo) {}

  /// `classOfRow` is the class of the row added before, and becomes that of this one.
  void Add(const platform::Processes::Entry& entry, Text ports, Text& classOfRow);

 private:
  void AddIconOf(const Text& path);
  int IconIndexOf(const Text& path) const;
  static void AddRateCells(forms::ListRow& row);
  std::int32_t Tick() const;

  platform::Icons& icons_;
  platform::System& system_;
  forms::Canvas& canvas_;
  TableControls& controls_;
  mdlFileInfo& fileInfo_;
};

} // namespace quendra::monitor
