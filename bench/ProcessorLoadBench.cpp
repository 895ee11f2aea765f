// Samples the load of every processor as the check of the surf page does, for so many seconds, and prints a
// line a processor: the figure of the first sample, the mean of the later ones, and the mean of the first
// fifteen, which is what the check would show.

#include "diagnostics/LoadReadings.h"
#include "diagnostics/load/CPULoad.h"
#include "platform/linux/system/LinuxPerformanceData.h"
#include "platform/linux/system/LinuxSystem.h"
#include "platform/unavailable/UnavailableRegistry.h"

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <numeric>
#include <span>

namespace {

using namespace quendra;
using Clock = std::chrono::steady_clock;
using Samples = std::vector<std::int32_t>;

constexpr std::uint32_t kPause = 200;

std::vector<Samples> SamplesOf(std::chrono::seconds duration) {
  platform::linux_::ProcFolder folder;
  platform::linux_::LinuxSystem system;
  platform::linux_::LinuxPerformanceData performance(folder);
  platform::unavailable::UnavailableRegistry registry;
  diagnostics::CPULoad load(system, performance, registry);
  std::vector<Samples> samples(static_cast<std::size_t>(load.GetCPUCount()));
  for (const auto end = Clock::now() + duration; Clock::now() < end; system.Sleep(kPause)) {
    load.CollectCPUData();
    for (std::size_t i = 0; i < samples.size(); ++i)
      samples[i].push_back(load.GetCPUUsage(static_cast<std::int32_t>(i) + 1));
  }
  return samples;
}

double Mean(std::span<const std::int32_t> samples) {
  return std::accumulate(samples.begin(), samples.end(), 0.0) / static_cast<double>(samples.size());
}

} // namespace

int main(int argc, char** argv) {
  const int seconds = argc == 2 ? std::atoi(argv[1]) : 0;
  for (const std::span<const std::int32_t> samples : SamplesOf(std::chrono::seconds(seconds))) {
    if (samples.size() < diagnostics::kReadings) return 2; // the check itself takes three seconds
    std::printf("%d %.2f %.2f\n", samples.front(), Mean(samples.subspan(1)),
                Mean(samples.first(diagnostics::kReadings)));
  }
}
