#pragma once

#include "runtime/OpaqueHandle.h"

#include <cstdint>
#include <string>
#include <vector>

namespace quendra::platform {

/// A walk over the cache. 0 is none.
using UrlCacheWalk = OpaqueHandle<struct UrlCacheWalkKind>;
inline constexpr UrlCacheWalk kNoUrlCacheWalk;

/// An entry of the cache as a byte image in the published 32-bit layout, whose size the entry itself decides.
struct UrlCacheEntry {
  static constexpr std::size_t kStructSizeAt = 0;    ///< 32 bits; the caller puts the block's size here
  static constexpr std::size_t kSourceUrlNameAt = 4; ///< 32 bits; not 0 where there is a name
  static constexpr std::size_t kEntryTypeAt = 12;    ///< 32 bits
  static constexpr std::size_t kRecordBytes = 80;    ///< the record, before the texts that it points to
  static constexpr std::uint32_t kNormalEntry = 1;   ///< bit of the entry type

  std::vector<std::uint8_t> block{};
  /// The text that the record's name points to, in the code page, up to its NUL.
  std::string sourceUrlName{};
};

/// The system's cache of what browsers have loaded.
class UrlCache {
 public:
  virtual ~UrlCache() = default;

  // What GetLastError gives after a failure.
  static constexpr std::uint32_t kErrorFileNotFound = 2;
  static constexpr std::uint32_t kErrorAccessDenied = 5;
  static constexpr std::uint32_t kErrorInvalidHandle = 6;
  static constexpr std::uint32_t kErrorCallNotImplemented = 120;
  static constexpr std::uint32_t kErrorInsufficientBuffer = 122;
  static constexpr std::uint32_t kErrorNoMoreItems = 259;

  /// A block of the size asked for. False for want of memory.
  virtual bool LocalAlloc(UrlCacheEntry& entry, std::uint32_t size) = 0;
  /// An entry without a block is left as it is.
  virtual void LocalFree(UrlCacheEntry& entry) = 0;

  /// Opens a walk and fills `entry` with its first entry. With no entry (nullptr) or too small a block it
  /// gives no walk and kErrorInsufficientBuffer, and puts the needed size in `size`; an empty cache has
  /// kErrorNoMoreItems. No cache here tells kinds of entries apart, so every pattern, and none (nullptr),
  /// means all of them.
  virtual UrlCacheWalk FindFirstUrlCacheEntryA(const char* pattern, UrlCacheEntry* entry,
                                               std::uint32_t& size) = 0;
  /// The next entry in the same way; the walk moves on with success alone.
  virtual bool FindNextUrlCacheEntryA(UrlCacheWalk walk, UrlCacheEntry* entry, std::uint32_t& size) = 0;
  virtual bool FindCloseUrlCache(UrlCacheWalk walk) = 0;
  /// Deletes one entry of that name. A name that no walk has told is not found.
  virtual bool DeleteUrlCacheEntryA(const std::string& name) = 0;

  virtual std::uint32_t GetLastError() = 0;
};

} // namespace quendra::platform
