#include "platform/linux/system/LinuxPerformanceData.h"

#include "platform/linux/system/Files.h"
#include "platform/linux/system/ProcessorFigures.h"

#include <algorithm>
#include <ctime>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint64_t kUnitsPerSecond = 10'000'000;
constexpr std::uint64_t kSecondsFrom1601To1970 = 11'644'473'600;

} // namespace

std::uint64_t FileTimeNow() {
  timespec now{};
  ::clock_gettime(CLOCK_REALTIME, &now);
  return (static_cast<std::uint64_t>(now.tv_sec) + kSecondsFrom1601To1970) * kUnitsPerSecond +
         static_cast<std::uint64_t>(now.tv_nsec) / 100;
}

LinuxPerformanceData::LinuxPerformanceData(const ProcFolder& folder, FileTimeClock clock)
    : folder_(folder), clock_(std::move(clock)), last_(Read()) {}

std::vector<ProcessorTimes> LinuxPerformanceData::Read() const {
  return ProcessorsOf(folder_.File("stat").value_or(""), static_cast<std::uint64_t>(::sysconf(_SC_CLK_TCK)));
}

std::vector<ProcessorTimes> LinuxPerformanceData::Processors() {
  for (const ProcessorTimes& now : Read()) {
    const auto known = std::ranges::find(last_, now.name, &ProcessorTimes::name);
    if (known != last_.end()) known->idle = std::max(known->idle, now.idle);
  }
  return last_;
}

std::uint32_t LinuxPerformanceData::Query(const std::string& valueName, std::span<std::uint8_t> buffer) {
  const auto numbers = Split(valueName, ' ');
  if (std::ranges::find(numbers, std::to_string(kProcessorObject)) == numbers.end())
    return kErrorFileNotFound;
  const auto block = ProcessorBlock(Processors(), clock_());
  if (buffer.size() < block.size()) return kErrorMoreData;
  std::ranges::copy(block, buffer.begin());
  return 0;
}

} // namespace quendra::platform::linux_
