#pragma once

#include "platform/linux/capture/LinkWatch.h"
#include "platform/linux/capture/LinuxCapture.h"
#include "platform/linux/capture/LinuxCaptureAdapters.h"
#include "platform/linux/capture/PcapSession.h"

#include <vector>

namespace quendra::platform::linux_ {

/// The session that the capture library and its controls share, and the rules of when the event is raised:
/// - when packets have moved from the kernel to the queue;
/// - once more through the loop's queue after an event that took frames and left some.
/// On a silent line the descriptor is watched. Once it has rung, a timer looks for packets as long as there
/// are some: a busy line rings twenty times a second and not with every block of the kernel, as each ring
/// costs the loop more than a hundred frames do. During an event nothing is served, so that a handler which
/// merely yields is not entered again from here; the kernel's ring does the waiting. While a box or a modal
/// form stands that was opened in an event, that could take minutes: then events go on inside it.
class LinuxCaptureCore : public std::enable_shared_from_this<LinuxCaptureCore> {
 public:
  LinuxCaptureCore(EventLoop& loop, DescriptorWatch& descriptors, PcapLibrary library)
      : loop_(loop), descriptors_(descriptors), library_(std::move(library)) {}

  /// Lists the adapters and fixes the number of indexes for good.
  void CountAdapters();
  /// 0 without the library.
  int Indexes() const { return indexes_; }
  /// During a session the list stands: what the user chooses from must be what he sees.
  void ListAdaptersAfresh();
  const std::vector<CaptureAdapter>& Adapters() const { return adapters_; }
  /// nullptr beyond the indexes.
  const CaptureAdapter* AdapterAt(int index) const;
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
  const PcapRecord* Newest() const { return queue_.Newest(); }

  CaptureCounters Counters() const;

 private:
  class Event;

  void ListAdapters();
  const std::string& CurrentName() const;
  void Open();
  void Close();
  void OpenSession();
  void CloseSession();
  void LinksChanged();
  bool FollowsLink() const;
  void TakeUpLink();
  void AwaitAddress();
  bool HasSession() const { return session_ != nullptr && !session_->Failed(); }
  bool HasFailed() const { return session_ != nullptr && session_->Failed(); }
  bool MayRing() const;
  void UpdateBell();
  /// Whether an event is under way that no box or modal form holds up.
  bool Busy() const;
  void StartPace();
  void DescriptorReady();
  void LookAgain();
  bool Serve();
  bool Gather(int batches);
  void MakeRoom();
  void Ring();
  void RingAgain();

  EventLoop& loop_;
  DescriptorWatch& descriptors_;
  const PcapLibrary library_;
  std::vector<CaptureAdapter> adapters_;
  int indexes_ = 0;
  CaptureLibrary::Availability listed_ =
      CaptureLibrary::Availability::NoAdapters; // when adapters were listed
  int current_ = -1;
  bool begun_ = false;

  PcapFrameQueue queue_;
  std::unique_ptr<PcapSession> session_;
  std::unique_ptr<LinkWatch> links_; // from begin to end
  unsigned link_ = 0;                // the number of the interface that the session was opened on, 0 for none
  bool gone_ = false;                // the session waits for its interface
  bool awaitsAddress_ = false;       // the interface has come back without one
  CaptureCounters earlier_;          // of sessions that were closed; droppedByQueue of all

  CaptureControl* control_ = nullptr;
  std::string controlAdapter_;
  std::unique_ptr<EventLoop::Subscription> watch_; // on a silent line
  std::unique_ptr<EventLoop::Subscription> pace_;  // on a busy line; never both
  bool secondRingPosted_ = false;
  Event* event_ = nullptr; // the innermost one under way
  PcapRecord frame_{};     // what was taken last outside of events
};

} // namespace quendra::platform::linux_
