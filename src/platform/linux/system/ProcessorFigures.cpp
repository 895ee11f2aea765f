#include "platform/linux/system/ProcessorFigures.h"

#include "platform/linux/system/Files.h"

#include <charconv>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint64_t kUnitsPerSecond = 10'000'000;
constexpr std::size_t kIdleWord = 4;
constexpr std::size_t kDiskWaitWord = 5;

bool Read(const std::string& word, std::uint64_t& number) {
  const auto [end, error] = std::from_chars(word.data(), word.data() + word.size(), number);
  return error == std::errc() && end == word.data() + word.size();
}

} // namespace

std::vector<ProcessorTimes> ProcessorsOf(std::string_view stat, std::uint64_t ticksPerSecond) {
  std::vector<ProcessorTimes> processors;
  std::uint64_t total = 0;
  for (const std::string& line : Split(stat, '\n')) {
    if (!line.starts_with("cpu")) continue;
    const auto words = Split(line, ' ');
    std::uint64_t idle = 0, waiting = 0;
    const bool isProcessor = words.size() > kDiskWaitWord && WholeNumber(words[0].substr(3)) &&
                             Read(words[kIdleWord], idle) && Read(words[kDiskWaitWord], waiting);
    if (!isProcessor) continue;
    const std::uint64_t time = (idle + waiting) * (kUnitsPerSecond / ticksPerSecond);
    processors.push_back({DecimalText(static_cast<std::int64_t>(processors.size())), time});
    total += time;
  }
  processors.push_back({u"_Total", total});
  return processors;
}

} // namespace quendra::platform::linux_
