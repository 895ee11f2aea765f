#include "platform/windows/system/WindowsPerformanceData.h"

#include "runtime/ByteFields.h"

#include <algorithm>

namespace quendra::platform::windows {

namespace {

/// Room for the block of a machine with many processors.
constexpr std::size_t kRegistryRoom = 1 << 20;

// What the kernel tells of each processor.
using QuerySystem = LONG NTAPI(ULONG informationClass, void* buffer, ULONG length, ULONG* returned);
constexpr ULONG kProcessorPerformance = 8;
struct KernelTimes {
  std::uint64_t idle;
  std::uint64_t kernel;
  std::uint64_t user;
  std::uint64_t dpc;
  std::uint64_t interrupt;
  std::uint32_t interrupts;
};
static_assert(sizeof(KernelTimes) == 48);

std::uint64_t FileTimeNow() {
  FILETIME now{};
  ::GetSystemTimeAsFileTime(&now);
  return std::uint64_t{now.dwHighDateTime} << 32 | now.dwLowDateTime;
}

bool AsksForProcessors(const Text& valueName) {
  return (u" " + valueName + u" ").find(u" " + DecimalText(kProcessorObject) + u" ") != Text::npos;
}

bool HoldsProcessors(std::span<const std::uint8_t> block) {
  if (block.size() < PerformanceBlock::kBytes) return false;
  std::size_t at = Little32(block, PerformanceBlock::kHeaderLength);
  for (auto left = Little32(block, PerformanceBlock::kNumObjectTypes); left > 0; --left) {
    if (at > block.size() || block.size() - at < PerformanceObject::kBytes) return false;
    if (Little32(block, at + PerformanceObject::kNameTitleIndex) == kProcessorObject) return true;
    at += std::max(Little32(block, at + PerformanceObject::kTotalByteLength), std::uint32_t{1});
  }
  return false;
}

std::vector<ProcessorTimes> WithTotal(std::span<const KernelTimes> processors) {
  std::vector<ProcessorTimes> told;
  std::uint64_t total = 0;
  for (const KernelTimes& processor : processors) {
    told.push_back({DecimalText(static_cast<std::int64_t>(told.size())), processor.idle});
    total += processor.idle;
  }
  told.push_back({u"_Total", total});
  return told;
}

} // namespace

WindowsPerformanceData::~WindowsPerformanceData() {
  // Asking for a value opens the key.
  if (const auto close = advapi32_.Find<decltype(::RegCloseKey)>("RegCloseKey")) close(HKEY_PERFORMANCE_DATA);
}

std::uint32_t WindowsPerformanceData::AskRegistry(const Text& valueName, std::size_t room,
                                                  std::vector<std::uint8_t>& block) {
  const auto query = advapi32_.Find<decltype(::RegQueryValueExW)>("RegQueryValueExW");
  if (!query) return kErrorFileNotFound;
  block.resize(room);
  auto size = static_cast<DWORD>(room);
  const LONG error =
      query(HKEY_PERFORMANCE_DATA, winapi::Wide(valueName), nullptr, nullptr, block.data(), &size);
  // What is told with an error means nothing here.
  block.resize(error == ERROR_SUCCESS ? std::min<std::size_t>(size, room) : 0);
  return static_cast<std::uint32_t>(error);
}

std::vector<ProcessorTimes> WindowsPerformanceData::Processors() {
  const auto query = ntdll_.Find<QuerySystem>("NtQuerySystemInformation");
  SYSTEM_INFO info{};
  ::GetNativeSystemInfo(&info);
  std::vector<KernelTimes> times(info.dwNumberOfProcessors);
  const auto length = static_cast<ULONG>(times.size() * sizeof(KernelTimes));
  if (!query || query(kProcessorPerformance, times.data(), length, nullptr) != 0) return {};
  std::vector<ProcessorTimes> now = WithTotal(times);
  if (last_.size() == now.size())
    for (std::size_t i = 0; i < now.size(); ++i) now[i].idle = std::max(now[i].idle, last_[i].idle);
  return last_ = std::move(now);
}

std::uint32_t WindowsPerformanceData::AskKernel(std::vector<std::uint8_t>& block) {
  const auto processors = Processors();
  if (processors.empty()) return kErrorFileNotFound;
  block = ProcessorBlock(processors, FileTimeNow());
  return 0;
}

std::uint32_t WindowsPerformanceData::Query(const std::string& valueName, std::span<std::uint8_t> buffer) {
  const Text name = FromCodePage(CutAtNul(std::string_view(valueName)));
  const bool ofProcessors = AsksForProcessors(name);
  std::vector<std::uint8_t> block;
  std::uint32_t error = 0;
  if (!ofProcessors || registryHasProcessors_.value_or(true)) {
    error = AskRegistry(name, kRegistryRoom, block);
    if (ofProcessors && !registryHasProcessors_) registryHasProcessors_ = HoldsProcessors(block);
  }
  if (ofProcessors && !*registryHasProcessors_) error = AskKernel(block);
  if (error != 0) return error;
  if (buffer.size() < block.size()) return kErrorMoreData;
  std::ranges::copy(block, buffer.begin());
  return 0;
}

} // namespace quendra::platform::windows
