#include "platform/BehaviourFixture.h"
#include "platform/system/PerformanceBlock.h"
#include "platform/system/PerformanceData.h"
#include "runtime/ByteFields.h"

namespace quendra::platform {
namespace {

struct PerformanceDataBehaviourTest : BehaviourTest {
  using Bytes = std::vector<std::uint8_t>;
  static constexpr std::size_t kObject = PerformanceBlock::kBytes;

  Bytes Block() {
    Bytes buffer(64 * 1024);
    EXPECT_EQ(machine.performanceData.Query("238", buffer), 0U);
    const std::uint32_t length = Little32(buffer, PerformanceBlock::kTotalByteLength);
    EXPECT_LE(length, buffer.size());
    buffer.resize(std::min<std::size_t>(length, buffer.size()));
    return buffer;
  }
  /// Names of the instances, and their idle times, in the block's order.
  static std::vector<std::pair<Text, std::uint64_t>> Instances(const Bytes& block) {
    std::vector<std::pair<Text, std::uint64_t>> instances;
    std::size_t at = kObject + Little32(block, kObject + PerformanceObject::kDefinitionLength);
    const std::size_t counter = kObject + Little32(block, kObject + PerformanceObject::kHeaderLength);
    for (auto i = Little32(block, kObject + PerformanceObject::kNumInstances); i > 0; --i) {
      Text name;
      const std::size_t nameAt = at + Little32(block, at + PerformanceInstance::kNameOffset);
      const std::size_t units = Little32(block, at + PerformanceInstance::kNameLength) / 2 - 1;
      for (std::size_t unit = 0; unit < units; ++unit)
        name += static_cast<char16_t>(Little16(block, nameAt + 2 * unit));
      at += Little32(block, at + PerformanceInstance::kByteLength);
      instances.emplace_back(
          name, Little64(block, at + Little32(block, counter + PerformanceCounter::kCounterOffset)));
      at += Little32(block, at);
    }
    EXPECT_EQ(at, block.size());
    return instances;
  }
};

TEST_P(PerformanceDataBehaviourTest, The_block_holds_the_processors_object_and_its_counter_of_idle_time) {
  const Bytes block = Block();

  Text signature;
  for (std::size_t i = 0; i < 4; ++i) signature += static_cast<char16_t>(Little16(block, 2 * i));
  EXPECT_EQ(signature, u"PERF");
  EXPECT_EQ(Little32(block, PerformanceBlock::kHeaderLength), kObject);
  EXPECT_EQ(Little32(block, PerformanceBlock::kNumObjectTypes), 1U);
  EXPECT_EQ(Little32(block, kObject + PerformanceObject::kNameTitleIndex), 238U);
  const std::size_t counter = kObject + Little32(block, kObject + PerformanceObject::kHeaderLength);
  EXPECT_EQ(Little32(block, counter + PerformanceCounter::kNameTitleIndex), 6U);
  EXPECT_EQ(Little32(block, counter + PerformanceCounter::kCounterSize), 8U);
}

TEST_P(PerformanceDataBehaviourTest, There_is_an_instance_a_processor_and_one_of_the_total) {
  SystemInfo info;
  machine.system.GetSystemInfo(info);

  const auto instances = Instances(Block());

  ASSERT_EQ(instances.size(), info.numberOfProcessors + 1);
  EXPECT_EQ(instances.front().first, u"0");
  EXPECT_EQ(instances.back().first, u"_Total");
}

TEST_P(PerformanceDataBehaviourTest, Idle_times_never_go_back) {
  const auto before = Instances(Block());
  const auto after = Instances(Block());
  ASSERT_EQ(before.size(), after.size());
  for (std::size_t i = 0; i < before.size(); ++i) EXPECT_GE(after[i].second, before[i].second);
}

TEST_P(PerformanceDataBehaviourTest, A_buffer_that_is_a_byte_too_small_asks_for_more_and_stays_as_it_was) {
  Bytes buffer(Block().size() - 1, 0xA5);
  EXPECT_EQ(machine.performanceData.Query("238", buffer), PerformanceData::kErrorMoreData);
  EXPECT_EQ(buffer, Bytes(buffer.size(), 0xA5));
  EXPECT_EQ(machine.performanceData.Query("238", {}), PerformanceData::kErrorMoreData);
}

INSTANTIATE_TEST_SUITE_P(, PerformanceDataBehaviourTest, kEveryBackend, NameOfBackend);

} // namespace
} // namespace quendra::platform
