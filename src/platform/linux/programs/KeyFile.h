#pragma once

#include <map>
#include <string>
#include <string_view>

namespace quendra::platform::linux_ {

/// A file of groups with keys, as desktop entries and icon themes are written. Values are as they stand,
/// without their outer blanks; the first of two equal keys holds. Lines that are neither group, key nor
/// comment are passed over.
using KeyFile = std::map<std::string, std::map<std::string, std::string, std::less<>>, std::less<>>;

KeyFile ParseKeyFile(std::string_view text);

/// The value, or an empty text.
std::string ValueIn(const KeyFile& file, std::string_view group, std::string_view key);

/// A value with its escapes (\s, \n, \t, \r, \\) resolved.
std::string Unescaped(std::string_view value);

} // namespace quendra::platform::linux_
