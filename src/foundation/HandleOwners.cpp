#include "foundation/HandleOwners.h"

#include <algorithm>

namespace quendra::foundation {

std::vector<HandleOwners::Entry>::iterator HandleOwners::Find(std::uint32_t handle) {
  return std::find_if(entries_.begin(), entries_.end(),
                      [&](const Entry& entry) { return entry.handle == handle; });
}

void HandleOwners::Add(std::uint32_t handle, CSocketPlus* owner) {
  for (Entry& entry : entries_) {
    if (entry.handle == handle) return;
    if (entry.handle != kFree) continue;
    entry = {handle, owner};
    return;
  }
  entries_.push_back({handle, owner});
}

void HandleOwners::Remove(std::uint32_t handle) {
  if (const auto found = Find(handle); found != entries_.end()) *found = {};
}

void HandleOwners::ChangeOwner(std::uint32_t handle, CSocketPlus* owner) {
  if (const auto found = Find(handle); found != entries_.end()) found->owner = owner;
}

CSocketPlus* HandleOwners::OwnerOf(std::uint32_t handle) const {
  const auto found = const_cast<HandleOwners*>(this)->Find(handle);
  return handle == kFree || found == entries_.end() ? nullptr : found->owner;
}

std::vector<std::uint32_t> HandleOwners::HandlesOf(const CSocketPlus* owner) const {
  std::vector<std::uint32_t> handles;
  for (const Entry& entry : entries_)
    if (entry.handle != kFree && entry.owner == owner) handles.push_back(entry.handle);
  return handles;
}

} // namespace quendra::foundation
