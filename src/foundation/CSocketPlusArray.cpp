#include "foundation/CSocketPlus.h"

#include "foundation/SocketErrors.h"

#include <new>

namespace quendra::foundation {

namespace {

/// An integer index as one number, whatever its width; nothing for any other type.
std::optional<std::int32_t> NumericIndex(const Variant& index) {
  if (const auto* number = index.Find<std::int16_t>()) return *number;
  if (const auto* number = index.Find<std::int32_t>()) return *number;
  return std::nullopt;
}

template <typename Map, typename Key> std::optional<std::size_t> SlotIn(const Map& map, const Key& key) {
  const auto found = map.find(key);
  return found == map.end() ? std::nullopt : std::optional(found->second);
}

[[noreturn]] void RaiseOutOfMemory(const char16_t* source) {
  throw Fault(Fault::kOutOfMemory, u"Out of memory", source);
}

} // namespace

CSocketPlus::Slot CSocketPlus::GetSocketIndex(const Variant& index) const {
  constexpr auto kSource = u"CSocketPlus.GetSocketIndex";
  std::optional<Slot> slot;
  if (const Text* text = index.Find<Text>()) {
    slot = SlotIn(slotsByStringIndex_, *text);
  } else if (const auto number = NumericIndex(index)) {
    slot = SlotIn(slotsByNumericIndex_, *number);
  } else {
    throw Misuse(kUnsupportedIndexType, kSource);
  }
  if (!slot) throw Misuse(kUnknownIndex, kSource);
  return *slot;
}

Variant CSocketPlus::ArrayAdd(const Variant& index) {
  const Slot slot = GetFreeSocketIndex();
  At(slot).SocketHandle = platform::kNoSocket;
  At(slot).ResolveRequests.clear();
  At(slot).Index = index;
  bool added = false;
  if (const Text* text = index.Find<Text>()) {
    added = slotsByStringIndex_.emplace(*text, slot).second;
  } else if (const auto number = NumericIndex(index)) {
    added = slotsByNumericIndex_.emplace(*number, slot).second;
  } else if (index.IsMissing()) {
    std::int32_t free = 1;
    while (slotsByNumericIndex_.contains(free)) ++free;
    added = slotsByNumericIndex_.emplace(free, slot).second;
    At(slot).Index = free;
  } else {
    throw Misuse(kUnsupportedIndexType, u"CSocketPlus.ArrayAdd");
  }
  // The slot stays taken: nobody gives it back.
  if (!added)
    throw Fault(Fault::kDuplicateKey, u"This index is already associated with an element of this array.",
                u"CSocketPlus.ArrayAdd");
  return At(slot).Index;
}

Variant CSocketPlus::ArrayRemove(const Variant& index) {
  Variant removed = index; // the caller's may lie in the record
  const Slot slot = GetSocketIndex(removed);
  CloseSlot(slot);
  if (const Text* text = removed.Find<Text>()) {
    slotsByStringIndex_.erase(*text);
  } else if (const auto number = NumericIndex(removed)) {
    slotsByNumericIndex_.erase(*number);
  } else {
    throw Misuse(kUnsupportedIndexType, u"CSocketPlus.ArrayRemove");
  }
  CleanSocketArray(slot);
  return removed;
}

bool CSocketPlus::ArrayIndexInUse(const Variant& index) const {
  if (const Text* text = index.Find<Text>()) return slotsByStringIndex_.contains(*text);
  if (const auto number = NumericIndex(index)) return slotsByNumericIndex_.contains(*number);
  throw Misuse(kUnsupportedIndexType, u"CSocketPlus.ArrayIndexInUse");
}

std::int32_t CSocketPlus::ArrayCount() const {
  return static_cast<std::int32_t>(slotsByStringIndex_.size() + slotsByNumericIndex_.size());
}

CSocketPlus::Slot CSocketPlus::GetFreeSocketIndex() try {
  if (!freeSlots_.empty()) {
    const Slot slot = freeSlots_.back();
    freeSlots_.pop_back();
    return slot;
  }
  records_.emplace_back();
  return records_.size() - 1;
} catch (const std::bad_alloc&) {
  RaiseOutOfMemory(u"CSocketPlus.GetFreeSocketIndex");
}

void CSocketPlus::CleanSocketArray(Slot slot) try {
  const Slot upperBound = records_.size() - 1;
  if (freeSlots_.size() + 1 == upperBound) {
    freeSlots_.clear();
    records_.resize(1);
  } else if (slot == upperBound) {
    records_.pop_back();
  } else {
    At(slot) = SocketRecord::Freed();
    freeSlots_.push_back(slot);
  }
} catch (const std::bad_alloc&) {
  RaiseOutOfMemory(u"CSocketPlus.CleanSocketArray");
}

} // namespace quendra::foundation
