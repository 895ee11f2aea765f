#include "platform/linux/process/ProcessList.h"

#include "platform/linux/system/Files.h"
#include "platform/linux/system/SystemNames.h"

#include <algorithm>
#include <array>
#include <cstdlib>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint64_t kSeriesMilliseconds = 5000;
// No process has it: the kernel's own limit is far below.
constexpr std::uint32_t kNoProcess = 0xFFFFFFFF;

// Programs that show the desktop and start what the user picks there, the best first. The window managers at
// the end count only where none of the others runs.
constexpr std::array<std::string_view, 20> kDesktopShells = {
    "gnome-shell",  "plasmashell",  "cinnamon", "mate-panel", "xfce4-panel", "lxqt-panel", "lxpanel",
    "budgie-panel", "cosmic-panel", "gala",     "phosh",      "xfdesktop",   "pcmanfm-qt", "enlightenment",
    "sway",         "i3",           "fluxbox",  "icewm",      "openbox",     "weston"};

std::string_view FileNameOf(std::string_view path) { return path.substr(path.rfind('/') + 1); }

std::string NameFor(const ProcessStat& stat, const std::optional<std::string>& executable) {
  std::string name = SystemName(executable ? FileNameOf(*executable) : stat.comm);
  if (name.empty()) name = "?";
  return name.substr(0, ProcessList::kNameLength);
}

} // namespace

int DesktopShellRank(std::string_view fileName) {
  for (std::size_t i = 0; i < kDesktopShells.size(); ++i)
    if (fileName == kDesktopShells[i]) return static_cast<int>(i) + 1;
  return 0;
}

ProcessList::ProcessList(const ProcFolder& folder, Clock clock) : folder_(folder), clock_(std::move(clock)) {}

bool ProcessList::Read(std::vector<Row>& rows) {
  rows.clear();
  if (!folder_.List(places_)) return false;
  const std::uint64_t now = clock_();
  // While passes follow each other, names are read again a few at a time; after a pause all at once.
  const bool inSeries = now - lastRead_ <= kSeriesMilliseconds;
  mostRereads_ = inSeries ? places_.size() / 8 + 16 : places_.size();
  rereads_ = 0;
  lastRead_ = now;

  // What isn't carried over below belongs to processes that are gone.
  previous_.swap(known_);
  known_.clear();
  rows.reserve(places_.size());
  for (const auto& place : places_) {
    auto node = previous_.extract(place.processId);
    Known& known = node ? known_.insert(std::move(node)).position->second : known_[place.processId];
    if (!Update(known, place, now))
      known_.erase(place.processId);
    else if (!known.ended)
      rows.push_back({place.processId, known.parent, known.name, known.startTime});
  }
  previous_.clear();
  NameDesktopShell(rows);
  PutInOrder(rows);
  return true;
}

std::optional<std::uint64_t> ProcessList::StartTimeOf(std::uint32_t processId) const {
  const auto found = known_.find(processId);
  return found == known_.end() ? std::nullopt : std::optional(found->second.startTime);
}

bool ProcessList::IsDue(const Known& known, const ProcFolder::Place& place, std::uint64_t now) const {
  if (known.readAt == 0 || known.node != place.node || place.node == 0) return true;
  if (now - known.firstSeen <= kYoungMilliseconds) return true;
  return now - known.readAt >= kRereadMilliseconds && rereads_ < mostRereads_;
}

bool ProcessList::Update(Known& known, const ProcFolder::Place& place, std::uint64_t now) {
  if (!IsDue(known, place, now)) return true;
  if (known.node == place.node && now - known.firstSeen > kYoungMilliseconds) ++rereads_;
  const auto stat = folder_.Stat(place.processId);
  if (!stat) return false; // it has ended since the folder was listed

  if (known.node != place.node || known.startTime != stat->startTime) {
    known = Known();
    known.firstSeen = now;
  }
  known.parent = stat->parent;
  known.ended = stat->HasEnded() && !folder_.HasLivingThread(place.processId);
  if (known.readAt == 0 || known.comm != stat->comm) NameIt(known, place.processId, *stat);
  known.node = place.node;
  known.startTime = stat->startTime;
  known.readAt = now;
  return true;
}

void ProcessList::NameIt(Known& known, std::uint32_t processId, const ProcessStat& stat) {
  known.comm = stat.comm;
  known.shellRank = 0;
  known.isSystem = stat.isKernelThread && stat.parent == 0;
  if (processId == kFirstProcess) {
    known.name = "services.exe";
  } else if (known.isSystem) {
    known.name = "System";
  } else if (stat.isKernelThread) {
    known.name = NameFor(stat, {});
  } else {
    const auto executable = folder_.Executable(processId);
    known.name = NameFor(stat, executable);
    const int rank = DesktopShellRank(executable ? FileNameOf(*executable) : stat.comm);
    if (rank > 0 && BelongsToSession(processId)) known.shellRank = rank;
  }
}

/// The user's own processes; for the administrator those of the user who called, or anybody's when nobody
/// called.
bool ProcessList::BelongsToSession(std::uint32_t processId) const {
  const auto owner = folder_.UserOf(processId);
  if (!owner) return false;
  const std::uint32_t user = ::geteuid();
  if (user != 0) return *owner == user;
  const char* caller = std::getenv("SUDO_UID");
  const auto callerId = caller == nullptr ? std::nullopt : WholeNumber(caller);
  return !callerId || *owner == *callerId;
}

void ProcessList::NameDesktopShell(std::vector<Row>& rows) const {
  Row* shell = nullptr;
  int bestRank = 0;
  for (Row& row : rows) {
    const int rank = known_.find(row.processId)->second.shellRank;
    if (rank == 0 || (shell != nullptr && rank >= bestRank)) continue;
    shell = &row;
    bestRank = rank;
  }
  if (shell != nullptr) shell->name = "explorer.exe";
}

/// A process comes after the one that started it. Their ids don't tell, as they begin anew when they run out.
/// "System" is the kernel, so it comes first, and is the parent of what the kernel started and of itself: the
/// parent 0 stands for whatever isn't known yet.
void ProcessList::PutInOrder(std::vector<Row>& rows) const {
  std::stable_sort(rows.begin(), rows.end(),
                   [](const Row& left, const Row& right) { return left.startTime < right.startTime; });
  const auto system = std::find_if(rows.begin(), rows.end(), [this](const Row& row) {
    return known_.find(row.processId)->second.isSystem;
  });
  const std::uint32_t systemId = system == rows.end() ? kNoProcess : system->processId;
  if (system != rows.end()) std::rotate(rows.begin(), system, system + 1);
  for (Row& row : rows)
    if (row.parentProcessId == 0) row.parentProcessId = systemId;
}

} // namespace quendra::platform::linux_
