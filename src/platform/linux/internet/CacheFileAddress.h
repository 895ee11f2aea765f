#pragma once

#include <cstdint>
#include <functional>
#include <optional>
#include <span>
#include <string>

namespace quendra::platform::linux_ {

/// Reads a file from a place on and gives how many bytes there were, fewer than asked for at its end.
using CacheFileReader = std::function<std::size_t(std::uint64_t at, std::span<std::uint8_t> bytes)>;

/// Longer keys are taken for damage.
inline constexpr std::size_t kLongestCacheKey = 65536;

/// The address in the trailer of a file of Firefox's cache2/entries: the last four bytes tell where the
/// entry's content ends; a hash of the trailer, hashes of the content's chunks, a header and the key follow.
/// Nothing for a file of another form.
std::optional<std::string> FirefoxCacheAddress(const CacheFileReader& read, std::uint64_t fileSize);
/// The address in such a key: tags, each up to a comma (a doubled one stands for itself), then a colon and
/// the address.
std::optional<std::string> AddressOfFirefoxKey(const std::string& key);

/// The address in the header of a file of Chromium's simple cache: a mark, a version, the key's length, a
/// hash, then the key.
std::optional<std::string> ChromiumCacheAddress(const CacheFileReader& read);
/// The address in such a key: behind the numbers of its partition and, with "_dk_", the sites that share it.
std::string AddressOfChromiumKey(const std::string& key);

} // namespace quendra::platform::linux_
