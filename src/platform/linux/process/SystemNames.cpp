#include "platform/linux/process/SystemNames.h"

#include "platform/process/Processes.h"

namespace quendra::platform::linux_ {

namespace {

constexpr std::size_t kReadableLength = 255;
constexpr std::string_view kNumberMark = "//";

bool IsControl(char16_t unit) {
  return unit < 0x20 || (unit >= 0x7F && unit < 0xA0) || unit == 0x2028 || unit == 0x2029;
}

bool IsDirectionMark(char16_t unit) {
  return unit == 0x061C || unit == 0x200E || unit == 0x200F || (unit >= 0x202A && unit <= 0x202E) ||
         (unit >= 0x2066 && unit <= 0x2069);
}

} // namespace

std::string SystemName(std::string_view raw) {
  Text text = FromUtf8(raw);
  for (char16_t& unit : text)
    if (IsControl(unit) || IsDirectionMark(unit)) unit = u'?';
  return ToCodePage(text);
}

Text ReadableText(std::string_view utf8) {
  // Cut first: each unit comes of one byte at least, and the file may hold a name of any length.
  const Text text = FromUtf8(utf8.substr(0, 8 * kReadableLength));
  Text readable;
  for (const char16_t unit : text)
    if (!IsDirectionMark(unit)) readable.push_back(IsControl(unit) ? u' ' : unit);
  return Text(Trimmed(TextView(readable).substr(0, kReadableLength)));
}

std::string SystemPaths::ToSystem(const std::string& rawPath, std::size_t limit) {
  std::string path = SystemName(rawPath);
  const bool leadsBack = ToUtf8(FromCodePage(path)) == rawPath && !path.starts_with(kNumberMark);
  if (leadsBack && (path.size() <= limit || limit < kPathRoom)) return path.substr(0, limit);
  if (path.starts_with('/')) path.erase(0, 1);
  return (Number(rawPath) + path).substr(0, limit);
}

std::string SystemPaths::ToRaw(const std::string& systemPath) const {
  if (!systemPath.starts_with(kNumberMark)) return ToUtf8(FromCodePage(systemPath));
  const std::size_t end = systemPath.find('/', kNumberMark.size());
  if (end == std::string::npos) return {};
  const auto found = rawOf_.find(systemPath.substr(0, end + 1));
  return found == rawOf_.end() ? std::string() : found->second;
}

std::string SystemPaths::Number(const std::string& rawPath) {
  if (const auto found = numberOf_.find(rawPath); found != numberOf_.end()) return found->second;
  if (numberOf_.size() >= kMostRemembered) {
    numberOf_.clear();
    rawOf_.clear();
  }
  std::string number = std::string(kNumberMark) + std::to_string(++lastNumber_) + "/";
  numberOf_[rawPath] = number;
  rawOf_[number] = rawPath;
  return number;
}

} // namespace quendra::platform::linux_
