#include "platform/linux/internet/CacheFileAddress.h"

#include "runtime/ByteFields.h"

#include <algorithm>
#include <array>

namespace quendra::platform::linux_ {

namespace {

// Firefox; numbers have their high byte first.
constexpr std::uint64_t kChunkBytes = 262144;
constexpr std::size_t kHashBytes = 4;
constexpr std::size_t kChunkHashBytes = 2;
constexpr std::size_t kKeyLengthAt = 24; ///< in the header, behind version, counts and times
constexpr std::size_t kFirstHeaderBytes = 28;
constexpr std::size_t kHeaderBytes = 32; ///< from version 2 on, with flags
constexpr std::uint32_t kLatestVersion = 3;

// Chromium; low byte first.
constexpr std::uint64_t kSimpleMark = 0xFCFB6D1BA7725C30;
constexpr std::size_t kSimpleHeaderBytes = 24;
/// Header and key of most files in one read.
constexpr std::size_t kFirstRead = 1024;

/// `length` bytes from a place on, those that were read before taken from there; nothing when the file ends
/// earlier.
std::optional<std::string> TextAt(const CacheFileReader& read, std::uint64_t at, std::size_t length,
                                  std::span<const std::uint8_t> known) {
  if (known.size() >= length)
    return std::string(known.begin(), known.begin() + static_cast<std::ptrdiff_t>(length));
  std::string text(length, '\0');
  const std::span bytes(reinterpret_cast<std::uint8_t*>(text.data()), length);
  if (read(at, bytes) != length) return {};
  return text;
}

} // namespace

std::optional<std::string> AddressOfFirefoxKey(const std::string& key) {
  std::size_t at = 0;
  while (at < key.size() && key[at] != ':') {
    // A tag's letter, then its text up to a comma that stands alone.
    for (++at; at < key.size(); ++at) {
      if (key[at] != ',') continue;
      if (at + 1 == key.size() || key[at + 1] != ',') break;
      ++at;
    }
    ++at;
  }
  if (at + 1 >= key.size()) return {};
  return key.substr(at + 1);
}

std::optional<std::string> FirefoxCacheAddress(const CacheFileReader& read, std::uint64_t fileSize) {
  std::array<std::uint8_t, 4> last{};
  if (fileSize < last.size() || read(fileSize - last.size(), last) != last.size()) return {};
  const std::uint64_t contentBytes = Big32(last, 0);
  const std::uint64_t chunks = (contentBytes + kChunkBytes - 1) / kChunkBytes;
  const std::uint64_t headerAt = contentBytes + kHashBytes + chunks * kChunkHashBytes;
  if (headerAt + kFirstHeaderBytes > fileSize) return {};

  std::array<std::uint8_t, kFirstRead> start{};
  const std::size_t count = read(headerAt, start);
  if (count < kFirstHeaderBytes) return {};
  const std::uint32_t version = Big32(start, 0);
  const std::size_t keyLength = Big32(start, kKeyLengthAt);
  if (version == 0 || version > kLatestVersion || keyLength == 0 || keyLength > kLongestCacheKey) return {};
  const std::size_t headerBytes = version == 1 ? kFirstHeaderBytes : kHeaderBytes;
  // The last four bytes are no part of a key.
  if (headerAt + headerBytes + keyLength + last.size() > fileSize) return {};
  const auto known =
      std::span<const std::uint8_t>(start).subspan(headerBytes, std::max(count, headerBytes) - headerBytes);
  const auto key = TextAt(read, headerAt + headerBytes, keyLength, known);
  return key ? AddressOfFirefoxKey(*key) : std::nullopt;
}

std::string AddressOfChromiumKey(const std::string& key) {
  std::size_t at = 0;
  // "1/0/" and the like.
  for (std::size_t end = key.find('/'); end != std::string::npos && end > at; end = key.find('/', at)) {
    if (key.find_first_not_of("0123456789", at) != end) break;
    at = end + 1;
  }
  std::string address = key.substr(at);
  // No address has a blank in it.
  if (address.starts_with("_dk_"))
    if (const std::size_t blank = address.rfind(' '); blank != std::string::npos) address.erase(0, blank + 1);
  return address;
}

std::optional<std::string> ChromiumCacheAddress(const CacheFileReader& read) {
  std::array<std::uint8_t, kFirstRead> start{};
  const std::size_t count = read(0, start);
  if (count < kSimpleHeaderBytes || Little64(start, 0) != kSimpleMark) return {};
  const std::size_t keyLength = Little32(start, 12);
  if (keyLength == 0 || keyLength > kLongestCacheKey) return {};
  const auto known =
      std::span<const std::uint8_t>(start).subspan(kSimpleHeaderBytes, count - kSimpleHeaderBytes);
  const auto key = TextAt(read, kSimpleHeaderBytes, keyLength, known);
  if (!key) return {};
  std::string address = AddressOfChromiumKey(*key);
  if (address.empty()) return {};
  return address;
}

} // namespace quendra::platform::linux_
