#include "diagnostics/SharingCheck.h"

namespace quendra::diagnostics {

namespace {

struct SharingProgram {
  TextView partOfName;
  TextView displayName;
};

// The parts are looked for as they stand, whatever a program's maker calls it.
constexpr SharingProgram kSharingPrograms[] = {
    {u"emule", u"Emule - אימיול"},
    {u"kazza", u"Kazza - קאזאה"},
    {u"sababadc", u"SababaDC - סבבה"},
    {u"bittorent", u"Bittorent - ביטורנט"},
};

constexpr int kProcessesABar = 3;

Text NamesFoundIn(const platform::Processes::Entry& process) {
  const Text name = Lowered(FromCodePage(CutAtNul({process.exeFile.data(), process.exeFile.size()})));
  Text found;
  for (const SharingProgram& program : kSharingPrograms)
    if (name.find(program.partOfName) != Text::npos) found += program.displayName;
  return found;
}

} // namespace

Outcome SharingCheck::Run(CheckRows& rows) {
  rows.SetDetail(FindPrograms(rows));
  return Outcome::Passed;
}

Text SharingCheck::FindPrograms(CheckRows& rows) {
  Text found;
  const platform::Handle snapshot = processes_.CreateToolhelp32Snapshot(platform::Processes::kSnapProcess, 0);
  if (snapshot == platform::kInvalidHandle) return found;
  platform::Processes::Entry process;
  int count = 0;
  for (bool more = processes_.Process32First(snapshot, process); more;
       more = processes_.Process32Next(snapshot, process)) {
    found += NamesFoundIn(process);
    if (++count % kProcessesABar != 0) continue;
    rows.AppendBar();
    rows.Repaint();
  }
  processes_.CloseHandle(snapshot);
  return found;
}

} // namespace quendra::diagnostics
