#include "platform/linux/LinuxFixture.h"
#include "platform/linux/system/LinuxPerformanceData.h"
#include "platform/linux/system/LinuxSystem.h"
#include "platform/linux/system/MemoryFigures.h"
#include "platform/linux/system/ProcessorFigures.h"

#include <gtest/gtest.h>

namespace quendra::platform::linux_ {
namespace {

constexpr const char* kStat = "cpu  9 9 9 90 9 0 0 0 0 0\n"
                              "cpu0 10 0 20 300 7 1 1 0 0 0\n"
                              "cpu2 10 0 20 400 0 1 1 0 0 0\n"
                              "intr 5 cpu1\nctxt 7\n";

TEST(ProcessorFigures, Are_those_of_each_processor_without_gaps_and_of_all) {
  const auto processors = ProcessorsOf(kStat, 100);
  ASSERT_EQ(processors.size(), 3U);
  EXPECT_EQ(processors[0].name, u"0");
  EXPECT_EQ(processors[0].idle, 30'700'000U); // waiting for a disk is idle
  EXPECT_EQ(processors[1].name, u"1");
  EXPECT_EQ(processors[1].idle, 40'000'000U);
  EXPECT_EQ(processors[2].name, u"_Total");
  EXPECT_EQ(processors[2].idle, 70'700'000U);
}

TEST(ProcessorFigures, Leave_out_what_is_not_understood) {
  EXPECT_EQ(ProcessorsOf("cpu0 1 2 3\ncpu1 a b c d e f\ncpuX 1 2 3 4 5 6\n", 100).size(), 1U);
  EXPECT_EQ(ProcessorsOf("", 100).size(), 1U);
}

struct PerformanceDataTest : testing::Test {
  TemporaryFolder proc;
  std::string Write(const std::string& stat) { return proc.Write("stat", stat); }
  std::uint64_t IdleOf(std::size_t instance, LinuxPerformanceData& data) {
    std::vector<std::uint8_t> buffer(4096);
    EXPECT_EQ(data.Query("238", buffer), 0U);
    // Name and counters of an instance take 32 and 16 bytes while the name is short.
    const std::size_t first =
        PerformanceBlock::kBytes + PerformanceObject::kBytes + PerformanceCounter::kBytes;
    return Little64(buffer, first + instance * 48 + 32 + 8);
  }
};

TEST_F(PerformanceDataTest, An_idle_time_never_falls) {
  Write("cpu0 0 0 0 100 50 0\n");
  const ProcFolder folder(proc.Path());
  LinuxPerformanceData data(folder);
  const auto before = IdleOf(0, data);
  Write("cpu0 0 0 0 100 20 0\n");
  EXPECT_EQ(IdleOf(0, data), before);
}

TEST_F(PerformanceDataTest, A_processor_that_came_later_is_left_out) {
  Write("cpu0 0 0 0 100 0 0\n");
  const ProcFolder folder(proc.Path());
  LinuxPerformanceData data(folder);
  Write("cpu0 0 0 0 100 0 0\ncpu1 0 0 0 100 0 0\n");
  std::vector<std::uint8_t> buffer(4096);
  ASSERT_EQ(data.Query("238", buffer), 0U);
  EXPECT_EQ(Little32(buffer, PerformanceBlock::kBytes + PerformanceObject::kNumInstances), 2U);
}

TEST_F(PerformanceDataTest, Too_little_room_and_other_objects_are_refused) {
  const ProcFolder folder(proc.Path());
  LinuxPerformanceData data(folder);
  std::vector<std::uint8_t> buffer(100);
  EXPECT_EQ(data.Query("238", buffer), PerformanceData::kErrorMoreData);
  buffer.resize(4096);
  EXPECT_EQ(data.Query("230", buffer), PerformanceData::kErrorFileNotFound);
}

constexpr const char* kMeminfo = "MemTotal:        1000000 kB\n"
                                 "MemFree:           10000 kB\n"
                                 "MemAvailable:     250000 kB\n"
                                 "SwapTotal:        200000 kB\n"
                                 "SwapFree:         150000 kB\n";

TEST(MemoryFigures, Are_those_of_the_kernel_with_memory_and_swap_as_the_page_file) {
  const auto memory = MemoryStatusOf(kMeminfo, 1024);
  EXPECT_EQ(memory.Get(MemoryStatus::kLength), 32U);
  EXPECT_EQ(memory.Get(MemoryStatus::kMemoryLoad), 75U);
  EXPECT_EQ(memory.Get(MemoryStatus::kTotalPhys), 1'024'000'000U);
  EXPECT_EQ(memory.Get(MemoryStatus::kAvailPhys), 256'000'000U);
  EXPECT_EQ(memory.Get(MemoryStatus::kTotalPageFile), 1'228'800'000U);
  EXPECT_EQ(memory.Get(MemoryStatus::kAvailPageFile), 409'600'000U);
  EXPECT_EQ(memory.Get(MemoryStatus::kTotalVirtual), 0x7FFFFFFFU);
  EXPECT_EQ(memory.Get(MemoryStatus::kAvailVirtual), 0x7FFFFFFFU - 1024);
}

TEST(MemoryFigures, Stop_at_2147483647) {
  const auto memory = MemoryStatusOf("MemTotal: 32000000 kB\nMemAvailable: 16000000 kB\n", 0);
  for (const auto field : {MemoryStatus::kTotalPhys, MemoryStatus::kAvailPhys, MemoryStatus::kTotalPageFile,
                           MemoryStatus::kAvailPageFile})
    EXPECT_EQ(memory.Get(field), 0x7FFFFFFFU) << field;
  EXPECT_EQ(memory.Get(MemoryStatus::kMemoryLoad), 50U);
}

TEST(MemoryFigures, That_are_divided_by_are_never_0) {
  for (const char* meminfo : {"", "MemTotal: x kB\n", "MemTotal:\n"}) {
    const auto memory = MemoryStatusOf(meminfo, UINT64_MAX);
    EXPECT_EQ(memory.Get(MemoryStatus::kAvailPageFile), 1U);
    EXPECT_EQ(memory.Get(MemoryStatus::kAvailVirtual), 1U);
  }
}

TEST(LinuxSystemFigures, Memory_is_read_again_after_a_quarter_of_a_second) {
  const TemporaryFolder proc;
  proc.Write("meminfo", kMeminfo);
  std::uint64_t now = 1000;
  LinuxSystem system([&] { return now; }, proc.Path());
  MemoryStatus memory;
  system.GlobalMemoryStatus(memory);
  proc.Write("meminfo", "MemTotal: 2000 kB\n");
  now += 249;
  system.GlobalMemoryStatus(memory);
  EXPECT_EQ(memory.Get(MemoryStatus::kTotalPhys), 1'024'000'000U);
  now += 1;
  system.GlobalMemoryStatus(memory);
  EXPECT_EQ(memory.Get(MemoryStatus::kTotalPhys), 2'048'000U);
}

TEST(LinuxSystemFigures, Processors_are_counted_at_the_start) {
  const TemporaryFolder proc;
  proc.Write("stat", kStat);
  LinuxSystem system(CoarseMilliseconds, proc.Path());
  SystemInfo info;
  system.GetSystemInfo(info);
  EXPECT_EQ(info.numberOfProcessors, 2U);
}

} // namespace
} // namespace quendra::platform::linux_
