#include "platform/linux/capture/LinuxCaptureCore.h"

#include <algorithm>
#include <utility>

namespace quendra::platform::linux_ {

namespace {

/// How many adapters may come while the program runs: the indexes are counted once, but a page lists its
/// adapters at each opening. Until they come, their indexes repeat the last adapter, as a second mention adds
/// nothing to a list.
constexpr int kSpareIndexes = 16;
/// An index has 15 bits; far fewer are of use to anybody.
constexpr int kMostIndexes = 1024;
constexpr int kPaceMilliseconds = 50;
// So that a line faster than this loop doesn't keep it for ever.
constexpr int kMostBatches = 256;

} // namespace

/// An event under way, also when its handler ends by an exception. What it takes from the queue is its own:
/// events inside it use the queue meanwhile, and may even end the session.
class LinuxCaptureCore::Event {
 public:
  explicit Event(LinuxCaptureCore& core)
      : core_(core), outer_(std::exchange(core.event_, this)), modalDepth_(core.loop_.ModalDepth()) {}
  ~Event() {
    core_.event_ = outer_;
    if (outer_ != nullptr) outer_->taken += taken;
  }
  Event(const Event&) = delete;
  Event& operator=(const Event&) = delete;

  bool IsHeldUp() const { return core_.loop_.ModalDepth() > modalDepth_; }

  std::uint32_t taken = 0; ///< frames, also by events inside this one
  PcapRecord frame{};      ///< the last of its own

