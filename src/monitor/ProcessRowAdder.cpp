#include "monitor/ProcessRowAdder.h"

#include "forms/Desktop.h"
#include "monitor/ProcessRow.h"
#include "platform/process/Icons.h"
#include "platform/system/System.h"

namespace quendra::monitor {

namespace {

constexpr int kIconSize = 32;
constexpr int kDefaultIcon = 1;

} // namespace

void ProcessRowAdder::Add(const platform::Processes::Entry& entry, Text ports) {
  desktop_.Cls(page_.main_Pic);
  const Text name = ExeNameOf(entry);
  Text path;
  if (entry.processId > 0) path = fileInfo_.ModulePathOf(entry.processId);
  if (!path.empty()) AddIconOf(path);
  Text application = fileInfo_.ApplicationNameOf(path);
  fileInfo_.RecordWellKnown(name, entry.processId);
  if (const char16_t* known = fileInfo_.ClassOfParent(entry.parentProcessId)) class_ = known;
  forms::ListRow& row =
      page_.main_ListView1.Add(KeyOfProcess(entry.processId), std::move(application), IconIndexOf(path));
  row.CellTag(kApplicationCell) = kAlive;
  AddCells(row, name, path, std::move(ports));
}

void ProcessRowAdder::AddIconOf(const Text& path) {
  const platform::Handle icon = machine_.icons.ExtractIconExA(ToCodePage(path), 0);
  if (icon == platform::kNoHandle) return;
  desktop_.DrawIconEx(page_.main_Pic, 0, 0, machine_.icons.ImageOf(icon), kIconSize, kIconSize);
  machine_.icons.DestroyIcon(icon);
  page_.main_ImList.Add(desktop_.ImageOf(page_.main_Pic), path);
}

int ProcessRowAdder::IconIndexOf(const Text& path) const {
  const int index = page_.main_ImList.IndexOfTag(path);
  return index == 0 ? kDefaultIcon : index;
}

void ProcessRowAdder::AddCells(forms::ListRow& row, const Text& name, const Text& path, Text ports) {
  row.AddCell(name, path);
  row.AddCell(class_, Tick());
  row.AddCell(std::move(ports), Tick());
  for (int cell = kUploadCell; cell <= kOverallCell; ++cell) row.AddCell(u"0", 0.0);
  for (int cell = kPreviousUploadCell; cell <= kPreviousDownloadCell; ++cell) row.AddCell({}, 0.0);
}

std::int32_t ProcessRowAdder::Tick() const {
  return static_cast<std::int32_t>(machine_.system.GetTickCount());
}

} // namespace quendra::monitor
