#include "platform/linux/programs/DesktopIndex.h"

#include "platform/linux/programs/StartScript.h"
#include "platform/linux/system/Descriptor.h"
#include "platform/linux/system/Files.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <algorithm>
#include <climits>
#include <cstdlib>
#include <filesystem>

namespace quendra::platform::linux_ {

namespace {

bool IsProgram(const std::string& path) {
  struct stat file {};
  return ::stat(path.c_str(), &file) == 0 && S_ISREG(file.st_mode) && (file.st_mode & 0111) != 0;
}

std::string RealPath(const std::string& path) {
  char real[PATH_MAX];
  return ::realpath(path.c_str(), real) == nullptr ? std::string() : real;
}

bool IsScript(const std::string& path) {
  const Descriptor file(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY));
  char start[2] = {};
  return file && ::read(file.Number(), start, 2) == 2 && start[0] == '#' && start[1] == '!';
}

std::string FileNameOf(const std::string& path) { return path.substr(path.rfind('/') + 1); }

} // namespace

DesktopIndex::DesktopIndex(UserFolders folders, Clock clock)
    : folders_(std::move(folders)), watch_(std::move(clock)) {}

const DesktopEntry* DesktopIndex::EntryFor(const std::string& executable) {
  if (watch_.HasChanged() || generation_ == 0) Build();
  if (const auto found = entryOf_.find(executable); found != entryOf_.end()) return &found->second.entry;
  // A script of the same name often does nothing but start it. The name alone says nothing: any file can have
  // it.
  const auto found = entryOfScript_.find(FileNameOf(executable));
  if (found == entryOfScript_.end() || !IsProgramOfScript(executable, found->second.program)) return nullptr;
  return &found->second.entry;
}

void DesktopIndex::Build() {
  ++generation_;
  entriesRead_ = 0;
  entryOf_.clear();
  entryOfScript_.clear();
  watch_.Clear();
  for (const auto& folder : folders_.dataDirs) AddFolder(folder + "/applications", 0);
}

void DesktopIndex::AddFolder(const std::string& folder, int depth) {
  watch_.Add(folder);
  std::vector<std::string> files, subfolders;
  std::error_code error;
  for (std::filesystem::directory_iterator entry(folder, error), end; !error && entry != end;
       entry.increment(error)) {
    std::error_code ignored;
    if (entry->path().extension() == ".desktop")
      files.push_back(entry->path().string());
    else if (depth < kMostDepth && entry->is_directory(ignored))
      subfolders.push_back(entry->path().string());
    if (files.size() + subfolders.size() > static_cast<std::size_t>(kMostEntries)) break;
  }
  std::sort(files.begin(), files.end());
  std::sort(subfolders.begin(), subfolders.end());
  for (const auto& file : files) AddEntry(file);
  for (const auto& subfolder : subfolders)
    if (entriesRead_ < kMostEntries) AddFolder(subfolder, depth + 1);
}

void DesktopIndex::AddEntry(const std::string& path) {
  if (++entriesRead_ > kMostEntries) return;
  const auto text = ReadFile(path, kEntryBytes);
  auto entry = text ? ParseDesktopEntry(*text) : std::nullopt;
  if (!entry) return;
  if (!entry->requiredProgram.empty() && Resolve(entry->requiredProgram).empty()) return;
  const std::string program = Resolve(entry->program);
  if (program.empty()) return;

  const bool isScript = IsScript(program);
  const std::string key = isScript ? FileNameOf(entry->program) : program;
  Ranked ranked{std::move(*entry), program, 0};
  ranked.rank = (ranked.entry.isShown ? 0 : 2) + (ranked.entry.hasArguments ? 1 : 0);
  auto& entries = isScript ? entryOfScript_ : entryOf_;
  const auto [place, isNew] = entries.try_emplace(key, ranked);
  if (!isNew && ranked.rank < place->second.rank) place->second = std::move(ranked);
}

/// The file that a program's name or path leads to, every link followed; empty when there is none.
std::string DesktopIndex::Resolve(const std::string& program) const {
  if (program.starts_with('/')) return IsProgram(program) ? RealPath(program) : std::string();
  if (program.find('/') != std::string::npos) return {};
  for (const auto& folder : folders_.programDirs) {
    const std::string path = folder + "/" + program;
    if (IsProgram(path)) return RealPath(path);
  }
  return {};
}

} // namespace quendra::platform::linux_