 private:
  LinuxCaptureCore& core_;
  Event* outer_;
  int modalDepth_;
};

void LinuxCaptureCore::CountAdapters() {
  ListAdapters();
  const int found = static_cast<int>(std::min<std::size_t>(adapters_.size(), kMostIndexes));
  indexes_ = found == 0 ? 0 : found + kSpareIndexes;
}

void LinuxCaptureCore::ListAdaptersAfresh() {
  if (!begun_ && indexes_ != 0) ListAdapters();
}

const CaptureAdapter* LinuxCaptureCore::AdapterAt(int index) const {
  if (index < 0 || index >= indexes_) return nullptr;
  return &adapters_[std::min<std::size_t>(index, adapters_.size() - 1)];
}

void LinuxCaptureCore::ListAdapters() {
  using Availability = CaptureLibrary::Availability;
  if (!library_.IsThere()) {
    listed_ = Availability::NoLibrary;
    return;
  }
  adapters_ = ListCaptureAdapters(library_);
  // What is listed when there is nothing to list is down.
  listed_ = NumberOfAdapterThatIsUp(adapters_.front().name) == 0 ? Availability::NoAdapters
            : MayCapture()                                       ? Availability::Available
                                                                 : Availability::NoRights;
}

CaptureLibrary::Availability LinuxCaptureCore::Availability() const {
  using Availability = CaptureLibrary::Availability;
  if (listed_ == Availability::NoAdapters && session_ != nullptr) return Availability::Available;
  return listed_ == Availability::Available && gone_ ? Availability::AdapterGone : listed_;
}

const std::string& LinuxCaptureCore::CurrentName() const {
  static const std::string none;
  const CaptureAdapter* adapter = AdapterAt(current_);
  return adapter != nullptr ? adapter->name : none;
}

void LinuxCaptureCore::SelectAdapter(int adapter) {
  if (adapter == current_) return;
  Close();
  current_ = adapter;
  if (begun_) Open();
}

void LinuxCaptureCore::Begin() {
  begun_ = true;
  if (HasSession()) return;
  links_ = std::make_unique<LinkWatch>(descriptors_, [weak = weak_from_this()] {
    if (const auto core = weak.lock()) core->LinksChanged();
  });
  Open();
}

void LinuxCaptureCore::End() {
  begun_ = false;
  links_.reset();
  Close();
}

void LinuxCaptureCore::Open() {
  Close();
  OpenSession();
}

void LinuxCaptureCore::Close() {
  CloseSession();
  queue_.Clear();
  gone_ = awaitsAddress_ = false;
}

void LinuxCaptureCore::OpenSession() {
  link_ = CurrentName().empty() ? 0 : NumberOfAdapterThatIsUp(CurrentName());
  if (link_ != 0) session_ = PcapSession::Open(library_, CurrentName(), queue_);
  gone_ = session_ == nullptr;
  UpdateBell();
}

void LinuxCaptureCore::CloseSession() {
  watch_.reset();
  pace_.reset();
  if (session_ != nullptr) {
    const auto statistics = session_->GetStatistics();
    earlier_.received += statistics.received;
    earlier_.droppedByKernel += statistics.dropped;
  }
  session_.reset();
}

/// Some interface has come, gone or changed, perhaps the session's.
void LinuxCaptureCore::LinksChanged() {
  // What came before the interface went is still to be charged.
  if (!FollowsLink() && !Busy() && !secondRingPosted_) Serve();
  if (!begun_) return; // the event has left the page
  if (FollowsLink())
    AwaitAddress();
  else
    TakeUpLink();
}

/// Whether the session is on the interface that bears its name now.
bool LinuxCaptureCore::FollowsLink() const {
  return NumberOfAdapterThatIsUp(CurrentName()) == link_ && HasSession() == (link_ != 0);
}

/// Frames that wait stay, for the drain that may be under way.
void LinuxCaptureCore::TakeUpLink() {
  const bool wasGone = gone_;
  if (HasSession()) Gather(kMostBatches);
  CloseSession();
  OpenSession();
  if (wasGone && gone_) return;
  awaitsAddress_ = !gone_ && AddressOfAdapter(CurrentName()).IsAny();
  OnAdapterChanged();
}

void LinuxCaptureCore::AwaitAddress() {
  if (!awaitsAddress_ || AddressOfAdapter(CurrentName()).IsAny()) return;
  awaitsAddress_ = false;
  OnAdapterChanged();
}

std::int32_t LinuxCaptureCore::Capture(FrameBytes& frame, CaptureHeader& header) {
  frame = FrameBytes::Blank();
  if (queue_.Empty()) {
    if (!HasSession()) return -1;
    queue_.Rewind();
    if (session_->Fill() < 0) return -1;
  }
  const PcapRecord* next = queue_.Pop();
  if (next == nullptr) return 0;
  if (event_ != nullptr) ++event_->taken;
  PcapRecord& record = event_ != nullptr ? event_->frame : frame_;
  record = *next;
  frame = FrameBytes(record.bytes.data(), static_cast<int>(record.captured));
  header = {record.seconds, record.microseconds, record.captured, record.wire, 0, 0};
  return static_cast<std::int32_t>(record.captured);
}

void LinuxCaptureCore::Listen(CaptureControl& control, const std::string& adapterName) {
  control_ = &control;
  controlAdapter_ = adapterName;
  UpdateBell();
}

void LinuxCaptureCore::StopListening(const CaptureControl& control) {
  if (control_ != &control) return;
  control_ = nullptr;
  UpdateBell();
}

bool LinuxCaptureCore::MayRing() const {
  return control_ != nullptr && HasSession() && controlAdapter_ == CurrentName();
}

void LinuxCaptureCore::UpdateBell() {
  if (!MayRing()) {
    watch_.reset();
    pace_.reset();
    if (HasFailed()) StartPace();
    return;
  }
  if (watch_ != nullptr || pace_ != nullptr) return;
  watch_ = descriptors_.WatchDescriptor(session_->Descriptor(), [weak = weak_from_this()] {
    if (const auto core = weak.lock()) core->DescriptorReady();
  });
}

bool LinuxCaptureCore::Busy() const { return event_ != nullptr && !event_->IsHeldUp(); }

void LinuxCaptureCore::StartPace() {
  pace_.reset();
  pace_ = loop_.StartTimer(kPaceMilliseconds, [weak = weak_from_this()] {
    if (const auto core = weak.lock()) core->LookAgain();
  });
}

void LinuxCaptureCore::DescriptorReady() {
  watch_.reset();
  if (!MayRing()) return;
  StartPace();
  if (!Busy() && !secondRingPosted_) Serve();
}

void LinuxCaptureCore::LookAgain() {
  // A timer doesn't tick inside its own tick, in which a box may come up that stands for long: hence another
  // one each time.
  StartPace();
  // The interface may have been made again under its name and number before anybody looked.
  if (HasFailed()) return LinksChanged();
  if (Busy() || secondRingPosted_ || Serve()) return;
  pace_.reset();
  UpdateBell();
}

/// False when no packet has come.
bool LinuxCaptureCore::Serve() {
  if (!MayRing()) return false;
  // One batch starts a drain, which takes the others from the kernel as it goes. Behind an event that took
  // none all of them move, so that the record by which the next event is judged is the newest there is.
  const int batches = queue_.Empty() ? 1 : kMostBatches;
  queue_.Rewind();
  const bool moved = Gather(batches);
  // An event that is held up may have left frames; nobody else comes for them while it is.
  if (moved || (event_ != nullptr && !queue_.Empty())) Ring();
  return moved;
}

/// False when the kernel had nothing.
bool LinuxCaptureCore::Gather(int batches) {
  bool moved = false;
  for (int batch = 0; batch < batches; ++batch) {
    MakeRoom();
    const int count = session_->Fill();
    moved = moved || count > 0;
    if (count < PcapSession::kBatch) break;
  }
  return moved;
}

/// Frames that many events have left wait in vain; the oldest go first.
void LinuxCaptureCore::MakeRoom() {
  if (queue_.Room() >= PcapSession::kRoomOfBatch) return;
  queue_.DiscardOldest(PcapSession::kRoomOfBatch);
  earlier_.droppedByQueue += PcapSession::kRoomOfBatch;
}

void LinuxCaptureCore::Ring() {
  // The control may go while its own event runs, so its handler is held here.
  const auto handler = control_->PacketReceived;
  std::uint32_t taken = 0;
  if (handler) {
    Event event(*this);
    handler();
    taken = event.taken;
  }
  if (taken > 0 && !queue_.Empty() && MayRing() && !secondRingPosted_) {
    secondRingPosted_ = true;
    loop_.Post([weak = weak_from_this()] {
      if (const auto core = weak.lock()) core->RingAgain();
    });
  }
  UpdateBell();
}

void LinuxCaptureCore::RingAgain() {
  secondRingPosted_ = false;
  if (MayRing() && !Busy() && !queue_.Empty())
    Ring();
  else
    UpdateBell();
}

CaptureCounters LinuxCaptureCore::Counters() const {
  CaptureCounters result = earlier_;
  if (session_ != nullptr) {
    const auto statistics = session_->GetStatistics();
    result.received += statistics.received;
    result.droppedByKernel += statistics.dropped;
  }
  return result;
}

} // namespace quendra::platform::linux_
