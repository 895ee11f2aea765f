#include "diagnostics/load/CPULoad.h"

#include "platform/simulated/SimulatedMachine.h"
#include "platform/unavailable/UnavailableMachine.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>

#include <optional>

namespace quendra::diagnostics {
namespace {

using platform::ProcessorTimes;

constexpr std::uint64_t kTime = 127'500'000'000'000'000;
constexpr std::uint64_t kSecond = 10'000'000;
constexpr std::uint64_t kMillisecond = 10'000;

struct Raised {
  std::uint32_t number = 0;
  Text text{};
  Text source{};
  friend bool operator==(const Raised&, const Raised&) = default;
};

Raised RaisedBy(const std::function<void()>& work) {
  try {
    work();
  } catch (const Fault& fault) {
    return {static_cast<std::uint32_t>(fault.number), fault.description, fault.source};
  }
  return {};
}

const Raised kIndexOutside{0x80041F43, u"CPU index out of bounds", u"CPULoad.GetCPUUsage()"};
const Raised kNoData{0x80041F46, u"Unable to read performance data", u"CPULoad.CollectCPUData()"};

class CPULoadTest : public testing::Test {
 protected:
  CPULoadTest() {
    machine.system.ProcessorCount = 2;
    SetIdle(0, 0, 0);
  }
  /// Idle times of the two processors after so many units of 100 ns.
  void SetIdle(std::uint64_t after, std::uint64_t first, std::uint64_t second) {
    machine.performanceData.SetProcessors({{u"0", first}, {u"1", second}, {u"_Total", first + second}},
                                          kTime + after);
  }
  void Sample(std::uint64_t after, std::uint64_t first, std::uint64_t second) {
    SetIdle(after, first, second);
    load.CollectCPUData();
  }
  /// The place of a field of the object in the block.
  void Put(std::size_t at, std::uint32_t value) { PutLittle32(machine.performanceData.Block, at, value); }
  void Grow(std::size_t at, std::size_t bytes) {
    Put(at, Little32(machine.performanceData.Block, at) + static_cast<std::uint32_t>(bytes));
  }
  /// Another counter's definition, of which only the length and the title say anything.
  void PutCounterBefore();

