#include "platform/system/PerformanceBlock.h"

#include "platform/system/SystemTime.h"
#include "runtime/ByteFields.h"

#include <algorithm>

namespace quendra::platform {

namespace {

/// The counters of an instance: their length, padding, and the idle time.
constexpr std::size_t kCountersBytes = 16;
constexpr std::size_t kIdleOffset = 8;
constexpr std::size_t kDefinitionBytes = PerformanceObject::kBytes + PerformanceCounter::kBytes;
constexpr std::uint32_t kWithoutUniqueId = 0xFFFFFFFF;

class Writer {
 public:
  /// Zeros to append; gives where they start.
  std::size_t Append(std::size_t count) {
    bytes_.resize(bytes_.size() + count);
    return bytes_.size() - count;
  }
  void Put(std::size_t at, std::size_t value) { PutLittle32(bytes_, at, static_cast<std::uint32_t>(value)); }
  std::vector<std::uint8_t>& Bytes() { return bytes_; }

 private:
  std::vector<std::uint8_t> bytes_;
};

void WriteHeader(Writer& out, std::uint64_t fileTime) {
  using Block = PerformanceBlock;
  const std::size_t at = out.Append(Block::kBytes);
  for (std::size_t i = 0; i < Block::kSignature.size(); ++i) // 16-bit characters
    out.Bytes()[at + 2 * i] = static_cast<std::uint8_t>(Block::kSignature[i]);
  out.Put(at + Block::kLittleEndian, 1);
  out.Put(at + Block::kVersion, 1);
  out.Put(at + Block::kRevision, 1);
  out.Put(at + Block::kHeaderLength, Block::kBytes);
  out.Put(at + Block::kNumObjectTypes, 1);
  out.Put(at + Block::kDefaultObject, kProcessorObject);
  std::ranges::copy(SystemTimeOf(fileTime),
                    out.Bytes().begin() + static_cast<std::ptrdiff_t>(at + Block::kSystemTime));
}

void WriteDefinitions(Writer& out, std::size_t instances) {
  using Object = PerformanceObject;
  const std::size_t object = out.Append(Object::kBytes);
  out.Put(object + Object::kDefinitionLength, kDefinitionBytes);
  out.Put(object + Object::kHeaderLength, Object::kBytes);
  out.Put(object + Object::kNameTitleIndex, kProcessorObject);
  out.Put(object + Object::kNumCounters, 1);
  out.Put(object + Object::kNumInstances, instances);

  using Counter = PerformanceCounter;
  const std::size_t counter = out.Append(Counter::kBytes);
  out.Put(counter + Counter::kByteLength, Counter::kBytes);
  out.Put(counter + Counter::kNameTitleIndex, kProcessorTimeCounter);
  out.Put(counter + Counter::kCounterType, Counter::kInverseTimer);
  out.Put(counter + Counter::kCounterSize, sizeof(std::uint64_t));
  out.Put(counter + Counter::kCounterOffset, kIdleOffset);
}

void WriteInstance(Writer& out, const ProcessorTimes& processor) {
  using Instance = PerformanceInstance;
  const std::size_t nameBytes = 2 * (processor.name.size() + 1);
  const std::size_t length = (Instance::kBytes + nameBytes + 7) / 8 * 8;
  const std::size_t at = out.Append(length);
  out.Put(at + Instance::kByteLength, length);
  out.Put(at + Instance::kUniqueId, kWithoutUniqueId);
  out.Put(at + Instance::kNameOffset, Instance::kBytes);
  out.Put(at + Instance::kNameLength, nameBytes);
  for (std::size_t i = 0; i < processor.name.size(); ++i)
    PutLittle16(out.Bytes(), at + Instance::kBytes + 2 * i, processor.name[i]);

  const std::size_t counters = out.Append(kCountersBytes);
  out.Put(counters, kCountersBytes);
  PutLittle64(out.Bytes(), counters + kIdleOffset, processor.idle);
}

} // namespace

std::vector<std::uint8_t> ProcessorBlock(std::span<const ProcessorTimes> processors, std::uint64_t fileTime) {
  Writer out;
  WriteHeader(out, fileTime);
  WriteDefinitions(out, processors.size());
  for (const ProcessorTimes& processor : processors) WriteInstance(out, processor);
  out.Put(PerformanceBlock::kTotalByteLength, out.Bytes().size());
  out.Put(PerformanceBlock::kBytes + PerformanceObject::kTotalByteLength,
          out.Bytes().size() - PerformanceBlock::kBytes);
  return std::move(out.Bytes());
}

} // namespace quendra::platform
