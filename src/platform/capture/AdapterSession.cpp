#include "platform/capture/AdapterSession.h"

namespace quendra::platform {

void AdapterSession::Open(const std::string& name) {
  Close();
  failed_ = false;
  number_ = name.empty() ? 0 : adapters_.NumberIfUp(name);
  if (number_ != 0) source_ = adapters_.Open(name, shaper_);
}

void AdapterSession::Close() {
  counters_ = Counters();
  source_.reset();
}

bool AdapterSession::Follows(const std::string& name) const {
  return adapters_.NumberIfUp(name) == number_ && IsLive() == (number_ != 0);
}

int AdapterSession::Fill() {
  const int count = source_->Fill();
  if (count < 0)
    failed_ = true;
  else
    counters_.received += static_cast<std::uint64_t>(count);
  return count;
}

CaptureCounters AdapterSession::Counters() const {
  CaptureCounters counters = counters_;
  if (HasSource()) counters.droppedByKernel += source_->Dropped();
  return counters;
}

} // namespace quendra::platform
