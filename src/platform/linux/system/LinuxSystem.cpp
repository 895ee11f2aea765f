#include "platform/linux/system/LinuxSystem.h"

#include "platform/linux/system/Files.h"
#include "platform/linux/system/MemoryFigures.h"
#include "platform/linux/system/ProcessorFigures.h"
#include "platform/linux/system/SystemMessages.h"

#include <algorithm>
#include <chrono>
#include <ctime>
#include <optional>
#include <thread>

namespace quendra::platform::linux_ {

namespace {

constexpr std::int32_t kDayNumberOf1970 = 25569;
/// Far above any day number and far below the sign bit.
constexpr std::uint64_t kTickAtStart = 10'000'000;

std::optional<std::tm> LocalTime() {
  const std::time_t now = std::time(nullptr);
  std::tm local{};
  if (::localtime_r(&now, &local) == nullptr) return {};
  return local;
}

/// How long figures of memory hold. The kernel itself brings most of them up to date once a second.
constexpr std::uint64_t kMemoryMilliseconds = 250;

} // namespace

LinuxSystem::LinuxSystem(Clock clock, const std::string& procRoot)
    : clock_(std::move(clock)), start_(clock_()), folder_(procRoot),
      processors_(static_cast<std::uint32_t>(ProcessorsOf(folder_.File("stat").value_or(""), 1).size() - 1)) {
}

std::uint32_t LinuxSystem::GetTickCount() {
  return static_cast<std::uint32_t>(kTickAtStart + clock_() - start_);
}

bool LinuxSystem::GetVersionExA(OsVersion& version) {
  version = {2, 5, 1, 2600};
  return true;
}

std::uint32_t LinuxSystem::FormatMessageA(std::uint32_t flags, std::uint32_t number, std::uint32_t,
                                          std::span<char> buffer) {
  const std::string_view text = SystemMessage(number);
  if (flags != kFromSystem || text.empty() || buffer.size() <= text.size()) return 0;
  *std::ranges::copy(text, buffer.begin()).out = '\0';
  return static_cast<std::uint32_t>(text.size());
}

void LinuxSystem::Sleep(std::uint32_t milliseconds) {
  std::this_thread::sleep_for(std::chrono::milliseconds(milliseconds));
}

void LinuxSystem::GlobalMemoryStatus(MemoryStatus& status) {
  const std::uint64_t now = clock_();
  if (!memoryRead_ || now - *memoryRead_ >= kMemoryMilliseconds) {
    memory_ = ReadMemory();
    memoryRead_ = now;
  }
  status = memory_;
}

MemoryStatus LinuxSystem::ReadMemory() const {
  // Pages: all that are mapped, then those that are held.
  const auto pages = Split(folder_.File("self/statm").value_or(""), ' ');
  const std::uint64_t held = pages.size() > 1 ? WholeNumber(pages[1]).value_or(0) : 0;
  return MemoryStatusOf(folder_.File("meminfo").value_or(""),
                        held * static_cast<std::uint64_t>(::sysconf(_SC_PAGESIZE)));
}

std::int32_t LinuxSystem::DayNumber() {
  const auto local = LocalTime();
  if (!local) return 0;
  const std::chrono::year_month_day date{std::chrono::year{local->tm_year + 1900},
                                         std::chrono::month{static_cast<unsigned>(local->tm_mon + 1)},
                                         std::chrono::day{static_cast<unsigned>(local->tm_mday)}};
  return static_cast<std::int32_t>(std::chrono::sys_days{date}.time_since_epoch().count()) + kDayNumberOf1970;
}

std::int32_t LinuxSystem::SecondOfDay() {
  const auto local = LocalTime();
  return local ? (local->tm_hour * 60 + local->tm_min) * 60 + local->tm_sec : 0;
}

} // namespace quendra::platform::linux_
