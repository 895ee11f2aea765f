#include "platform/linux/programs/IconTheme.h"

#include "platform/linux/programs/KeyFile.h"
#include "platform/linux/system/Files.h"

#include <sys/stat.h>

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

constexpr const char* kExtensions[] = {".png", ".svg", ".xpm"};
constexpr std::size_t kSettingsBytes = 65536;
constexpr std::size_t kMostFolders = 1024;

bool IsFile(const std::string& path) {
  struct stat file {};
  return ::stat(path.c_str(), &file) == 0 && S_ISREG(file.st_mode);
}

bool IsFolder(const std::string& path) {
  struct stat file {};
  return ::stat(path.c_str(), &file) == 0 && S_ISDIR(file.st_mode);
}

/// Names become parts of paths: none may lead out of its folder.
bool IsPlainName(const std::string& name) {
  return !name.empty() && name.size() <= 255 && name != "." && name != ".." &&
         name.find_first_of(std::string_view("/\0", 2)) == std::string::npos;
}

bool StaysInside(const std::string& folder) {
  return !folder.empty() && folder[0] != '/' && folder.find("..") == std::string::npos &&
         folder.size() <= 255;
}

int NumberOr(const std::string& text, int otherwise) {
  const auto number = WholeNumber(text);
  return number && *number <= 4096 ? static_cast<int>(*number) : otherwise;
}

struct RankedFolder {
  int rank;
  std::string name;
};

/// The folders that a theme's own list names, the best size first.
std::vector<RankedFolder> FoldersOf(const KeyFile& theme) {
  std::vector<RankedFolder> folders;
  for (const char* key : {"Directories", "ScaledDirectories"}) {
    for (const auto& name : Split(ValueIn(theme, "Icon Theme", key), ',')) {
      if (!StaysInside(name) || folders.size() >= kMostFolders) continue;
      const int size = NumberOr(ValueIn(theme, name, "Size"), 0);
      if (size == 0) continue;
      folders.push_back(
          {IconSizeRank(size, NumberOr(ValueIn(theme, name, "Scale"), 1), ValueIn(theme, name, "Type")),
           name});
    }
  }
  std::stable_sort(folders.begin(), folders.end(), [](const RankedFolder& left, const RankedFolder& right) {
    return left.rank < right.rank;
  });
  return folders;
}

} // namespace

int IconSizeRank(int size, int scale, std::string_view type) {
  if (type == "Scalable") return 6;
  const int pixels = size * std::max(scale, 1);
  const int scaled = scale > 1 ? 1 : 0;
  if (pixels == 32) return 0 + scaled;
  if (pixels == 48) return 2 + scaled;
  if (pixels == 64) return 4 + scaled;
  if (pixels > 32) return 2 * pixels + scaled;
  return 20000 - 2 * pixels + scaled;
}

IconTheme::IconTheme(UserFolders folders, Clock clock)
    : folders_(std::move(folders)), watch_(std::move(clock)) {}

bool IconTheme::Refresh() {
  if (loaded_ && !watch_.HasChanged()) return false;
  Load();
  return true;
}

std::optional<std::string> IconTheme::Find(const std::string& icon) {
  if (!loaded_) Load();
  if (icon.starts_with('/')) return IsFile(icon) ? std::optional(icon) : std::nullopt;
  if (!IsPlainName(icon)) return {};
  for (const auto& folders : themeFolders_)
    if (auto found = FindIn(folders, icon)) return found;
  return FindIn(bases_, icon);
}

std::optional<std::string> IconTheme::FindIn(const std::vector<std::string>& folders,
                                             const std::string& name) const {
  // Some entries name a picture that belongs to no theme by its whole file name.
  const bool hasEnding = std::any_of(std::begin(kExtensions), std::end(kExtensions),
                                     [&](const char* extension) { return name.ends_with(extension); });
  for (const auto& folder : folders) {
    const std::string path = folder + "/" + name;
    if (hasEnding && IsFile(path)) return path;
    for (const char* extension : kExtensions)
      if (IsFile(path + extension)) return path + extension;
  }
  return {};
}

void IconTheme::Load() {
  loaded_ = true;
  bases_ = {folders_.home + "/.icons"};
  for (const auto& folder : folders_.dataDirs) bases_.push_back(folder + "/icons");
  themes_.clear();
  themeFolders_.clear();
  watch_.Clear();
  AddTheme(NameOfUserTheme());
  AddTheme("hicolor");
  for (const auto& folder : folders_.dataDirs) bases_.push_back(folder + "/pixmaps");
  for (const auto& base : bases_) watch_.Add(base);
}

void IconTheme::AddTheme(const std::string& name) {
  if (!IsPlainName(name) || themes_.size() >= kMostThemes) return;
  if (std::find(themes_.begin(), themes_.end(), name) != themes_.end()) return;
  std::optional<std::string> index;
  for (const auto& base : bases_) {
    watch_.Add(base + "/" + name);
    if (!index) index = ReadFile(base + "/" + name + "/index.theme", kThemeBytes);
  }
  if (!index) return;
  const KeyFile theme = ParseKeyFile(*index);
  themes_.push_back(name);
  auto& folders = themeFolders_.emplace_back();
  for (const auto& folder : FoldersOf(theme))
    for (const auto& base : bases_)
      if (std::string path = base + "/" + name + "/" + folder.name; IsFolder(path))
        folders.push_back(std::move(path));
  // "hicolor" ends every chain, so it is added last, whoever names it.
  for (const auto& parent : Split(ValueIn(theme, "Icon Theme", "Inherits"), ','))
    if (parent != "hicolor") AddTheme(parent);
}

std::string IconTheme::NameOfUserTheme() const {
  std::vector<std::string> configs = {folders_.configHome};
  configs.insert(configs.end(), folders_.configDirs.begin(), folders_.configDirs.end());
  for (const auto& config : configs) {
    for (const char* file : {"/gtk-4.0/settings.ini", "/gtk-3.0/settings.ini"})
      if (const auto text = ReadFile(config + file, kSettingsBytes))
        if (auto name = ValueIn(ParseKeyFile(*text), "Settings", "gtk-icon-theme-name"); !name.empty())
          return name;
    if (const auto text = ReadFile(config + "/kdeglobals", kSettingsBytes))
      if (auto name = ValueIn(ParseKeyFile(*text), "Icons", "Theme"); !name.empty()) return name;
  }
  return "Adwaita";
}

} // namespace quendra::platform::linux_
