#include "monitor/ProcessRowAdder.h"

#include "forms/Canvas.h"
#include "monitor/ProcessRow.h"

namespace quendra::monitor {

namespace {

constexpr int kIconSize = 32;
constexpr int kDefaultIcon = 1;

} // namespace

void ProcessRowAdder::Add(const platform::Processes::Entry& entry, Text ports, Text& classOfRow) {
  canvas_.Cls(controls_.main_Pic);
  const Text name = ExeNameOf(entry);
  Text path;
  if (entry.processId > 0) path = fileInfo_.ModulePathOf(entry.processId);
  if (!path.empty()) AddIconOf(path);
  Text application = fileInfo_.ApplicationNameOf(path);
  fileInfo_.RecordWellKnown(name, entry.processId);
  if (const char16_t* known = fileInfo_.ClassOfParent(entry.parentProcessId)) classOfRow = known;
  forms::ListRow& row =
      controls_.main_ListView1.Add(KeyOfProcess(entry.processId), std::move(application), IconIndexOf(path));
  row.CellTag(kApplicationCell) = kAlive;
  row.AddCell(name, path);
  row.AddCell(classOfRow, Tick());
  row.AddCell(std::move(ports), Tick());
  AddRateCells(row);
}

void ProcessRowAdder::AddIconOf(const Text& path) {
  const platform::Handle icon = icons_.ExtractIconExA(ToCodePage(path), 0);
  if (icon == platform::kNoHandle) return;
  canvas_.DrawIconEx(controls_.main_Pic, 0, 0, icons_.ImageOf(icon), kIconSize, kIconSize);
  icons_.DestroyIcon(icon);
  controls_.main_ImList.Add(canvas_.ImageOf(controls_.main_Pic), path);
}

int ProcessRowAdder::IconIndexOf(const Text& path) const {
  const int index = controls_.main_ImList.IndexOfTag(path);
  return index == 0 ? kDefaultIcon : index;
}

void ProcessRowAdder::AddRateCells(forms::ListRow& row) {
  for (int cell = kUploadCell; cell <= kOverallCell; ++cell) row.AddCell(u"0", 0.0);
  for (int cell = kPreviousUploadCell; cell <= kPreviousDownloadCell; ++cell) row.AddCell({}, 0.0);
}

std::int32_t ProcessRowAdder::Tick() const { return static_cast<std::int32_t>(system_.GetTickCount()); }

} // namespace quendra::monitor
