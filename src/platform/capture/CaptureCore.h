#pragma once

#include "platform/capture/AdapterIndexes.h"
#include "platform/capture/AdapterSession.h"
#include "platform/capture/CaptureControl.h"

namespace quendra::platform {

/// The session that the capture library and its controls share, and the rules of when the event is raised:
/// - when packets have moved from the system to the queue;
/// - once more through the loop's queue after an event that took frames and left some.
/// On a silent line the source's watch is awaited. Once it has rung, a timer looks for packets as long as
/// there are some: a busy line rings twenty times a second and not with every block of the system, as each
/// ring costs the loop more than a hundred frames do. During an event nothing is served, so that a handler
/// which merely yields is not entered again from here; the system's buffer does the waiting. While a box or a
/// modal form stands that was opened in an event, that could take minutes: then events go on inside it.
class CaptureCore : public std::enable_shared_from_this<CaptureCore> {
 public:
  /// Two batches must fit in the queue; a lower capacity is raised to that.
  CaptureCore(EventLoop& loop, std::unique_ptr<CaptureAdapters> adapters, std::uint32_t queueCapacity);

  void CountAdapters() { indexes_.CountAdapters(); }
  /// During a session the list stands: what the user chooses from must be what he sees.
  void ListAdaptersAfresh();
  const AdapterIndexes& Adapters() const { return indexes_; }
  Ipv4Address AddressOf(const std::string& adapterName) const { return adapters_->AddressOf(adapterName); }
  CaptureLibrary::Availability Availability() const;
  /// As CaptureLibrary::AdapterChanged.
  std::function<void()> OnAdapterChanged;

  void SelectAdapter(int adapter);
  void Begin();
  void End();
  std::int32_t Capture(FrameBytes& frame, CaptureHeader& header);

  /// `control` rings from now on, as long as its adapter is the session's.
  void Listen(CaptureControl& control, const std::string& adapterName);
  /// Does nothing for a control that isn't the one that rings.
  void StopListening(const CaptureControl& control);
  const FrameRecord* Newest() const { return queue_.Newest(); }

  CaptureCounters Counters() const;

 private:
  class Event;

  const std::string& CurrentName() const;
  void Open();
  void Close();
  void OpenSession();
  void CloseSession();
  void AdaptersChanged();
  void TakeUpAdapter();
  void AwaitAddress();
  bool LacksAddress() const { return AddressOf(CurrentName()).IsAny(); }
  bool MayRing() const;
  void UpdateBell();
  /// Whether an event is under way that no box or modal form holds up.
  bool Busy() const;
  void StartPace();
  void PacketsMayWait();
  void LookAgain();
  bool Serve();
  bool Gather(int batches);
  void MakeRoom();
  void Ring();
  void RingAgain();
  std::function<void()> Guarded(void (CaptureCore::*work)());

  EventLoop& loop_;
  const std::unique_ptr<CaptureAdapters> adapters_;
  AdapterIndexes indexes_{*adapters_};
  int current_ = -1;
  bool begun_ = false;

  FrameQueue queue_;
  AdapterSession session_{*adapters_, queue_};
  std::unique_ptr<EventLoop::Subscription> changes_; // of adapters, from begin to end
  bool gone_ = false;                                // the session waits for its adapter
  bool awaitsAddress_ = false;                       // the adapter has come back without one
  std::uint64_t droppedByQueue_ = 0;

  CaptureControl* control_ = nullptr;
  std::string controlAdapter_;
  std::unique_ptr<EventLoop::Subscription> watch_; // on a silent line; goes before the session
  std::unique_ptr<EventLoop::Subscription> pace_;  // on a busy line; never both
  bool secondRingPosted_ = false;
  Event* event_ = nullptr; // the innermost one under way
  FrameRecord frame_{};    // what was taken last outside of events
};

} // namespace quendra::platform
