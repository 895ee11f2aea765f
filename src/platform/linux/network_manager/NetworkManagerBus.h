#pragma once

#include "platform/DescriptorWatch.h"
#include "platform/linux/network_manager/BusValue.h"

#include <cstdint>
#include <deque>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

struct BusQuestion {
  std::string path;
  const char* interface;
  const char* member;
  std::vector<BusValue> arguments{};
};

struct BusAnswer {
  enum class Kind { Given, Refused, NobodyThere };

  Kind kind = Kind::NobodyThere;
  std::vector<BusValue> values{};
  std::string error{}; ///< the name of a refusal

  bool IsGiven() const { return kind == Kind::Given; }
  /// Refused for want of a right.
  bool IsForbidden() const;
  /// An empty text where there is none.
  const BusValue& First() const;
};

struct BusSignal {
  std::string path{};
  std::string interface {};
  std::string member{};
  std::vector<BusValue> values{};

  /// NetworkManager, or the bus with it, has come or gone: nothing that was known of it holds any more.
  bool TellsOfAnotherManager() const { return member == "NameOwnerChanged"; }
};

/// NetworkManager on the system's bus. The connection is made by the first question; one that breaks is made
/// anew by the next. A question waits a few seconds at most for its answer, and two minutes at most where the
/// system may put it to the user first.
class NetworkManagerBus {
 public:
  using Reply = std::function<void(const BusAnswer&)>;
  using Listener = std::function<void(const BusSignal&)>;

  NetworkManagerBus(EventLoop& loop, DescriptorWatch& descriptors);
  ~NetworkManagerBus();
  NetworkManagerBus(const NetworkManagerBus&) = delete;

  BusAnswer Ask(const BusQuestion& question);
  /// The same for one that the system may put to the user first.
  BusAnswer AskForChange(const BusQuestion& question);
  /// Many at a time.
  std::vector<BusAnswer> AskAll(const std::vector<BusQuestion>& questions);
  /// For one that may be put to the user, too. The reply comes from the loop, or from one of the next two
  /// calls.
  void AskLater(const BusQuestion& question, Reply reply);
  /// Hands on what has come.
  void HandleArrived();
  /// Waits for something to come, that long at most, and hands it on.
  void Wait(std::uint64_t microseconds);
  /// Hears of changes from now on, as long as this object lives. Only NetworkManager itself is heard, and of
  /// its coming and going the bus.
  void Listen(Listener listener);
  /// Which NetworkManager it is: its own name on the bus, another one whenever it is started. Empty where
  /// there is none.
  const std::string& Manager();

 private:
  struct Pending;

  static int TakeReply(void* message, void* pending, BusFailure* failure);
  static int TakeSignal(void* message, void* self, BusFailure* failure);

  bool IsOpen();
  bool Open();
  bool FindManager();
  bool IsBelieved(const BusSignal& signal, const char* sender) const;
  void Drop();
  void Process();
  std::vector<BusAnswer> Await(const std::vector<BusQuestion>& questions, std::uint64_t patience);
  BusAnswer::Kind Start(const BusQuestion& question, Reply reply, bool isQueued, std::uint64_t patience);
  void HandleSoon();
  BusAnswer AnswerOf(void* message) const;
  std::vector<BusValue> ValuesOf(void* message) const;

  EventLoop& loop_;
  DescriptorWatch& descriptors_;
  std::optional<BusLibrary> library_;
  std::unique_ptr<void, void* (*)(void*)> bus_{nullptr, nullptr};
  std::string manager_;
  std::vector<std::unique_ptr<Pending>> pending_;
  std::deque<std::function<void()>> arrived_;
  std::vector<Listener> listeners_;
  std::unique_ptr<EventLoop::Subscription> watch_;
  std::unique_ptr<EventLoop::Subscription> timer_;
  std::shared_ptr<bool> isHandledSoon_ = std::make_shared<bool>(false);
};

} // namespace quendra::platform::linux_
