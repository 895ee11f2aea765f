#include "platform/system/SystemTime.h"

#include "runtime/ByteFields.h"

#include <chrono>
#include <cstddef>

namespace quendra::platform {

namespace {

using std::chrono::sys_days;

constexpr std::uint64_t kMillisecond = 10'000;
constexpr std::uint64_t kDayInMilliseconds = 24ULL * 3600 * 1000;
constexpr sys_days kFirstDay{std::chrono::year{1601} / 1 / 1};

} // namespace

bool FileTimeOf(std::span<const std::uint8_t, 16> image, std::uint64_t& fileTime) {
  const auto field = [&](std::size_t number) { return std::uint32_t{Little16(image, 2 * number)}; };
  const std::chrono::year_month_day date{std::chrono::year{static_cast<int>(field(0))},
                                         std::chrono::month{field(1)}, std::chrono::day{field(3)}};
  const bool isMoment = date.ok() && field(0) >= 1601 && field(0) <= 30827 && field(4) < 24 &&
                        field(5) < 60 && field(6) < 60 && field(7) < 1000;
  if (!isMoment) return false;
  const auto days = static_cast<std::uint64_t>((sys_days{date} - kFirstDay).count());
  const std::uint64_t seconds = (field(4) * 60 + field(5)) * 60 + field(6);
  fileTime = (days * kDayInMilliseconds + seconds * 1000 + field(7)) * kMillisecond;
  return true;
}

SystemTimeImage SystemTimeOf(std::uint64_t fileTime) {
  const std::uint64_t milliseconds = fileTime / kMillisecond;
  const sys_days day = kFirstDay + std::chrono::days(milliseconds / kDayInMilliseconds);
  const std::chrono::year_month_day date{day};
  const std::uint64_t rest = milliseconds % kDayInMilliseconds;
  const std::array<std::uint64_t, 8> fields{static_cast<std::uint64_t>(int{date.year()}),
                                            unsigned{date.month()},
                                            std::chrono::weekday{day}.c_encoding(),
                                            unsigned{date.day()},
                                            rest / 3'600'000,
                                            rest / 60'000 % 60,
                                            rest / 1000 % 60,
                                            rest % 1000};
  SystemTimeImage image{};
  for (std::size_t i = 0; i < fields.size(); ++i)
    PutLittle16(image, 2 * i, static_cast<std::uint16_t>(fields[i]));
  return image;
}

} // namespace quendra::platform
