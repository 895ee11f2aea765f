#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace quendra::platform::linux_ {

/// The content of a regular file; nothing for anything else, for a file that can't be read and for one of
/// more than `limit` bytes. Never waits on a pipe or a device.
std::optional<std::string> ReadFile(const std::string& path, std::size_t limit);

/// Makes every folder of the path that is missing, for the user alone. 0, or the system's error number.
int MakeFolders(const std::string& path);

/// The decimal number that `text` is as a whole; nothing for any other text.
std::optional<std::uint32_t> WholeNumber(std::string_view text);

/// The parts between the separators, empty ones left out.
std::vector<std::string> Split(std::string_view text, char separator);

} // namespace quendra::platform::linux_
