#include "shell/ProcessActions.h"

#include "foundation/Wording.h"
#include "monitor/OwnedHandle.h"
#include "monitor/ProcessRow.h"

namespace quendra::shell {

using platform::ShellStart;

ProcessActions::ProcessActions(MonitorPage& page, monitor::PortSource& ports, platform::Processes& processes,
                               ShellStart& shellStart, forms::MessageLoop& loop)
    : list_(page.table.main_ListView1), ports_(ports), processes_(processes), shellStart_(shellStart),
      loop_(loop) {
  page.main_lblEndProcess.Click = [this] { main_lblEndProcess_Click(); };
  page.main_lblJumpToPath.Click = [this] { main_lblJumpToPath_Click(); };
  page.main_cmdAddRemove.Click = [this] { main_cmdAddRemove_Click(); };
  list_.MouseDown = [this](int button, int, int, int) { main_ListView1_MouseDown(button); };
}

void ProcessActions::main_lblEndProcess_Click() {
  const forms::ListRow* row = list_.SelectedItem();
  if (!row) return;
  const Text key = row->Key(); // the row may go while a box stands
  ports_.EnableDebugging();
  const auto processId = static_cast<std::uint32_t>(monitor::ProcessIdOfKey(key));
  const monitor::OwnedHandle process(
      processes_, processes_.OpenProcess(platform::Processes::kTerminate, false, processId));
  if (processes_.TerminateProcess(process.Get(), 0))
    RemoveRow(key);
  else
    Tell(u"אין אפשרות לסיים את התהליך!", forms::kCritical);
}

void ProcessActions::RemoveRow(const Text& key) {
  if (const forms::ListRow* row = list_.Find(key)) list_.Remove(list_.IndexOf(*row));
}

void ProcessActions::main_lblJumpToPath_Click() {
  const forms::ListRow* row = list_.SelectedItem();
  if (!row) return;
  const Text path = row->CellTag(monitor::kNameCell).AsText();
  if (path.empty())
    Tell(u"אין אפשרות לאתר את קובץ היישום.", forms::kInformation);
  else
    shellStart_.Shell("explorer.exe /n, /e, /select, " + ToCodePage(path), ShellStart::kNormalWindow);
}

void ProcessActions::main_cmdAddRemove_Click() {
  shellStart_.Shell("rundll32.exe shell32.dll,Control_RunDLL appwiz.cpl,,", ShellStart::kAsItIsShown);
}

void ProcessActions::main_ListView1_MouseDown(int button) {
  const forms::ListRow* row = list_.SelectedItem();
  if (button != forms::kRightButton || !row) return;
  [[maybe_unused]] const Text read = row->CellText(monitor::kClassCell);
}

void ProcessActions::Tell(const char16_t* text, int icon) {
  loop_.MessageBox(text, forms::kHebrewBox | icon, foundation::kTitle);
}

} // namespace quendra::shell
