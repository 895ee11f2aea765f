#pragma once

#include <cstdint>
#include <vector>

namespace quendra::foundation {

class CSocketPlus;

/// A pair of parallel arrays from 1: handles and the objects that own them. Grows and never shrinks while the
/// dispatcher lives; an entry that was freed holds -1 and nothing, and takes the next pair.
class HandleOwners {
 public:
  static constexpr std::uint32_t kFree = 0xFFFFFFFF;

  /// Does nothing for a handle that is there already.
  void Add(std::uint32_t handle, CSocketPlus* owner);
  void Remove(std::uint32_t handle);
  void ChangeOwner(std::uint32_t handle, CSocketPlus* owner);
  /// nullptr for a handle that is not there.
  CSocketPlus* OwnerOf(std::uint32_t handle) const;
  std::vector<std::uint32_t> HandlesOf(const CSocketPlus* owner) const;
  int Count() const { return static_cast<int>(entries_.size()); }
  void Clear() { entries_.clear(); }

 private:
  struct Entry {
    std::uint32_t handle = kFree;
    CSocketPlus* owner = nullptr;
  };
  std::vector<Entry>::iterator Find(std::uint32_t handle);

  std::vector<Entry> entries_;
};

} // namespace quendra::foundation
