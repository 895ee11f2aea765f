#pragma once

#include "platform/system/PerformanceBlock.h"
#include "platform/system/PerformanceData.h"
#include "platform/windows/system/LazyLibrary.h"

namespace quendra::platform::windows {

/// The performance data as the registry shows it. On a machine whose registry lacks the processor's object,
/// as where its counters are switched off, the block is made of what the kernel tells. The first question
/// decides: figures are compared with earlier ones, so they come from one source.
class WindowsPerformanceData : public PerformanceData {
 public:
  ~WindowsPerformanceData() override;

  std::uint32_t Query(const std::string& valueName, std::span<std::uint8_t> buffer) override;

 private:
  /// As large as `room` at the most; the error number otherwise.
  std::uint32_t AskRegistry(const Text& valueName, std::size_t room, std::vector<std::uint8_t>& block);
  std::uint32_t AskKernel(std::vector<std::uint8_t>& block);
  /// Empty where the kernel tells none. A figure never falls.
  std::vector<ProcessorTimes> Processors();

  LazyLibrary advapi32_{L"advapi32.dll"};
  LazyLibrary ntdll_{L"ntdll.dll"};
  std::optional<bool> registryHasProcessors_;
  std::vector<ProcessorTimes> last_;
};

} // namespace quendra::platform::windows
