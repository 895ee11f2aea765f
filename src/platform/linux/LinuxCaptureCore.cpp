#include "platform/linux/LinuxCaptureCore.h"

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint8_t kBlankFrame[60] = {};
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
    availability_ = Availability::NoLibrary;
    return;
  }
  adapters_ = ListCaptureAdapters(library_);
  // What is listed when there is nothing to list is down.
  availability_ = NumberOfAdapterThatIsUp(adapters_.front().name) == 0 ? Availability::NoAdapters
                  : MayCapture()                                       ? Availability::Available
                                                                       : Availability::NoRights;
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
  if (!HasSession()) Open();
}

void LinuxCaptureCore::End() {
  begun_ = false;
  Close();
}

void LinuxCaptureCore::Open() {
  Close();
  if (!CurrentName().empty()) session_ = PcapSession::Open(library_, CurrentName(), queue_);
  UpdateBell();
}

void LinuxCaptureCore::Close() {
  watch_.reset();
  pace_.reset();
  if (session_ != nullptr) {
    const auto statistics = session_->GetStatistics();
    earlier_.received += statistics.received;
    earlier_.droppedByKernel += statistics.dropped;
  }
  session_.reset();
  queue_.Clear();
}

std::int32_t LinuxCaptureCore::Capture(FrameBytes& frame, CaptureHeader& header) {
  frame = FrameBytes(kBlankFrame, sizeof kBlankFrame);
  if (queue_.Empty()) {
    if (!HasSession()) return -1;
    queue_.Rewind();
    if (session_->Fill() < 0) return -1;
  }
  const PcapRecord* record = queue_.Pop();
  if (record == nullptr) return 0;
  ++taken_;
  frame = FrameBytes(record->bytes.data(), static_cast<int>(record->captured));
  header = {record->seconds, record->microseconds, record->captured, record->wire, 0, 0};
  return static_cast<std::int32_t>(record->captured);
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
    return;
  }
  if (watch_ != nullptr || pace_ != nullptr) return;
  watch_ = loop_.WatchDescriptor(session_->Descriptor(), [weak = weak_from_this()] {
    if (const auto core = weak.lock()) core->DescriptorReady();
  });
}

void LinuxCaptureCore::DescriptorReady() {
  watch_.reset();
  if (!MayRing()) return;
  pace_ = loop_.StartTimer(kPaceMilliseconds, [weak = weak_from_this()] {
    if (const auto core = weak.lock()) core->LookAgain();
  });
  if (!inEvent_ && !secondRingPosted_) Serve();
}

void LinuxCaptureCore::LookAgain() {
  if (inEvent_ || secondRingPosted_ || Serve()) return;
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
  bool moved = false;
  for (int batch = 0; batch < batches; ++batch) {
    MakeRoom();
    const int count = session_->Fill();
    moved = moved || count > 0;
    if (count < PcapSession::kBatch) break;
  }
  if (moved) Ring();
  return moved;
}

/// Frames that many events have left wait in vain; the oldest go first.
void LinuxCaptureCore::MakeRoom() {
  if (queue_.Room() >= PcapSession::kRoomOfBatch) return;
  queue_.DiscardOldest(PcapSession::kRoomOfBatch);
  earlier_.droppedByQueue += PcapSession::kRoomOfBatch;
}

/// Marks an event as under way, also when its handler ends by an exception.
class LinuxCaptureCore::Event {
 public:
  explicit Event(LinuxCaptureCore& core) : core_(core) {
    core_.inEvent_ = true;
    core_.taken_ = 0;
  }
  ~Event() { core_.inEvent_ = false; }
  Event(const Event&) = delete;
  Event& operator=(const Event&) = delete;

 private:
  LinuxCaptureCore& core_;
};

void LinuxCaptureCore::Ring() {
  // The control may go while its own event runs, so its handler is held here.
  const auto handler = control_->PacketReceived;
  if (handler) {
    const Event event(*this);
    try {
      handler();
    } catch (const Fault& fault) {
      if (fault.number != Fault::kSubscript) throw;
      ++earlier_.rejected;
    }
  }
  if (taken_ > 0 && !queue_.Empty() && MayRing()) {
    secondRingPosted_ = true;
    loop_.Post([weak = weak_from_this()] {
      if (const auto core = weak.lock()) core->RingAgain();
    });
  }
  UpdateBell();
}

void LinuxCaptureCore::RingAgain() {
  secondRingPosted_ = false;
  if (MayRing() && !inEvent_ && !queue_.Empty())
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
