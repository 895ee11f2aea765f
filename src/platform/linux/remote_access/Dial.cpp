#include "platform/linux/remote_access/Dial.h"

#include "platform/linux/network_manager/NetworkManagerNames.h"
#include "platform/linux/remote_access/ActiveLines.h"
#include "platform/process/SystemErrors.h"
#include "platform/remote_access/RemoteAccessNumbers.h"

#include <utility>

namespace quendra::platform::linux_ {

namespace {

/// More than these have not come from one dial.
constexpr std::size_t kMostEarly = 1000;

std::uint64_t NumberAt(const std::vector<BusValue>& values, std::size_t index) {
  return index < values.size() ? values[index].number : 0;
}

/// What a refusal to begin means: there is no device for the line, or no plugin.
std::uint32_t ErrorOfRefusal(const BusAnswer& answer) {
  const std::uint32_t error = ErrorOf(answer);
  return error == kInvalidParameter ? std::uint32_t{kRasPortNotAvailable} : error;
}

} // namespace

Dial::Dial(NetworkManagerBus& bus, LineKind kind, std::function<KernelPpp()> kernel, Change change)
    : bus_(bus), kind_(kind), kernel_(std::move(kernel)), change_(std::move(change)) {}

void Dial::AskLater(const BusQuestion& question, void (Dial::*take)(const BusAnswer&)) {
  bus_.AskLater(question, [weak = weak_from_this(), take](const BusAnswer& answer) {
    if (const auto dial = weak.lock()) (dial.get()->*take)(answer);
  });
}

void Dial::Start(const std::string& connectionPath) {
  change_(kRasOpenPort, 0);
  manager_ = bus_.Manager();
  // One that is hung up or given up meanwhile lives until the answer has come, so that what it asked for
  // ends.
  bus_.AskLater(
      {nm::kManagerPath,
       nm::kManager,
       "ActivateConnection",
       {BusValue::Path(connectionPath), BusValue::Path(nm::kNoObject), BusValue::Path(nm::kNoObject)}},
      [self = shared_from_this()](const BusAnswer& answer) { self->TakeActive(answer); });
}

void Dial::TakeActive(const BusAnswer& answer) {
  if (!answer.IsGiven()) return End(ErrorOfRefusal(answer));
  activePath_ = answer.First().text;
  if (isHungUp_ || stage_ == Stage::Ended) {
    stage_ = Stage::Ended;
    return bus_.AskLater(QuestionOfEnd(activePath_), [](const BusAnswer&) {});
  }
  AskLater({activePath_, nm::kProperties, "GetAll", {BusValue::Text(nm::kActive)}}, &Dial::TakeProperties);
}

void Dial::TakeProperties(const BusAnswer& answer) {
  ValueMap properties = ValueMapOf(answer.First());
  const BusValue& devices = properties["Devices"];
  if (!devices.items.empty()) devicePath_ = devices.items.front().text;
  isKnown_ = true;
  const bool hasGone = !answer.IsGiven();
  const auto early = std::exchange(early_, {});
  // Where the connection has gone already, the last device that failed was its own.
  for (const BusSignal& signal : early)
    if (hasGone && signal.interface == nm::kDevice && NumberAt(signal.values, 0) == nm::kDeviceFailed)
      devicePath_ = signal.path;
  for (const BusSignal& signal : early) Take(signal);
  if (answer.kind == BusAnswer::Kind::NobodyThere) return End(kRasManagerCannotStart);
  // What was reached before anybody listened.
  const std::uint64_t state = hasGone ? std::uint64_t{nm::kDeactivated} : properties["State"].number;
  if (state == nm::kActivated || state == nm::kDeactivated) TakeFromActive(state, 0);
}

void Dial::Take(const BusSignal& signal) {
  if (stage_ == Stage::Ended) return;
  if (signal.TellsOfAnotherManager()) return End(kRasManagerCannotStart);
  if (!isKnown_) {
    if (early_.size() < kMostEarly) early_.push_back(signal);
    return;
  }
  const std::uint64_t first = NumberAt(signal.values, 0), second = NumberAt(signal.values, 1);
  if (kind_ == LineKind::Pppoe && signal.interface == nm::kDevice && signal.path == devicePath_)
    TakeFromDevice(first, NumberAt(signal.values, 2));
  if (signal.path != activePath_) return;
  if (kind_ == LineKind::Vpn && signal.interface == nm::kVpnActive) TakeFromVpn(first, second);
  if (signal.interface == nm::kActive) TakeFromActive(first, second);
}

void Dial::TakeFromDevice(std::uint64_t state, std::uint64_t reason) {
  // The device may still be ending another connection: that this one has ended, it tells by itself.
  if (const auto reached = RasStateOfDevice(state)) {
    deviceReason_.reset();
    Reach(*reached);
  } else if (EndsLine(state) && !deviceReason_) {
    deviceReason_ = reason;
  }
}

void Dial::TakeFromVpn(std::uint64_t state, std::uint64_t reason) {
  if (const auto reached = RasStateOfVpn(state)) return Reach(*reached);
  if (state == nm::kVpnFailed || state == nm::kVpnDisconnected) End(RasErrorOfActive(reason, kernel_()));
}

void Dial::TakeFromActive(std::uint64_t state, std::uint64_t reason) {
  if (state == nm::kActivated) Reach(kRasConnected);
  if (state == nm::kDeactivated)
    End(deviceReason_ ? RasErrorOfDevice(*deviceReason_, kernel_()) : RasErrorOfActive(reason, kernel_()));
}

void Dial::Reach(std::uint32_t state) {
  // A line goes on only: what comes late tells nothing new.
  if (stage_ != Stage::Dialling || state == state_) return;
  state_ = state;
  if (state == kRasConnected) stage_ = Stage::Connected;
  if (!isHungUp_) change_(state, 0);
}

void Dial::End(std::uint32_t error) {
  if (stage_ == Stage::Ended) return;
  const bool isDropped = stage_ == Stage::Connected;
  stage_ = Stage::Ended;
  error_ = isDropped ? RasErrorOfDrop(error) : error;
  if (isDropped) state_ = kRasDisconnected;
  if (!isHungUp_) change_(state_, error_);
}

/// It was the way to the same NetworkManager that broke. Another one would know another line by that path.
bool Dial::MayStandUnseen() {
  return stage_ == Stage::Ended && error_ == kRasManagerCannotStart && bus_.Manager() == manager_;
}

std::uint32_t Dial::HangUp() {
  if (!activePath_.empty() && (stage_ != Stage::Ended || MayStandUnseen())) {
    if (const std::uint32_t error = EndActiveLine(bus_, activePath_)) return error;
    stage_ = Stage::Ended;
  }
  isHungUp_ = true;
  return kRasSuccess;
}

void Dial::CheckAlive() {
  if (stage_ == Stage::Ended) return;
  // Before it has answered it may be asking the user: then it answers others all the same.
  const auto answer = isKnown_
                          ? bus_.Ask({activePath_, nm::kProperties, "GetAll", {BusValue::Text(nm::kActive)}})
                          : bus_.Ask({nm::kManagerPath, nm::kManager, "GetDevices"});
  if (answer.kind == BusAnswer::Kind::NobodyThere) End(kRasManagerCannotStart);
  // What brought a connection to its end has been told before this answer.
  if (isKnown_ && answer.kind == BusAnswer::Kind::Refused) {
    bus_.HandleArrived();
    TakeFromActive(nm::kDeactivated, 0);
  }
}

} // namespace quendra::platform::linux_
