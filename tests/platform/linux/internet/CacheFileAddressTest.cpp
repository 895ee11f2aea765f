#include "platform/linux/internet/CacheFileAddress.h"

#include "platform/linux/internet/CacheFilesFixture.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace quendra::platform::linux_ {
namespace {

CacheFileReader ReaderOf(const std::string& file) {
  return [&file](std::uint64_t at, std::span<std::uint8_t> bytes) {
    if (at >= file.size()) return std::size_t{0};
    const std::size_t count = std::min(bytes.size(), file.size() - static_cast<std::size_t>(at));
    std::copy_n(file.begin() + static_cast<std::ptrdiff_t>(at), count, bytes.begin());
    return count;
  };
}
std::string Firefox(const std::string& file) {
  return FirefoxCacheAddress(ReaderOf(file), file.size()).value_or("none");
}
std::string Chromium(const std::string& file) {
  return ChromiumCacheAddress(ReaderOf(file)).value_or("none");
}

TEST(CacheFileAddress, A_Firefox_file_tells_its_address_behind_its_content) {
  for (const std::size_t size : {0, 1, 262144, 262145, 1000000})
    EXPECT_EQ(Firefox(FirefoxFile(":http://a/x", std::string(size, 'c'))), "http://a/x") << size;
}

TEST(CacheFileAddress, Every_version_of_a_Firefox_file_is_read_and_no_later_one) {
  for (const std::uint32_t version : {1U, 2U, 3U})
    EXPECT_EQ(Firefox(FirefoxFile(":http://a/", "c", version)), "http://a/") << version;
  EXPECT_EQ(Firefox(FirefoxFile(":http://a/", "c", 4)), "none");
  EXPECT_EQ(Firefox(FirefoxFile(":http://a/", "c", 0)), "none");
}

TEST(CacheFileAddress, A_Firefox_keys_tags_are_passed_over) {
  EXPECT_EQ(AddressOfFirefoxKey(":https://a/"), "https://a/");
  EXPECT_EQ(AddressOfFirefoxKey("a,:https://a/?b,:c"), "https://a/?b,:c");
  EXPECT_EQ(AddressOfFirefoxKey("O^partitionKey=%28https%2Ca.com%29,a,:https://a/"), "https://a/");
  EXPECT_EQ(AddressOfFirefoxKey("~one,,:two,:https://a/"), "https://a/");
  for (const char* key : {"", ":", "a", "a,", "a,b,", "no address", "~one,,"})
    EXPECT_EQ(AddressOfFirefoxKey(key), std::nullopt) << key;
}

TEST(CacheFileAddress, A_Chromium_file_tells_its_address_at_its_start) {
  EXPECT_EQ(Chromium(ChromiumFile("http://a/x")), "http://a/x");
  EXPECT_EQ(Chromium(ChromiumFile("1/0/_dk_https://a.com https://a.com https://b.com/x")), "https://b.com/x");
}

TEST(CacheFileAddress, A_Chromium_keys_partition_is_passed_over) {
  EXPECT_EQ(AddressOfChromiumKey("https://a/1/0/"), "https://a/1/0/");
  EXPECT_EQ(AddressOfChromiumKey("0/12/https://a/"), "https://a/");
  EXPECT_EQ(AddressOfChromiumKey("_dk_s_https://a.com https://a.com https://b.com/"), "https://b.com/");
  EXPECT_EQ(AddressOfChromiumKey("_dk_only"), "_dk_only");
  EXPECT_EQ(AddressOfChromiumKey("/"), "/");
}

TEST(CacheFileAddress, Addresses_of_4_KB_and_up_to_the_limit_are_told_whole) {
  for (const std::size_t size : {990UL, 1000UL, 1001UL, 4096UL, 65000UL}) {
    const std::string address = "http://a/" + std::string(size, 'x');
    EXPECT_EQ(Firefox(FirefoxFile(":" + address)), address) << size;
    EXPECT_EQ(Chromium(ChromiumFile(address)), address) << size;
  }
  EXPECT_EQ(Firefox(FirefoxFile(":" + std::string(65536, 'x'))), "none");
  EXPECT_EQ(Chromium(ChromiumFile(std::string(65537, 'x'))), "none");
}

TEST(CacheFileAddress, A_file_cut_at_any_length_tells_nothing_false) {
  const std::string address = "http://a.example.com/x";
  const std::string firefox = FirefoxFile(":" + address);
  const std::string chromium = ChromiumFile(address, "");
  for (std::size_t size = 0; size < firefox.size(); ++size)
    EXPECT_EQ(Firefox(firefox.substr(0, size)), "none") << size;
  for (std::size_t size = 0; size < chromium.size(); ++size)
    EXPECT_EQ(Chromium(chromium.substr(0, size)), "none") << size;
}

TEST(CacheFileAddress, Fields_that_lead_out_of_the_file_tell_nothing) {
  std::string file = FirefoxFile(":http://a/");
  for (const std::uint32_t place : {0xFFFFFFFFU, 0x80000000U, static_cast<std::uint32_t>(file.size())})
    EXPECT_EQ(Firefox(file.substr(0, file.size() - 4) + HighFirst(place)), "none") << place;
  std::string chromium = ChromiumFile("http://a/");
  for (const std::uint32_t length : {0U, 0xFFFFFFFFU, 60000U}) {
    chromium.replace(12, 4, LowFirst(length));
    EXPECT_EQ(Chromium(chromium), "none") << length;
  }
  EXPECT_EQ(Chromium("another mark" + std::string(100, 'x')), "none");
}

} // namespace
} // namespace quendra::platform::linux_
