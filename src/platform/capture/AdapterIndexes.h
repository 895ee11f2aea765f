#pragma once

#include "platform/capture/CaptureAdapters.h"
#include "platform/capture/CaptureLibrary.h"

namespace quendra::platform {

/// The adapters by their indexes in the capture library, whose number is fixed by the first list.
class AdapterIndexes {
 public:
  explicit AdapterIndexes(const CaptureAdapters& adapters) : adapters_(adapters) {}

  /// How many adapters may come while the program runs: the indexes are counted once, but a page lists its
  /// adapters at each opening. Until they come, their indexes repeat the last adapter, as a second mention
  /// adds nothing to a list.
  static constexpr int kSpare = 16;
  /// An index has 15 bits; far fewer are of use to anybody.
  static constexpr int kMostAdapters = 1024;

  /// Lists the adapters and fixes the number of indexes for good.
  void CountAdapters();
  /// Does nothing before they are counted or when there were none.
  void ListAfresh();

  /// 0 without the library.
  int Count() const { return count_; }
  /// nullptr beyond the indexes.
  const LiveAdapter* At(int index) const;
  bool Lists(const std::string& name) const;
  /// As it was when they were listed.
  CaptureLibrary::Availability Availability() const { return availability_; }

 private:
  void List();
  CaptureLibrary::Availability AvailabilityNow() const;

  const CaptureAdapters& adapters_;
  std::vector<LiveAdapter> listed_;
  int count_ = 0;
  CaptureLibrary::Availability availability_ = CaptureLibrary::Availability::NoAdapters;
};

} // namespace quendra::platform
