#include "platform/linux/system/Files.h"

#include "platform/linux/system/Descriptor.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <cerrno>
#include <charconv>

namespace quendra::platform::linux_ {

namespace {

bool IsReadable(const struct stat& file, std::size_t limit) {
  return S_ISREG(file.st_mode) && static_cast<std::uint64_t>(file.st_size) <= limit;
}

} // namespace

std::optional<std::string> ReadFile(const std::string& path, std::size_t limit) {
  struct stat file {};
  // Asked before opening as well: opening a device can have effects.
  if (::stat(path.c_str(), &file) != 0 || !IsReadable(file, limit)) return {};
  const Descriptor descriptor(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY));
  if (!descriptor || ::fstat(descriptor.Number(), &file) != 0 || !IsReadable(file, limit)) return {};

  // The size told before need not hold: a file may grow, and files of /proc tell 0. So it is read until it
  // ends or has one byte more than is allowed.
  std::string content;
  char buffer[16384];
  while (content.size() <= limit) {
    const ssize_t count = ::read(descriptor.Number(), buffer, sizeof buffer);
    if (count < 0 && errno == EINTR) continue;
    if (count < 0) return {};
    if (count == 0) return content;
    content.append(buffer, static_cast<std::size_t>(count));
  }
  return {};
}

int MakeFolders(const std::string& path) {
  // What may not be made may be there all the same, so only the last folder decides, and the first failure
  // says why.
  int firstError = 0;
  for (std::size_t end = path.find('/', 1);; end = path.find('/', end + 1)) {
    const bool isThere = ::mkdir(path.substr(0, end).c_str(), 0700) == 0 || errno == EEXIST;
    if (!isThere && firstError == 0) firstError = errno;
    if (end == std::string::npos) return isThere ? 0 : firstError;
  }
}

std::optional<std::uint32_t> WholeNumber(std::string_view text) {
  std::uint32_t value = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
  if (error != std::errc() || end != text.data() + text.size()) return {};
  return value;
}

std::vector<std::string> Split(std::string_view text, char separator) {
  std::vector<std::string> parts;
  while (!text.empty()) {
    const std::size_t end = std::min(text.find(separator), text.size());
    if (end > 0) parts.emplace_back(text.substr(0, end));
    text.remove_prefix(std::min(end + 1, text.size()));
  }
  return parts;
}

} // namespace quendra::platform::linux_