  platform::simulated::SimulatedMachine machine;
  CPULoad load{machine.system, machine.performanceData, machine.registry};
};

constexpr std::size_t kObjectAt = platform::PerformanceBlock::kBytes;
constexpr std::size_t kCounterAt = kObjectAt + platform::PerformanceObject::kBytes;
constexpr std::size_t kInstanceAt = kCounterAt + platform::PerformanceCounter::kBytes;

void CPULoadTest::PutCounterBefore() {
  using platform::PerformanceObject;
  std::vector<std::uint8_t> other(platform::PerformanceCounter::kBytes + 8);
  PutLittle32(other, platform::PerformanceCounter::kByteLength, static_cast<std::uint32_t>(other.size()));
  PutLittle32(other, platform::PerformanceCounter::kNameTitleIndex, 142);
  PutLittle32(other, platform::PerformanceCounter::kCounterOffset, 0x7FFFFFF0);
  auto& block = machine.performanceData.Block;
  block.insert(block.begin() + kCounterAt, other.begin(), other.end());
  Grow(kObjectAt + PerformanceObject::kNumCounters, 1);
  Grow(kObjectAt + PerformanceObject::kDefinitionLength, other.size());
  Grow(kObjectAt + PerformanceObject::kTotalByteLength, other.size());
}

TEST_F(CPULoadTest, A_version_that_cannot_be_had_is_an_error_of_the_start) {
  machine.system.FailVersion = true;
  EXPECT_EQ(RaisedBy([&] { CPULoad(machine.system, machine.performanceData, machine.registry); }),
            (Raised{0x80041F41, u"Can't get the Windows version", u"CPULoad.Initialize"}));
}

TEST_F(CPULoadTest, The_count_is_asked_for_once) {
  EXPECT_EQ(load.GetCPUCount(), 2);
  machine.system.ProcessorCount = 5;
  EXPECT_EQ(load.GetCPUCount(), 2);
}

TEST_F(CPULoadTest, A_count_below_1_is_asked_for_again) {
  machine.system.ProcessorCount = 0;
  EXPECT_EQ(load.GetCPUCount(), 0);
  machine.system.ProcessorCount = 2;
  EXPECT_EQ(load.GetCPUCount(), 2);
}

TEST_F(CPULoadTest, Object_238_is_asked_for_with_room_for_4096_bytes) {
  load.CollectCPUData();
  EXPECT_EQ(machine.performanceData.Names, (std::vector<std::string>{"238"}));
  EXPECT_EQ(machine.performanceData.Rooms, (std::vector<std::size_t>{4096}));
}

TEST_F(CPULoadTest, The_room_grows_by_4096_bytes_until_the_block_fits_and_stays) {
  machine.performanceData.Block.resize(10'000);
  load.CollectCPUData();
  load.CollectCPUData();
  EXPECT_EQ(machine.performanceData.Rooms, (std::vector<std::size_t>{4096, 8192, 12288, 12288}));
}

TEST_F(CPULoadTest, A_system_that_wants_more_room_than_1_MB_has_no_data) {
  machine.performanceData.Error = 234;
  EXPECT_EQ(RaisedBy([&] { load.CollectCPUData(); }), kNoData);
  EXPECT_EQ(machine.performanceData.Rooms.back(), 1U << 20);
}

TEST_F(CPULoadTest, A_query_that_fails_is_told_by_the_missing_signature) {
  machine.performanceData.Error = 2;
  EXPECT_EQ(RaisedBy([&] { load.CollectCPUData(); }), kNoData);
}

TEST_F(CPULoadTest, A_block_with_another_signature_is_no_data) {
  machine.performanceData.Block[6] = 'G';
  EXPECT_EQ(RaisedBy([&] { load.CollectCPUData(); }), kNoData);
}

TEST_F(CPULoadTest, A_block_without_the_processor_object_says_so) {
  Put(kObjectAt + platform::PerformanceObject::kNameTitleIndex, 230);
  EXPECT_EQ(
      RaisedBy([&] { load.CollectCPUData(); }),
      (Raised{0x80041F44, u"Unable to locate the 'Processor' performance object", u"CPULoad.CollectData"}));
}

TEST_F(CPULoadTest, A_block_without_the_counter_says_so) {
  Put(kCounterAt + platform::PerformanceCounter::kNameTitleIndex, 142);
  EXPECT_EQ(RaisedBy([&] { load.CollectCPUData(); }),
            (Raised{0x80041F45, u"Unable to locate the '% of CPU usage' performance counter",
                    u"CPULoad.CollectData"}));
}

TEST_F(CPULoadTest, Objects_before_the_one_of_processors_are_passed_over) {
  SetIdle(0, 0, 0);
  auto& block = machine.performanceData.Block;
  std::vector<std::uint8_t> other(72);
  PutLittle32(other, platform::PerformanceObject::kTotalByteLength, 72);
  PutLittle32(other, platform::PerformanceObject::kNameTitleIndex, 4);
  block.insert(block.begin() + kObjectAt, other.begin(), other.end());
  Put(platform::PerformanceBlock::kNumObjectTypes, 2);
  load.CollectCPUData();
  EXPECT_EQ(load.GetCPUCount(), 2);
}

TEST_F(CPULoadTest, An_object_beyond_the_stated_number_is_not_looked_at) {
  Put(platform::PerformanceBlock::kNumObjectTypes, 0);
  EXPECT_EQ(RaisedBy([&] { load.CollectCPUData(); }).number, 0x80041F44U);
}

TEST_F(CPULoadTest, A_counter_beyond_the_stated_number_is_not_looked_at) {
  Put(kObjectAt + platform::PerformanceObject::kNumCounters, 0);
  EXPECT_EQ(RaisedBy([&] { load.CollectCPUData(); }).number, 0x80041F45U);
}

TEST_F(CPULoadTest, Counters_before_the_one_of_processor_time_are_passed_over_with_their_places) {
  for (const std::uint64_t after : {std::uint64_t{0}, kSecond}) {
    SetIdle(after, after, 0);
    PutCounterBefore();
    load.CollectCPUData();
  }
  EXPECT_EQ(load.GetCPUUsage(1), 0);
  EXPECT_EQ(load.GetCPUUsage(2), 100);
}

TEST_F(CPULoadTest, An_object_that_says_it_has_no_instances_leaves_the_idle_times) {
  Sample(0, 50, 50);
  SetIdle(kSecond, 50 + kSecond, 50);
  Put(kObjectAt + platform::PerformanceObject::kNumInstances, 0xFFFFFFFF);
  load.CollectCPUData();
  EXPECT_EQ(load.GetCPUUsage(1), 100);
}

TEST_F(CPULoadTest, An_idle_time_without_bounds_is_an_overflow) {
  Sample(0, 0, 0);
  Sample(kMillisecond, std::uint64_t{1} << 62, 0);
  EXPECT_EQ(RaisedBy([&] { load.GetCPUUsage(1); }).number, static_cast<std::uint32_t>(Fault::kOverflow));
}

TEST_F(CPULoadTest, An_idle_counter_that_moves_as_much_as_the_time_gives_0) {
  Sample(0, 50, 50);
  Sample(kSecond, 50 + kSecond, 50);
  EXPECT_EQ(load.GetCPUUsage(1), 0);
}

TEST_F(CPULoadTest, An_idle_counter_that_stands_still_gives_100) {
  Sample(0, 50, 50);
  Sample(kSecond, 50 + kSecond, 50);
  EXPECT_EQ(load.GetCPUUsage(2), 100);
}

TEST_F(CPULoadTest, A_usage_is_rounded_half_to_even) {
  Sample(0, 0, 0);
  Sample(1000 * 10'000, 875 * 10'000, 625 * 10'000);
  EXPECT_EQ(load.GetCPUUsage(1), 12); // of 12.5
  EXPECT_EQ(load.GetCPUUsage(2), 38); // of 37.5
}

TEST_F(CPULoadTest, Two_samples_of_the_same_time_give_0) {
  Sample(0, 10, 10);
  Sample(0, 99, 99);
  EXPECT_EQ(load.GetCPUUsage(1), 0);
}

TEST_F(CPULoadTest, The_first_question_takes_a_sample_whose_figure_says_nothing) {
  EXPECT_EQ(load.GetCPUUsage(1), 100);
  EXPECT_EQ(machine.performanceData.Names.size(), 1U);
  load.GetCPUUsage(1);
  EXPECT_EQ(machine.performanceData.Names.size(), 1U);
}

TEST_F(CPULoadTest, An_index_outside_the_processors_is_an_error) {
  for (const std::int32_t index : {0, -1, 3, INT32_MIN, INT32_MAX})
    EXPECT_EQ(RaisedBy([&] { load.GetCPUUsage(index); }), kIndexOutside) << index;
}

TEST_F(CPULoadTest, An_instance_whose_name_is_not_numeric_touches_nothing) {
  machine.performanceData.SetProcessors({{u"_Total", 7}, {u"0", 0}, {u"1", 0}, {u"", 9}}, kTime);
  load.CollectCPUData();
  machine.performanceData.SetProcessors({{u"_Total", 99}, {u"0", kSecond}, {u"1", 0}, {u"", 9}},
                                        kTime + kSecond);
  load.CollectCPUData();
  EXPECT_EQ(load.GetCPUUsage(1), 0);
  EXPECT_EQ(load.GetCPUUsage(2), 100);
}

TEST_F(CPULoadTest, An_instance_beyond_the_processors_is_a_bounds_fault) {
  machine.performanceData.SetProcessors({{u"2", 7}}, kTime);
  EXPECT_EQ(RaisedBy([&] { load.CollectCPUData(); }).number, static_cast<std::uint32_t>(Fault::kSubscript));
}

TEST_F(CPULoadTest, A_block_that_leads_in_a_circle_or_out_of_itself_is_no_data) {
  const auto good = machine.performanceData.Block;
  for (const std::size_t field : {std::size_t{platform::PerformanceBlock::kHeaderLength},
                                  kObjectAt + platform::PerformanceObject::kDefinitionLength,
                                  kObjectAt + platform::PerformanceObject::kHeaderLength,
                                  kCounterAt + platform::PerformanceCounter::kCounterOffset,
                                  kInstanceAt + platform::PerformanceInstance::kByteLength,
                                  kInstanceAt + platform::PerformanceInstance::kNameOffset,
                                  kInstanceAt + platform::PerformanceInstance::kNameLength}) {
    machine.performanceData.Block = good;
    Put(field, 0x7FFFFFF0);
    EXPECT_EQ(RaisedBy([&] { load.CollectCPUData(); }), kNoData) << field;
  }
  machine.performanceData.Block = good;
  Put(kInstanceAt + platform::PerformanceInstance::kByteLength, 0);
  EXPECT_EQ(RaisedBy([&] { load.CollectCPUData(); }), kNoData);
}

TEST_F(CPULoadTest, A_machine_without_versions_has_no_load) {
  platform::unavailable::UnavailableMachine none;
  EXPECT_EQ(RaisedBy([&] { CPULoad(none.system, none.performanceData, none.registry); }).number, 0x80041F41U);
}

// The older family.

/// Tells which keys were opened, for what, and which values were read.
class WatchedRegistry : public platform::simulated::SimulatedRegistry {
 public:
  std::vector<std::string> Uses;

  std::uint32_t RegOpenKeyExA(platform::RegistryKey parent, const std::string& path, std::uint32_t access,
                              platform::RegistryKey& key) override {
    Uses.push_back("open " + path + (access == 0xF003F ? " wholly" : access == 0x20019 ? " to read" : " ?"));
    return SimulatedRegistry::RegOpenKeyExA(parent, path, access, key);
  }
  std::uint32_t RegQueryValueExA(platform::RegistryKey key, const std::string& name, std::uint32_t& type,
                                 std::span<std::uint8_t> data, std::uint32_t& size) override {
    Uses.push_back("read " + name + ", " + std::to_string(size) + " bytes");
    return SimulatedRegistry::RegQueryValueExA(key, name, type, data, size);
  }
  std::uint32_t RegCloseKey(platform::RegistryKey key) override {
    Uses.emplace_back("close");
    return SimulatedRegistry::RegCloseKey(key);
  }
};

class CPULoadOf9xTest : public testing::Test {
 protected:
  static constexpr const char* kStart = "HKEY_DYN_DATA\\PerfStats\\StartStat";
  static constexpr const char* kData = "HKEY_DYN_DATA\\PerfStats\\StatData";
  static constexpr const char* kStop = "HKEY_DYN_DATA\\PerfStats\\StopStat";

  CPULoadOf9xTest() {
    machine.system.Version = {1, 4, 10};
    SetUsage(kStart, 1);
    SetUsage(kData, 37);
    SetUsage(kStop, 0);
    load.emplace(machine.system, machine.performanceData, machine.registry);
  }
  void SetUsage(const std::string& key, std::uint8_t usage) {
    machine.registry.SetValue(key, "KERNEL\\CPUUsage", {3, {usage, 0, 0, 0}});
  }
  std::size_t OpenKeys() const { return machine.registry.OpenCount(); }

  platform::simulated::SimulatedMachine machine;
  std::optional<CPULoad> load;
};

TEST_F(CPULoadOf9xTest, The_usage_is_the_figure_of_the_registry) {
  EXPECT_EQ(load->GetCPUUsage(1), 37);
  EXPECT_TRUE(machine.performanceData.Names.empty());
}

TEST_F(CPULoadOf9xTest, The_figure_is_read_anew_with_each_sample_and_not_with_each_question) {
  load->CollectCPUData();
  SetUsage(kData, 55);
  EXPECT_EQ(load->GetCPUUsage(1), 37);
  load->CollectCPUData();
  EXPECT_EQ(load->GetCPUUsage(1), 55);
}

TEST_F(CPULoadOf9xTest, Any_index_but_1_is_an_error) {
  for (const std::int32_t index : {0, 2, -1})
    EXPECT_EQ(RaisedBy([&] { load->GetCPUUsage(index); }), kIndexOutside) << index;
}

TEST_F(CPULoadOf9xTest, Statistics_that_cannot_be_started_are_an_error) {
  machine.registry.RemoveKey(kStart);
  EXPECT_EQ(RaisedBy([&] { load->CollectCPUData(); }),
            (Raised{0x80041F42, u"Unable to start performance monitoring", u"CPULoad.CollectCPRData()"}));
}

TEST_F(CPULoadOf9xTest, Statistics_that_cannot_be_read_are_an_error_and_not_started) {
  machine.registry.RemoveKey(kData);
  EXPECT_EQ(RaisedBy([&] { load->CollectCPUData(); }), kNoData);
  EXPECT_EQ(OpenKeys(), 0U);
  SetUsage(kData, 12);
  EXPECT_EQ(load->GetCPUUsage(1), 12);
}

TEST_F(CPULoadOf9xTest, A_value_that_cannot_be_read_leaves_the_figure_as_it_was) {
  load->CollectCPUData();
  machine.registry.RemoveKey(kData);
  load->CollectCPUData();
  EXPECT_EQ(load->GetCPUUsage(1), 37);
}

TEST_F(CPULoadOf9xTest, The_statistics_key_stays_open_until_the_end_and_then_none_is) {
  load->CollectCPUData();
  EXPECT_EQ(OpenKeys(), 1U);
  load.reset();
  EXPECT_EQ(OpenKeys(), 0U);
}

TEST_F(CPULoadOf9xTest, Reading_a_value_once_switches_the_statistics_on_and_off) {
  WatchedRegistry registry;
  for (const char* key : {kStart, kData, kStop})
    registry.SetValue(key, "KERNEL\\CPUUsage", {3, {9, 0, 0, 0}});
  const std::string read = "read KERNEL\\CPUUsage, 4 bytes";
  load.emplace(machine.system, machine.performanceData, registry);
  load->CollectCPUData();
  EXPECT_EQ(registry.Uses, (std::vector<std::string>{"open PerfStats\\StartStat wholly", read, "close",
                                                     "open PerfStats\\StatData to read", read}));
  registry.Uses.clear();
  load.reset();
  EXPECT_EQ(registry.Uses,
            (std::vector<std::string>{"close", "open PerfStats\\StopStat wholly", read, "close"}));
}

TEST_F(CPULoadOf9xTest, The_end_is_silent_when_the_statistics_cannot_be_stopped_or_never_ran) {
  load->CollectCPUData();
  machine.registry.RemoveKey(kStop);
  EXPECT_NO_THROW(load.reset());
  load.emplace(machine.system, machine.performanceData, machine.registry);
  EXPECT_NO_THROW(load.reset());
  EXPECT_EQ(OpenKeys(), 0U);
}

} // namespace
} // namespace quendra::diagnostics
