#include "platform/windows/internet/WindowsUrlCache.h"

#include <wininet.h>

#include <vector>

namespace quendra::platform::windows {

/// Goes from entry to entry.
class WindowsUrlCache::Walk {
 public:
  explicit Walk(WindowsUrlCache& cache) : cache_(cache), wininet_(cache.wininet_) {}
  ~Walk() {
    const auto close = wininet_->Find<decltype(::FindCloseUrlCache)>("FindCloseUrlCache");
    if (walk_ && close) close(walk_);
  }
  Walk(const Walk&) = delete;

  std::optional<CachedUrl> Next() {
    // The size of an entry is told by a call that finds too little room.
    while (!Fetch()) {
      const bool wantsMore =
          ::GetLastError() == ERROR_INSUFFICIENT_BUFFER && size_ > buffer_.size() * sizeof(Unit);
      if (!wantsMore) return {};
      buffer_.resize((size_ + sizeof(Unit) - 1) / sizeof(Unit));
    }
    const auto& entry = *reinterpret_cast<const INTERNET_CACHE_ENTRY_INFOW*>(buffer_.data());
    const Text name = entry.lpszSourceUrlName ? winapi::TextOf(entry.lpszSourceUrlName) : Text();
    return cache_.Told(name, entry.CacheEntryType);
  }

 private:
  /// As aligned as an entry.
  using Unit = std::uint64_t;
  static constexpr std::size_t kFirstRoom = 4096;

  bool Fetch() {
    auto* const entry = reinterpret_cast<INTERNET_CACHE_ENTRY_INFOW*>(buffer_.data());
    size_ = static_cast<DWORD>(buffer_.size() * sizeof(Unit));
    const auto next = wininet_->Find<decltype(::FindNextUrlCacheEntryW)>("FindNextUrlCacheEntryW");
    if (walk_) return next && next(walk_, entry, &size_);
    const auto first = wininet_->Find<decltype(::FindFirstUrlCacheEntryW)>("FindFirstUrlCacheEntryW");
    if (!first) ::SetLastError(ERROR_CALL_NOT_IMPLEMENTED);
    walk_ = first ? first(nullptr, entry, &size_) : nullptr;
    return walk_ != nullptr;
  }

  WindowsUrlCache& cache_;
  std::shared_ptr<LazyLibrary> wininet_;
  HANDLE walk_ = nullptr;
  std::vector<Unit> buffer_ = std::vector<Unit>(kFirstRoom / sizeof(Unit));
  DWORD size_ = 0;
};

CachedUrl WindowsUrlCache::Told(const Text& name, std::uint32_t type) {
  std::string bytes = ToCodePage(name);
  if (FromCodePage(bytes) != name) namesBeyondThePage_[bytes] = name;
  return {std::move(bytes), type};
}

CachedUrls WindowsUrlCache::Begin() {
  namesBeyondThePage_.clear();
  return [walk = std::make_shared<Walk>(*this)] { return walk->Next(); };
}

bool WindowsUrlCache::DeleteUrlCacheEntryA(const std::string& given) {
  const std::string name(CutAtNul(std::string_view(given)));
  const auto erase = wininet_->Find<decltype(::DeleteUrlCacheEntryW)>("DeleteUrlCacheEntryW");
  if (!erase) return Succeed(false, kErrorCallNotImplemented);
  const auto known = namesBeyondThePage_.find(name);
  const Text url = known != namesBeyondThePage_.end() ? known->second : FromCodePage(name);
  const bool isGone = erase(winapi::Wide(url)) != FALSE;
  return Succeed(isGone, ::GetLastError());
}

} // namespace quendra::platform::windows
