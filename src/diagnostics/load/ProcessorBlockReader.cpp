#include "diagnostics/load/ProcessorBlockReader.h"

#include "diagnostics/load/CPULoadError.h"
#include "platform/system/PerformanceBlock.h"
#include "runtime/ByteFields.h"

namespace quendra::diagnostics {

using Block = platform::PerformanceBlock;
using Object = platform::PerformanceObject;
using Counter = platform::PerformanceCounter;
using Instance = platform::PerformanceInstance;

namespace {

/// As much of the header as is looked at.
constexpr std::size_t kHeaderBytes = 84;
constexpr std::size_t kCountersLengthBytes = 4;

} // namespace

ProcessorBlockReader::ProcessorBlockReader(Bytes block) : block_(block) {
  Require(block.size() >= kHeaderBytes);
  Require(ReadName(0, 2 * Block::kSignature.size()) == FromUtf8(Block::kSignature));
}

void ProcessorBlockReader::Require(bool holds) const {
  if (!holds) throw CpuLoadFault(CPULoad::kNoPerformanceData);
}

std::uint32_t ProcessorBlockReader::Read32(std::size_t at) const {
  Require(at <= block_.size() && block_.size() - at >= sizeof(std::uint32_t));
  return Little32(block_, at);
}

std::uint64_t ProcessorBlockReader::Read64(std::size_t at) const {
  Require(at <= block_.size() && block_.size() - at >= sizeof(std::uint64_t));
  return Little64(block_, at);
}

Text ProcessorBlockReader::ReadName(std::size_t at, std::size_t bytes) const {
  Require(at <= block_.size() && block_.size() - at >= bytes);
  Text name;
  for (std::size_t i = 0; i + 1 < bytes; i += 2)
    name.push_back(static_cast<char16_t>(Little16(block_, at + i)));
  return name;
}

std::size_t ProcessorBlockReader::Beyond(std::size_t at, std::uint32_t length, std::size_t least) const {
  Require(length >= least && at <= block_.size() && length <= block_.size() - at);
  return at + length;
}

void ProcessorBlockReader::FindObject() {
  std::size_t at = Read32(Block::kHeaderLength);
  const std::uint32_t count = Read32(Block::kNumObjectTypes);
  for (std::uint32_t i = 0; i < count; ++i) {
    object_ = at;
    if (Read32(at + Object::kNameTitleIndex) == platform::kProcessorObject) return;
    at = Beyond(at, Read32(at + Object::kTotalByteLength), Object::kBytes);
  }
  throw CpuLoadFault(CPULoad::kNoProcessorObject);
}

void ProcessorBlockReader::FindCounter() {
  std::size_t at = Beyond(object_, Read32(object_ + Object::kHeaderLength), Object::kBytes);
  const std::uint32_t count = Read32(object_ + Object::kNumCounters);
  for (std::uint32_t i = 0; i < count; ++i) {
    counterOffset_ = Read32(at + Counter::kCounterOffset);
    if (Read32(at + Counter::kNameTitleIndex) == platform::kProcessorTimeCounter) return;
    at = Beyond(at, Read32(at + Counter::kByteLength), Counter::kBytes);
  }
  throw CpuLoadFault(CPULoad::kNoUsageCounter);
}

void ProcessorBlockReader::ForEachInstance(
    const std::function<void(const Text& name, std::uint64_t value)>& take) const {
  std::size_t at = Beyond(object_, Read32(object_ + Object::kDefinitionLength), Object::kBytes);
  // An object that can't have instances says -1.
  const auto count = static_cast<std::int32_t>(Read32(object_ + Object::kNumInstances));
  for (std::int32_t i = 0; i < count; ++i) {
    const std::uint32_t nameBytes = Read32(at + Instance::kNameLength);
    const Text name = ReadName(at + Read32(at + Instance::kNameOffset), nameBytes < 2 ? 0 : nameBytes - 2);
    const std::size_t counters = Beyond(at, Read32(at + Instance::kByteLength), Instance::kBytes);
    take(name, Read64(counters + counterOffset_));
    at = Beyond(counters, Read32(counters), kCountersLengthBytes);
  }
}

std::span<const std::uint8_t, 16> ProcessorBlockReader::SystemTime() const {
  return block_.subspan<Block::kSystemTime, 16>();
}

} // namespace quendra::diagnostics
