#pragma once

#include "monitor/PortSource.h"
#include "platform/system/ShellStart.h"
#include "shell/MonitorPage.h"

namespace quendra::shell {

/// What the user can do to the selected process of the table. Without a selection nothing is done.
class ProcessActions {
 public:
  ProcessActions(MonitorPage& page, monitor::PortSource& ports, platform::Processes& processes,
                 platform::ShellStart& shellStart, forms::MessageLoop& loop);

  /// Whatever process it is, and without asking.
  void main_lblEndProcess_Click();
  /// Opens the folder of the process's file with the file selected.
  void main_lblJumpToPath_Click();
  void main_cmdAddRemove_Click();
  /// A press of the right button reads the selected row and does nothing with it.
  void main_ListView1_MouseDown(int button);

 private:
  void RemoveRow(const Text& key);
  void Tell(const char16_t* text, int icon);

  forms::ListView& list_;
  monitor::PortSource& ports_;
  platform::Processes& processes_;
  platform::ShellStart& shellStart_;
  forms::MessageLoop& loop_;
};

} // namespace quendra::shell
