#include "platform/linux/internet/CacheFolders.h"

#include <fcntl.h>

#include <cstring>
#include <string_view>

namespace quendra::platform::linux_ {

namespace {

struct Browser {
  CacheForm form;
  const char* folder;
};

/// Each holds profiles, or is one.
constexpr Browser kBrowsers[] = {
    {CacheForm::Firefox, "mozilla/firefox"},
    {CacheForm::Firefox, "librewolf"},
    {CacheForm::Firefox, "waterfox"},
    {CacheForm::Chromium, "chromium"},
    {CacheForm::Chromium, "google-chrome"},
    {CacheForm::Chromium, "google-chrome-beta"},
    {CacheForm::Chromium, "google-chrome-unstable"},
    {CacheForm::Chromium, "microsoft-edge"},
    {CacheForm::Chromium, "BraveSoftware/Brave-Browser"},
    {CacheForm::Chromium, "vivaldi"},
    {CacheForm::Chromium, "opera"},
};

/// Bounds what is open at once, however many profiles somebody makes.
constexpr std::size_t kMostFolders = 256;

constexpr int kFolderFlags = O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC;

/// Goes down one name after the other, so that no link on the way is followed.
Descriptor OpenBelow(int start, std::string_view path) {
  Descriptor folder(::openat(start, ".", O_RDONLY | O_DIRECTORY | O_CLOEXEC));
  while (folder && !path.empty()) {
    const std::size_t end = std::min(path.find('/'), path.size());
    folder = Descriptor(::openat(folder.Number(), std::string(path.substr(0, end)).c_str(), kFolderFlags));
    path.remove_prefix(std::min(end + 1, path.size()));
  }
  return folder;
}

const char* EntriesFolder(CacheForm form) {
  return form == CacheForm::Firefox ? "cache2/entries" : "Cache/Cache_Data";
}

using Folders = std::vector<std::shared_ptr<CacheFolder>>;

void AddProfile(CacheForm form, int profile, const std::string& path, Folders& folders) {
  if (folders.size() == kMostFolders) return;
  Descriptor entries = OpenBelow(profile, EntriesFolder(form));
  if (!entries) return;
  auto found = std::make_shared<CacheFolder>();
  found->form = form;
  found->descriptor = std::move(entries);
  found->path = path + "/" + EntriesFolder(form);
  folders.push_back(std::move(found));
}

bool IsAllOf(std::string_view text, const char* characters) {
  return text.find_first_not_of(characters) == std::string_view::npos;
}

} // namespace

FolderReader::FolderReader(int folder) {
  // A descriptor of its own: the stream closes it.
  const int own = ::openat(folder, ".", O_RDONLY | O_DIRECTORY | O_CLOEXEC);
  if (own < 0) return;
  stream_.reset(::fdopendir(own));
  if (!stream_) ::close(own);
}

const dirent* FolderReader::Next() {
  if (!stream_) return nullptr;
  const dirent* entry = nullptr;
  do entry = ::readdir(stream_.get());
  while (entry != nullptr && (std::strcmp(entry->d_name, ".") == 0 || std::strcmp(entry->d_name, "..") == 0));
  return entry;
}

Folders FindCacheFolders(const std::string& cacheHome) {
  Folders folders;
  // The folder that the user names may be a link of the user's own.
  const Descriptor home(::open(cacheHome.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
  if (!home) return folders;
  for (const Browser& browser : kBrowsers) {
    const Descriptor folder = OpenBelow(home.Number(), browser.folder);
    if (!folder) continue;
    const std::string path = cacheHome + "/" + browser.folder;
    AddProfile(browser.form, folder.Number(), path, folders);
    FolderReader profiles(folder.Number());
    while (const dirent* entry = profiles.Next()) {
      const Descriptor profile(::openat(folder.Number(), entry->d_name, kFolderFlags));
      if (profile) AddProfile(browser.form, profile.Number(), path + "/" + entry->d_name, folders);
    }
  }
  return folders;
}

bool IsCacheEntryName(CacheForm form, const char* name) {
  const std::string_view text(name);
  if (form == CacheForm::Firefox) return text.size() == 40 && IsAllOf(text, "0123456789ABCDEF");
  if (text.starts_with("f_")) return text.size() == 8 && IsAllOf(text.substr(2), "0123456789abcdef");
  return text.size() == 18 && IsAllOf(text.substr(0, 16), "0123456789abcdef") && text[16] == '_' &&
         IsAllOf(text.substr(17), "01s");
}

} // namespace quendra::platform::linux_
