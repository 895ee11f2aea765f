#include "platform/linux/network_manager/NetworkManagerBus.h"

#include "platform/linux/network_manager/NetworkManagerNames.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <string_view>
#include <utility>

namespace quendra::platform::linux_ {

namespace {

using Time = std::chrono::steady_clock;

constexpr std::uint64_t kSecond = 1'000'000;
constexpr std::uint64_t kPatience = 5 * kSecond;
/// Of a question that may be put to the user first.
constexpr std::uint64_t kLongPatience = 120 * kSecond;
constexpr int kTickMilliseconds = 250;
/// A bus lets each of its clients have so many open questions and no more; its own limit is 128.
constexpr std::size_t kMostOpen = 64;

constexpr const char* kBus = "org.freedesktop.DBus";
constexpr std::string_view kNoOwner = "org.freedesktop.DBus.Error.NameHasNoOwner";

constexpr std::array kRules{
    "type='signal',sender='org.freedesktop.DBus',member='NameOwnerChanged',"
    "arg0='org.freedesktop.NetworkManager'",
    "type='signal',sender='org.freedesktop.NetworkManager',"
    "interface='org.freedesktop.NetworkManager.Settings.Connection',member='Updated'",
    "type='signal',sender='org.freedesktop.NetworkManager',"
    "interface='org.freedesktop.NetworkManager.Connection.Active',member='StateChanged'",
    "type='signal',sender='org.freedesktop.NetworkManager',"
    "interface='org.freedesktop.NetworkManager.Device',member='StateChanged'",
    "type='signal',sender='org.freedesktop.NetworkManager',"
    "interface='org.freedesktop.NetworkManager.VPN.Connection',member='VpnStateChanged'",
};

/// Failures of the way to the service, in place of which its own would stand.
constexpr std::array<std::string_view, 6> kNobodyThere{
    "org.freedesktop.DBus.Error.ServiceUnknown", "org.freedesktop.DBus.Error.NameHasNoOwner",
    "org.freedesktop.DBus.Error.NoReply",        "org.freedesktop.DBus.Error.Timeout",
    "org.freedesktop.DBus.Error.Disconnected",   "org.freedesktop.DBus.Error.NoServer",
};

/// How each of NetworkManager's interfaces, and the bus, end the name of a refusal for want of a right.
constexpr std::array<std::string_view, 3> kForbidden{".PermissionDenied", ".AccessDenied", ".NotAuthorized"};

BusAnswer Refusal(const std::string& name) {
  const bool nobody = name.starts_with("System.Error.") ||
                      name.starts_with("org.freedesktop.DBus.Error.Spawn.") ||
                      std::ranges::find(kNobodyThere, name) != kNobodyThere.end();
  return {nobody ? BusAnswer::Kind::NobodyThere : BusAnswer::Kind::Refused, {}, name};
}

std::uint64_t LeftUntil(Time::time_point end) {
  const auto left = std::chrono::duration_cast<std::chrono::microseconds>(end - Time::now()).count();
  return left > 0 ? static_cast<std::uint64_t>(left) : 0;
}

} // namespace

bool BusAnswer::IsForbidden() const {
  return kind == Kind::Refused &&
         std::ranges::any_of(kForbidden, [this](std::string_view ending) { return error.ends_with(ending); });
}

const BusValue& BusAnswer::First() const {
  static const BusValue nothing;
  return values.empty() ? nothing : values.front();
}

/// A question whose reply is awaited. The bus library keeps its address.
struct NetworkManagerBus::Pending {
  NetworkManagerBus& bus;
  Reply reply;
  bool isQueued; ///< the reply is handed on with the signals, not at once
  std::unique_ptr<void, void* (*)(void*)> slot{nullptr, nullptr};
};

NetworkManagerBus::NetworkManagerBus(EventLoop& loop, DescriptorWatch& descriptors)
    : loop_(loop), descriptors_(descriptors) {}

NetworkManagerBus::~NetworkManagerBus() {
  pending_.clear();
  bus_.reset();
}

bool NetworkManagerBus::IsOpen() { return bus_ || Open(); }

bool NetworkManagerBus::Open() {
  if (!library_) library_.emplace();
  void* opened = nullptr;
  if (!library_->isThere || library_->open_system(&opened) < 0) return false;
  bus_ = {opened, library_->close_unref};
  bool isUsable =
      library_->LetsUsIn(opened, kSecond) && library_->set_method_call_timeout(opened, kSecond) >= 0;
  for (const char* rule : kRules)
    isUsable = isUsable && library_->add_match(opened, nullptr, rule, TakeSignal, this) >= 0;
  if (!isUsable || !FindManager()) {
    bus_.reset();
    return false;
  }
  watch_ = descriptors_.WatchDescriptor(library_->get_fd(opened), [this] { HandleArrived(); });
  return true;
}

/// False when the bus doesn't tell.
bool NetworkManagerBus::FindManager() {
  manager_.clear();
  BusFailure failure;
  void* reply = nullptr;
  const int told = library_->call_method(bus_.get(), kBus, "/org/freedesktop/DBus", kBus, "GetNameOwner",
                                         &failure, &reply, "s", nm::kService);
  const std::unique_ptr<void, void* (*)(void*)> message{reply, library_->message_unref};
  const bool isNobody = failure.name && std::string_view(failure.name) == kNoOwner;
  library_->error_free(&failure);
  if (told < 0) return isNobody;
  if (const auto owner = ReadValue(*library_, reply)) manager_ = owner->text;
  return true;
}

const std::string& NetworkManagerBus::Manager() {
  if (!IsOpen()) manager_.clear();
  return manager_;
}

void NetworkManagerBus::Drop() {
  watch_.reset();
  const auto lost = std::exchange(pending_, {});
  for (const auto& pending : lost)
    if (pending->isQueued)
      arrived_.push_back([reply = pending->reply] { reply(BusAnswer()); });
    else
      pending->reply(BusAnswer());
  for (const auto& pending : lost) pending->slot.reset();
  bus_.reset();
  manager_.clear();
  arrived_.push_back([this] {
    for (const auto& listener : listeners_) listener({.member = "NameOwnerChanged"});
  });
  HandleSoon();
}

void NetworkManagerBus::Process() {
  while (bus_) {
    const int handled = library_->process(bus_.get(), nullptr);
    if (handled < 0) Drop();
    if (handled <= 0) return;
  }
}

int NetworkManagerBus::TakeReply(void* message, void* context, BusFailure*) {
  auto* pending = static_cast<Pending*>(context);
  NetworkManagerBus& bus = pending->bus;
  const auto found = std::ranges::find(bus.pending_, pending, &std::unique_ptr<Pending>::get);
  if (found == bus.pending_.end()) return 0;
  const auto done = std::move(*found);
  bus.pending_.erase(found);
  BusAnswer answer = bus.AnswerOf(message);
  if (done->isQueued)
    bus.arrived_.push_back([reply = done->reply, answer = std::move(answer)] { reply(answer); });
  else
    done->reply(answer);
  return 0;
}

/// The bus hands on what any client sends to this one by name, whatever the rules say.
bool NetworkManagerBus::IsBelieved(const BusSignal& signal, const char* sender) const {
  return sender && sender == (signal.TellsOfAnotherManager() ? std::string_view(kBus) : manager_);
}

int NetworkManagerBus::TakeSignal(void* message, void* context, BusFailure*) {
  auto* bus = static_cast<NetworkManagerBus*>(context);
  const auto text = [](const char* from) { return std::string(from ? from : ""); };
  const BusSignal signal{text(bus->library_->message_get_path(message)),
                         text(bus->library_->message_get_interface(message)),
                         text(bus->library_->message_get_member(message)), bus->ValuesOf(message)};
  if (!bus->IsBelieved(signal, bus->library_->message_get_sender(message))) return 0;
  // Of its name, the former owner, the new one.
  if (signal.TellsOfAnotherManager()) bus->manager_ = signal.values.size() == 3 ? signal.values[2].text : "";
  bus->arrived_.push_back([bus, signal] {
    for (const auto& listener : bus->listeners_) listener(signal);
  });
  return 0;
}

std::vector<BusValue> NetworkManagerBus::ValuesOf(void* message) const {
  std::vector<BusValue> values;
  while (auto value = ReadValue(*library_, message)) values.push_back(std::move(*value));
  return values;
}

BusAnswer NetworkManagerBus::AnswerOf(void* message) const {
  const BusFailure* failure = library_->message_get_error(message);
  if (failure && failure->name) return Refusal(failure->name);
  return {BusAnswer::Kind::Given, ValuesOf(message), {}};
}

BusAnswer::Kind NetworkManagerBus::Start(const BusQuestion& question, Reply reply, bool isQueued,
                                         std::uint64_t patience) {
  if (!IsOpen()) return BusAnswer::Kind::NobodyThere;
  void* made = nullptr;
  if (library_->message_new_method_call(bus_.get(), &made, nm::kService, question.path.c_str(),
                                        question.interface, question.member) < 0)
    return BusAnswer::Kind::Refused;
  const std::unique_ptr<void, void* (*)(void*)> message{made, library_->message_unref};
  for (const BusValue& argument : question.arguments)
    if (!AppendValue(*library_, made, argument)) return BusAnswer::Kind::Refused;
  auto pending = std::make_unique<Pending>(Pending{*this, std::move(reply), isQueued});
  void* slot = nullptr;
  if (library_->call_async(bus_.get(), &slot, made, TakeReply, pending.get(), patience) < 0) {
    Drop();
    return BusAnswer::Kind::NobodyThere;
  }
  pending->slot = {slot, library_->slot_unref};
  pending_.push_back(std::move(pending));
  return BusAnswer::Kind::Given;
}

BusAnswer NetworkManagerBus::Ask(const BusQuestion& question) { return Await({question}, kPatience).front(); }

BusAnswer NetworkManagerBus::AskForChange(const BusQuestion& question) {
  return Await({question}, kLongPatience).front();
}

std::vector<BusAnswer> NetworkManagerBus::AskAll(const std::vector<BusQuestion>& questions) {
  return Await(questions, kPatience);
}

std::vector<BusAnswer> NetworkManagerBus::Await(const std::vector<BusQuestion>& questions,
                                                std::uint64_t patience) {
  std::vector<BusAnswer> answers(questions.size());
  const auto end = Time::now() + std::chrono::microseconds(patience);
  std::size_t started = 0, done = 0;
  // False where nobody is there: each further question would take as long to find that out.
  const auto startMore = [&] {
    while (started < questions.size() && started - done < kMostOpen && LeftUntil(end) > 0) {
      const std::size_t at = started++;
      const auto kind = Start(
          questions[at], [&, at](const BusAnswer& answer) { answers[at] = answer, ++done; }, false, patience);
      if (kind == BusAnswer::Kind::NobodyThere) return false;
      if (kind == BusAnswer::Kind::Refused) answers[at].kind = kind, ++done;
    }
    return true;
  };
  while (done < questions.size() && startMore()) {
    Process();
    const std::uint64_t left = LeftUntil(end);
    if (left == 0) break;
    if (done < started && bus_) library_->wait(bus_.get(), left);
  }
  // Those that were given up must not write into what is gone.
  std::erase_if(pending_, [](const auto& pending) { return !pending->isQueued; });
  HandleSoon();
  return answers;
}

void NetworkManagerBus::AskLater(const BusQuestion& question, Reply reply) {
  const auto kind = Start(question, reply, true, kLongPatience);
  if (kind != BusAnswer::Kind::Given)
    arrived_.push_back([reply = std::move(reply), kind] { reply(BusAnswer{kind, {}, {}}); });
  // What is never answered is told of when its time is over.
  if (!timer_) timer_ = loop_.StartTimer(kTickMilliseconds, [this] { HandleArrived(); });
  HandleSoon();
}

void NetworkManagerBus::HandleArrived() {
  Process();
  while (!arrived_.empty()) {
    const auto handle = std::move(arrived_.front());
    arrived_.pop_front();
    handle();
  }
  if (pending_.empty()) timer_.reset();
}

void NetworkManagerBus::Wait(std::uint64_t microseconds) {
  Process();
  if (arrived_.empty() && bus_) library_->wait(bus_.get(), microseconds);
  HandleArrived();
}

void NetworkManagerBus::Listen(Listener listener) { listeners_.push_back(std::move(listener)); }

void NetworkManagerBus::HandleSoon() {
  if (*isHandledSoon_) return;
  *isHandledSoon_ = true;
  loop_.Post([this, weak = std::weak_ptr(isHandledSoon_)] {
    const auto isHandledSoon = weak.lock();
    if (!isHandledSoon) return;
    *isHandledSoon = false;
    HandleArrived();
  });
}

} // namespace quendra::platform::linux_
