#include "platform/windows/system/WindowsSystem.h"

#include "winapi/Winapi.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <limits>
#include <utility>

namespace quendra::platform::windows {

namespace {

constexpr std::size_t kLongestMessage = 2048;
constexpr std::uint64_t kDay = 24ULL * 3600 * 10'000'000;
/// From the start of 1601 to the day before 31 December 1899.
constexpr std::int32_t kDaysBefore = 109205;
/// What a figure with a sign can tell. Machines of today have more of some than the record was made for.
constexpr std::uint32_t kMostMemory = std::numeric_limits<std::int32_t>::max();

std::uint64_t NumberOf(const FILETIME& time) {
  return std::uint64_t{time.dwHighDateTime} << 32 | time.dwLowDateTime;
}

SYSTEMTIME LocalTime() {
  SYSTEMTIME now{};
  ::GetLocalTime(&now);
  return now;
}

} // namespace

OsVersion AsKnown(const OsVersion& told) {
  constexpr OsVersion kXp{VER_PLATFORM_WIN32_NT, 5, 1};
  const bool isLater = told.platformId == kXp.platformId && std::pair(told.majorVersion, told.minorVersion) >
                                                                std::pair(kXp.majorVersion, kXp.minorVersion);
  return isLater ? OsVersion{kXp.platformId, kXp.majorVersion, kXp.minorVersion, told.buildNumber} : told;
}

std::uint32_t WindowsSystem::GetTickCount() { return ::GetTickCount(); }

bool WindowsSystem::GetVersionExA(OsVersion& version) {
  OSVERSIONINFOA told{};
  static_assert(sizeof told == 148);
  told.dwOSVersionInfoSize = sizeof told;
  if (!::GetVersionExA(&told)) return false;
  version = AsKnown({told.dwPlatformId, told.dwMajorVersion, told.dwMinorVersion, told.dwBuildNumber});
  return true;
}

std::uint32_t WindowsSystem::FormatMessageA(std::uint32_t flags, std::uint32_t number, std::uint32_t language,
                                            std::span<char> buffer) {
  // Every other flag takes an argument of another kind.
  if (flags != kFromSystem) return 0;
  std::array<wchar_t, kLongestMessage> told{};
  const DWORD length =
      ::FormatMessageW(flags, nullptr, number, language, told.data(), DWORD{kLongestMessage}, nullptr);
  const std::string text = ToCodePage(winapi::TextOf(told.data(), length));
  if (text.empty() || buffer.size() <= text.size()) return 0;
  *std::ranges::copy(text, buffer.begin()).out = '\0';
  return length;
}

void WindowsSystem::Sleep(std::uint32_t milliseconds) { ::Sleep(milliseconds); }

void WindowsSystem::GetSystemInfo(SystemInfo& info) {
  SYSTEM_INFO told{};
  // The other call counts no more than 32 for a program of 32 bits on a system of 64.
  ::GetNativeSystemInfo(&told);
  info.numberOfProcessors = told.dwNumberOfProcessors;
}

void WindowsSystem::GlobalMemoryStatus(MemoryStatus& status) {
  MEMORYSTATUS told{};
  static_assert(sizeof told == MemoryStatus::kBytes);
  told.dwLength = sizeof told;
  ::GlobalMemoryStatus(&told);
  std::memcpy(status.bytes.data(), &told, sizeof told);
  using Memory = MemoryStatus;
  for (const auto field : {Memory::kTotalPhys, Memory::kAvailPhys, Memory::kTotalPageFile,
                           Memory::kAvailPageFile, Memory::kTotalVirtual, Memory::kAvailVirtual})
    status.Set(field, std::min(status.Get(field), kMostMemory));
}

bool WindowsSystem::SystemTimeToFileTime(std::span<const std::uint8_t, 16> systemTime,
                                         std::uint64_t& fileTime) {
  SYSTEMTIME moment{};
  std::memcpy(&moment, systemTime.data(), sizeof moment);
  FILETIME number{};
  if (!::SystemTimeToFileTime(&moment, &number)) return false;
  fileTime = NumberOf(number);
  return true;
}

std::int32_t WindowsSystem::DayNumber() {
  const SYSTEMTIME now = LocalTime();
  FILETIME number{};
  if (!::SystemTimeToFileTime(&now, &number)) return 0;
  return static_cast<std::int32_t>(NumberOf(number) / kDay) - kDaysBefore;
}

std::int32_t WindowsSystem::SecondOfDay() {
  const SYSTEMTIME now = LocalTime();
  return (now.wHour * 60 + now.wMinute) * 60 + now.wSecond;
}

} // namespace quendra::platform::windows
