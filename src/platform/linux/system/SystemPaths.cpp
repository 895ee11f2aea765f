#include "platform/linux/system/SystemPaths.h"

#include "platform/linux/system/SystemNames.h"
#include "platform/process/Processes.h"

namespace quendra::platform::linux_ {

namespace {

constexpr std::string_view kNumberMark = "//";

} // namespace

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
