#include "platform/linux/internet/LinuxUrlCache.h"

#include "platform/linux/internet/CacheFileAddress.h"
#include "platform/linux/system/SystemNames.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <utility>

namespace quendra::platform::linux_ {

namespace {

CacheFileReader ReaderOf(int file) {
  return [file](std::uint64_t at, std::span<std::uint8_t> bytes) -> std::size_t {
    ssize_t count = 0;
    do count = ::pread(file, bytes.data(), bytes.size(), static_cast<off_t>(at));
    while (count < 0 && errno == EINTR);
    return count < 0 ? 0 : static_cast<std::size_t>(count);
  };
}

std::optional<std::string> AddressIn(CacheForm form, int file, std::uint64_t size) {
  const CacheFileReader read = ReaderOf(file);
  return form == CacheForm::Firefox ? FirefoxCacheAddress(read, size) : ChromiumCacheAddress(read);
}

/// What the entry's file tells, its path when it tells none or can't be read; nothing for what is no file, or
/// no more.
std::optional<std::string> NameOfEntry(const CacheFolder& folder, const char* file) {
  const std::string path = folder.path + "/" + file;
  // Without waiting on a pipe, and without a link being followed.
  const Descriptor opened(
      ::openat(folder.descriptor.Number(), file, O_RDONLY | O_CLOEXEC | O_NOFOLLOW | O_NONBLOCK | O_NOCTTY));
  if (!opened) return errno == EACCES ? std::optional(SystemName(path)) : std::nullopt;
  struct stat status {};
  if (::fstat(opened.Number(), &status) != 0 || !S_ISREG(status.st_mode)) return {};
  const auto address = AddressIn(folder.form, opened.Number(), static_cast<std::uint64_t>(status.st_size));
  return SystemName(address.value_or(path));
}

bool MayBeFile(const dirent& entry) { return entry.d_type == DT_REG || entry.d_type == DT_UNKNOWN; }

} // namespace

/// Goes through the folders, one file a step.
class LinuxUrlCache::Walk {
 public:
  Walk(const std::string& cacheHome, std::shared_ptr<std::unordered_multimap<std::string, Place>> places)
      : folders_(FindCacheFolders(cacheHome)), places_(std::move(places)) {}

  std::optional<CachedUrl> Next() {
    for (; at_ < folders_.size(); ++at_, reader_.reset()) {
      const auto& folder = folders_[at_];
      if (!reader_) reader_.emplace(folder->descriptor.Number());
      while (const dirent* entry = reader_->Next()) {
        if (!MayBeFile(*entry) || !IsCacheEntryName(folder->form, entry->d_name)) continue;
        auto name = NameOfEntry(*folder, entry->d_name);
        if (!name) continue;
        places_->emplace(*name, Place{folder, entry->d_name});
        return CachedUrl{std::move(*name)};
      }
    }
    return {};
  }

 private:
  std::vector<std::shared_ptr<CacheFolder>> folders_;
  std::shared_ptr<std::unordered_multimap<std::string, Place>> places_;
  std::size_t at_ = 0;
  std::optional<FolderReader> reader_;
};

CachedUrls LinuxUrlCache::Begin() {
  places_ = std::make_shared<std::unordered_multimap<std::string, Place>>();
  auto walk = std::make_shared<Walk>(cacheHome_, places_);
  return [walk] { return walk->Next(); };
}

bool LinuxUrlCache::DeleteUrlCacheEntryA(const std::string& name) {
  if (!places_) return Succeed(false, kErrorFileNotFound);
  const auto found = places_->find(std::string(CutAtNul(std::string_view(name))));
  if (found == places_->end()) return Succeed(false, kErrorFileNotFound);
  const Place place = std::move(found->second);
  places_->erase(found);
  const bool isGone = ::unlinkat(place.folder->descriptor.Number(), place.file.c_str(), 0) == 0;
  return Succeed(isGone, errno == ENOENT ? kErrorFileNotFound : kErrorAccessDenied);
}

} // namespace quendra::platform::linux_
