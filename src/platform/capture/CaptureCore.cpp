#include "platform/capture/CaptureCore.h"

#include <algorithm>
#include <utility>

namespace quendra::platform {

namespace {

constexpr int kPaceMilliseconds = 50;
// A source that fails as soon as it is opened is tried again at leisure.
constexpr int kRetryMilliseconds = 1000;
// So that a line faster than this loop doesn't keep it for ever.
constexpr int kMostBatches = 256;

} // namespace

/// An event under way, also when its handler ends by an exception. What it takes from the queue is its own:
/// events inside it use the queue meanwhile, and may even end the session.
class CaptureCore::Event {
 public:
  explicit Event(CaptureCore& core)
      : core_(core), outer_(std::exchange(core.event_, this)), modalDepth_(core.loop_.ModalDepth()) {}
  ~Event() {
    core_.event_ = outer_;
    if (outer_ != nullptr) outer_->taken += taken;
  }
  Event(const Event&) = delete;
  Event& operator=(const Event&) = delete;

  bool IsHeldUp() const { return core_.loop_.ModalDepth() > modalDepth_; }

  std::uint32_t taken = 0; ///< frames, also by events inside this one
  FrameRecord frame{};     ///< the last of its own

 private:
  CaptureCore& core_;
  Event* outer_;
  int modalDepth_;
};

CaptureCore::CaptureCore(EventLoop& loop, std::unique_ptr<CaptureAdapters> adapters,
                         std::uint32_t queueCapacity)
    : loop_(loop), adapters_(std::move(adapters)),
      queue_(std::max(queueCapacity, 2 * FrameSource::kRoomOfBatch)) {}

/// What the loop calls later, when the program may have ended capture for good.
std::function<void()> CaptureCore::Guarded(void (CaptureCore::*work)()) {
  return [weak = weak_from_this(), work] {
    if (const auto core = weak.lock()) (core.get()->*work)();
  };
}

void CaptureCore::ListAdaptersAfresh() {
  if (!begun_) indexes_.ListAfresh();
}

CaptureLibrary::Availability CaptureCore::Availability() const {
  using Availability = CaptureLibrary::Availability;
  const Availability listed = indexes_.Availability();
  if (listed == Availability::NoAdapters && session_.HasSource()) return Availability::Available;
  return listed == Availability::Available && gone_ ? Availability::AdapterGone : listed;
}

const std::string& CaptureCore::CurrentName() const {
  static const std::string none;
  const LiveAdapter* adapter = indexes_.At(current_);
  return adapter != nullptr ? adapter->name : none;
}

void CaptureCore::SelectAdapter(int adapter) {
  if (adapter == current_) return;
  Close();
  current_ = adapter;
  if (begun_) Open();
}

void CaptureCore::Begin() {
  begun_ = true;
  if (session_.IsLive()) return;
  changes_ = adapters_->Watch(Guarded(&CaptureCore::AdaptersChanged));
  Open();
}

void CaptureCore::End() {
  begun_ = false;
  changes_.reset();
  Close();
}

void CaptureCore::Open() {
  Close();
  OpenSession();
}

void CaptureCore::Close() {
  CloseSession();
  queue_.Clear();
  gone_ = awaitsAddress_ = false;
}

void CaptureCore::OpenSession() {
  session_.Open(CurrentName());
  gone_ = !session_.HasSource();
  UpdateBell();
}

void CaptureCore::CloseSession() {
  watch_.reset();
  pace_.reset();
  session_.Close();
}

/// Some adapter has come, gone or changed, perhaps the session's.
void CaptureCore::AdaptersChanged() {
  // What came before the adapter went is still to be charged.
  if (!session_.Follows(CurrentName()) && !Busy() && !secondRingPosted_) Serve();
  if (!begun_) return; // the event has left the page
  if (session_.Follows(CurrentName()))
    AwaitAddress();
  else
    TakeUpAdapter();
}

/// Frames that wait stay, for the drain that may be under way.
void CaptureCore::TakeUpAdapter() {
  const bool wasGone = gone_;
  if (session_.IsLive()) Gather(kMostBatches);
  CloseSession();
  OpenSession();
  if (wasGone && gone_) return;
  awaitsAddress_ = !gone_ && LacksAddress();
  OnAdapterChanged();
}

void CaptureCore::AwaitAddress() {
  if (!awaitsAddress_ || LacksAddress()) return;
  awaitsAddress_ = false;
  OnAdapterChanged();
}

std::int32_t CaptureCore::Capture(FrameBytes& frame, CaptureHeader& header) {
  frame = FrameBytes::Blank();
  if (queue_.Empty()) {
    if (!session_.IsLive()) return -1;
    queue_.Rewind();
    if (session_.Fill() < 0) {
      UpdateBell();
      return -1;
    }
  }
  const FrameRecord* next = queue_.Pop();
  if (next == nullptr) return 0;
  if (event_ != nullptr) ++event_->taken;
  FrameRecord& record = event_ != nullptr ? event_->frame : frame_;
  record = *next;
  frame = FrameBytes(record.bytes.data(), static_cast<int>(record.captured));
  header = {record.seconds, record.microseconds, record.captured, record.wire, 0, 0};
  return static_cast<std::int32_t>(record.captured);
}

void CaptureCore::Listen(CaptureControl& control, const std::string& adapterName) {
  control_ = &control;
  controlAdapter_ = adapterName;
  UpdateBell();
}

void CaptureCore::StopListening(const CaptureControl& control) {
  if (control_ != &control) return;
  control_ = nullptr;
  UpdateBell();
}

bool CaptureCore::MayRing() const {
  return control_ != nullptr && session_.IsLive() && controlAdapter_ == CurrentName();
}

void CaptureCore::UpdateBell() {
  if (!MayRing()) {
    watch_.reset();
    pace_.reset();
    if (session_.HasFailed()) StartPace();
    return;
  }
  if (watch_ != nullptr || pace_ != nullptr) return;
  watch_ = session_.Watch(Guarded(&CaptureCore::PacketsMayWait));
}

bool CaptureCore::Busy() const { return event_ != nullptr && !event_->IsHeldUp(); }

void CaptureCore::StartPace() {
  pace_.reset();
  const int pace = session_.FailsAgain() ? kRetryMilliseconds : kPaceMilliseconds;
  pace_ = loop_.StartTimer(pace, Guarded(&CaptureCore::LookAgain));
}

void CaptureCore::PacketsMayWait() {
  watch_.reset();
  if (!MayRing()) return UpdateBell();
  StartPace();
  if (!Busy() && !secondRingPosted_) Serve();
}

void CaptureCore::LookAgain() {
  // A timer doesn't tick inside its own tick, in which a box may come up that stands for long: hence another
  // one each time.
  StartPace();
  // The adapter may have been made again under its name and number before anybody looked.
  if (session_.HasFailed()) return AdaptersChanged();
  if (Busy() || secondRingPosted_ || Serve()) return;
  pace_.reset();
  UpdateBell();
}

/// False when no packet has come.
bool CaptureCore::Serve() {
  if (!MayRing()) return false;
  // One batch starts a drain, which takes the others from the system as it goes. After an event that took
  // none all of them move, so that the record by which the next event is judged is the newest there is.
  const int batches = queue_.Empty() ? 1 : kMostBatches;
  queue_.Rewind();
  const bool moved = Gather(batches);
  // An event that is held up may have left frames; nobody else comes for them while it is.
  if (moved || (event_ != nullptr && !queue_.Empty())) Ring();
  return moved;
}

/// False when the system had nothing.
bool CaptureCore::Gather(int batches) {
  bool moved = false;
  for (int batch = 0; batch < batches; ++batch) {
    MakeRoom();
    const int count = session_.Fill();
    moved = moved || count > 0;
    if (count < FrameSource::kBatch) break;
  }
  if (session_.HasFailed()) UpdateBell();
  return moved;
}

/// Frames that many events have left wait in vain; the oldest go first.
void CaptureCore::MakeRoom() {
  if (queue_.Room() >= FrameSource::kRoomOfBatch) return;
  queue_.DiscardOldest(FrameSource::kRoomOfBatch);
  droppedByQueue_ += FrameSource::kRoomOfBatch;
}

void CaptureCore::Ring() {
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
    loop_.Post(Guarded(&CaptureCore::RingAgain));
  }
  UpdateBell();
}

void CaptureCore::RingAgain() {
  secondRingPosted_ = false;
  if (MayRing() && !Busy() && !queue_.Empty())
    Ring();
  else
    UpdateBell();
}

CaptureCounters CaptureCore::Counters() const {
  CaptureCounters counters = session_.Counters();
  counters.droppedByQueue = droppedByQueue_;
  return counters;
}

} // namespace quendra::platform
