#pragma once

#include <cstdint>
#include <vector>

namespace quendra::foundation {

class CSocketPlus;

/// Handles and the objects that own them. Grows and never shrinks while the
/// dispatcher lives; an entry that was freed holds -1 and nothing, and takes the next pair.
template <typename Handle> class HandleOwners {
 public:
  static constexpr Handle kFree{0xFFFFFFFF};

  /// Does nothing for a handle that is there already.
  void Add(Handle handle, CSocketPlus* owner) {
    for (Entry& entry : entries_) {
      if (entry.handle == handle) return;
      if (entry.handle != kFree) continue;
      entry = {handle, owner};
      return;
    }
    entries_.push_back({handle, owner});
  }
  void Remove(Handle handle) {
    if (Entry* found = Find(handle)) *found = {};
  }
  void ChangeOwner(Handle handle, CSocketPlus* owner) {
    if (Entry* found = Find(handle)) found->owner = owner;
  }
  /// nullptr for a handle that is not there.
  CSocketPlus* OwnerOf(Handle handle) const {
    if (handle == kFree) return nullptr;
    for (const Entry& entry : entries_)
      if (entry.handle == handle) return entry.owner;
    return nullptr;
  }
  std::vector<Handle> HandlesOf(const CSocketPlus* owner) const {
    std::vector<Handle> handles;
    for (const Entry& entry : entries_)
      if (entry.handle != kFree && entry.owner == owner) handles.push_back(entry.handle);
    return handles;
  }
  int Count() const { return static_cast<int>(entries_.size()); }
  void Clear() { entries_.clear(); }

 private:
  struct Entry {
    Handle handle = kFree;
    CSocketPlus* owner = nullptr;
  };
  Entry* Find(Handle handle) {
    for (Entry& entry : entries_)
      if (entry.handle == handle) return &entry;
    return nullptr;
  }

  std::vector<Entry> entries_;
};

} // namespace quendra::foundation
