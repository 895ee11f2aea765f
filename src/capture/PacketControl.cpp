#include "capture/PacketControl.h"

#include "runtime/Fault.h"

namespace quendra::capture {

namespace {

/// Counts an event as under way for as long as it is.
class EventUnderWay {
 public:
  explicit EventUnderWay(int& count) : count_(count) { ++count_; }
  ~EventUnderWay() { --count_; }
  EventUnderWay(const EventUnderWay&) = delete;
  EventUnderWay& operator=(const EventUnderWay&) = delete;

 private:
  int& count_;
};

} // namespace

void PacketControl::Create() {
  Retire();
  vpacket = controls_.Create();
  vpacket->PacketReceived = [this, sender = ++controlsMade_] { OnPacketReceived(sender); };
}

platform::CaptureControl& PacketControl::Get() const {
  if (!vpacket) throw Fault(Fault::kObjectNotSet);
  return *vpacket;
}

/// A control that may be raising its event right now lives on until that is over.
void PacketControl::Retire() {
  if (!vpacket) return;
  if (eventsUnderWay_ == 0)
    vpacket.reset();
  else
    retired_.push_back(std::move(vpacket));
}

void PacketControl::OnPacketReceived(int sender) {
  if (sender != controlsMade_) return;
  if (eventsUnderWay_ == 0) retired_.clear();
  const EventUnderWay event(eventsUnderWay_);
  vpacket_PacketReceived();
}

} // namespace quendra::capture
