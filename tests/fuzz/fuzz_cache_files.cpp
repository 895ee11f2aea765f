// Any bytes as a file of a browser's cache, in both forms: an address comes from within the file, and no byte
// outside of it is asked for and taken.

#include "platform/linux/internet/CacheFileAddress.h"

#include <algorithm>
#include <cstdlib>
#include <string_view>

namespace {

using namespace quendra::platform::linux_;

void Require(bool holds) {
  if (!holds) std::abort();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string_view file(reinterpret_cast<const char*>(data), size);
  int reads = 0;
  const CacheFileReader read = [&](std::uint64_t at, std::span<std::uint8_t> bytes) -> std::size_t {
    Require(++reads <= 3 && bytes.size() <= kLongestCacheKey);
    if (at >= size) return 0;
    const std::size_t count = std::min<std::size_t>(bytes.size(), size - at);
    std::copy_n(data + at, count, bytes.begin());
    return count;
  };
  const auto require = [&](const std::optional<std::string>& address) {
    reads = 0;
    if (!address) return;
    Require(!address->empty() && address->size() <= kLongestCacheKey);
    Require(file.find(*address) != std::string_view::npos);
  };
  require(FirefoxCacheAddress(read, size));
  require(ChromiumCacheAddress(read));
  require(AddressOfFirefoxKey(std::string(file.substr(0, kLongestCacheKey))));
  return 0;
}
