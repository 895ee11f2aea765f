#include "platform/capture/AdapterSession.h"

namespace quendra::platform {

void AdapterSession::Open(const std::string& name) {
  Close();
  failed_ = false;
  number_ = NumberOf(name);
  if (number_ != 0) source_ = adapters_.Open(name, shaper_);
}

void AdapterSession::Close() {
  counters_ = Counters();
  source_.reset();
}

bool AdapterSession::Follows(const std::string& name) const {
  return NumberOf(name) == number_ && IsLive() == (number_ != 0);
}

unsigned AdapterSession::NumberOf(const std::string& name) const {
  return name.empty() ? 0 : adapters_.NumberIfUp(name);
}

int AdapterSession::Fill() {
  const int count = source_->Fill();
  if (count < 0) {
    failed_ = true;
    ++failuresInARow_;
    return count;
  }
  if (count > 0) failuresInARow_ = 0;
  counters_.received += static_cast<std::uint64_t>(count);
  return count;
}

CaptureCounters AdapterSession::Counters() const {
  CaptureCounters counters = counters_;
  if (HasSource()) counters.droppedByKernel += source_->Dropped();
  return counters;
}

} // namespace quendra::platform
