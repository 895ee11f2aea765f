#include "platform/capture/AdapterIndexes.h"

#include <algorithm>

namespace quendra::platform {

void AdapterIndexes::CountAdapters() {
  List();
  const int found = static_cast<int>(std::min<std::size_t>(listed_.size(), kMostAdapters));
  count_ = found == 0 ? 0 : found + kSpare;
}

void AdapterIndexes::ListAfresh() {
  if (count_ != 0) List();
}

const LiveAdapter* AdapterIndexes::At(int index) const {
  if (index < 0 || index >= count_ || listed_.empty()) return nullptr;
  return &listed_[std::min<std::size_t>(static_cast<std::size_t>(index), listed_.size() - 1)];
}

bool AdapterIndexes::Lists(const std::string& name) const {
  return std::any_of(listed_.begin(), listed_.end(),
                     [&](const LiveAdapter& adapter) { return adapter.name == name; });
}

void AdapterIndexes::List() {
  if (adapters_.HasLibrary()) {
    listed_ = adapters_.List();
    PutInOrder(listed_);
  }
  availability_ = AvailabilityNow();
}

CaptureLibrary::Availability AdapterIndexes::AvailabilityNow() const {
  using Availability = CaptureLibrary::Availability;
  if (!adapters_.HasLibrary()) return Availability::NoLibrary;
  // What is listed when there is nothing to list is down.
  if (listed_.empty() || adapters_.NumberIfUp(listed_.front().name) == 0) return Availability::NoAdapters;
  return adapters_.MayCapture() ? Availability::Available : Availability::NoRights;
}

} // namespace quendra::platform
