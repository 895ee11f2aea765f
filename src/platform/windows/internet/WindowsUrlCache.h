#pragma once

#include "platform/internet/WalkedUrlCache.h"
#include "platform/windows/system/LazyLibrary.h"

#include <map>

namespace quendra::platform::windows {

/// The system's own cache, of wininet. Each entry is told in the form that every cache has here; its name is
/// in our code page.
class WindowsUrlCache : public WalkedUrlCache {
 public:
  bool DeleteUrlCacheEntryA(const std::string& name) override;

 protected:
  CachedUrls Begin() override;

 private:
  class Walk;

  /// What a walk tells, and by which name it is known to the system where the code page lacks a letter of it.
  CachedUrl Told(const Text& name, std::uint32_t type);

  /// Shared with the walks, which close themselves when the rest of this object has gone.
  std::shared_ptr<LazyLibrary> wininet_ = std::make_shared<LazyLibrary>(L"wininet.dll");
  std::map<std::string, Text> namesBeyondThePage_;
};

} // namespace quendra::platform::windows
