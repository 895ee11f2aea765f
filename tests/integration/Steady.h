#pragma once

#include "Sanitized.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <functional>
#include <string>
#include <unistd.h>

namespace quendra::integration {

/// What this process holds of the machine.
struct Footprint {
  long kilobytes = 0; ///< resident
  std::ptrdiff_t descriptors = 0;

  static Footprint Now() {
    std::ifstream file("/proc/self/statm");
    long size = 0;
    long resident = 0;
    file >> size >> resident;
    return {resident * (sysconf(_SC_PAGESIZE) / 1024),
            std::distance(std::filesystem::directory_iterator("/proc/self/fd"), {})};
  }
};

// Under sanitizers memory grows here; leaks they find by themselves.
inline constexpr long kMarginKilobytes = kSanitized ? 1 << 20 : 1024;
/// Until everything that is made once has been made.
inline constexpr int kWarmUp = 100;

/// How often to do it: scripts/soak asks by a variable for more than an ordinary run.
inline int TimesAskedFor(const char* variable, int ordinary) {
  const char* asked = std::getenv(variable);
  return std::max(kWarmUp, asked ? std::atoi(asked) : ordinary);
}

/// Does something so many times, given the number of each, and compares what the process holds at the end
/// with what it held after the first hundred. Stops at a fatal failure.
inline void ExpectSteady(const std::string& what, int times, const std::function<void(int)>& once) {
  Footprint early;
  for (int number = 1; number <= times; ++number) {
    once(number);
    if (testing::Test::HasFatalFailure()) {
      ADD_FAILURE() << what << ", number " << number;
      return;
    }
    if (number == kWarmUp) early = Footprint::Now();
  }
  const Footprint late = Footprint::Now();
  // Fewer is no fault: threads of a toolkit's pool, each with a descriptor, end when there is nothing to do.
  EXPECT_LE(late.descriptors, early.descriptors);
  EXPECT_LE(late.kilobytes, early.kilobytes + kMarginKilobytes);
  std::printf("%d %s: %ld KB after the first %d, %ld KB at the end; %td and %td descriptors\n", times,
              what.c_str(), early.kilobytes, kWarmUp, late.kilobytes, early.descriptors, late.descriptors);
}

} // namespace quendra::integration
