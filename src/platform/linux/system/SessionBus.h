#pragma once

#include "platform/linux/system/BusLibrary.h"

#include <memory>

namespace quendra::platform::linux_ {

/// A connection to the session's bus, for single questions. Each waits for its answer, and the connection for
/// being let in, a second at most where nothing else is said.
class SessionBus {
 public:
  static constexpr std::uint64_t kSecond = 1'000'000;

  /// Where a question goes, and how long it waits.
  struct Method {
    const char* destination;
    const char* path;
    const char* interface;
    const char* member;
    std::uint64_t microseconds = kSecond;
  };
  /// Nothing where no answer came, or a refusal.
  using Answer = std::unique_ptr<void, void* (*)(void*)>;

  SessionBus();

  /// The arguments as the bus library takes them: their types as letters, then each as it is.
  template <typename... Arguments>
  Answer Ask(const Method& method, const char* types, Arguments... arguments) const {
    void* reply = nullptr;
    const bool answered = bus_ && library_.set_method_call_timeout(bus_.get(), method.microseconds) >= 0 &&
                          library_.call_method(bus_.get(), method.destination, method.path, method.interface,
                                               method.member, nullptr, &reply, types, arguments...) >= 0;
    return {answered ? reply : nullptr, library_.message_unref};
  }
  /// For what reads an answer.
  const BusLibrary& Library() const { return library_; }

 private:
  BusLibrary library_;
  std::unique_ptr<void, void* (*)(void*)> bus_{nullptr, nullptr};
};

} // namespace quendra::platform::linux_
