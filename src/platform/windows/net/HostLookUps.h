#pragma once

#include "platform/EventLoop.h"
#include "platform/net/Sockets.h"
#include "platform/windows/net/SocketLibrary.h"

#include <array>
#include <cstddef>
#include <list>
#include <memory>

namespace quendra::platform::windows {

/// Look-ups of names that the system runs; the relay window hears how each ended.
class HostLookUps {
 public:
  HostLookUps(const SocketLibrary& library, EventLoop& loop) : library_(library), loop_(loop) {}
  ~HostLookUps();
  HostLookUps(const HostLookUps&) = delete;
  HostLookUps& operator=(const HostLookUps&) = delete;

  /// Whom to tell, and where to.
  struct Asker {
    WindowHandle window;
    std::uint32_t message = 0;
    std::span<std::uint8_t> buffer;
  };
  /// The relay will get `relayed` as the message of the look-up's end. kNoLookUp on failure, for a reason
  /// that the library has.
  LookUpHandle Start(HWND relay, UINT relayed, const std::string& name, const Asker& asker);
  /// False when it isn't under way any more.
  bool Cancel(LookUpHandle lookUp);
  void CancelAll();
  void OnEnd(HANDLE request, LPARAM result);

  /// How many the system may still write about: those under way, and cancelled ones.
  std::size_t Held() const { return underWay_.size(); }
  /// So many of those that the system has agreed to stop are held: no end of them is told, and one of the
  /// system's threads may just be writing.
  static constexpr std::ptrdiff_t kMostStopped = 16;

 private:
  using Block = std::array<char, MAXGETHOSTSTRUCT>;
  struct LookUp {
    LookUpHandle handle;
    HANDLE request = nullptr;
    Asker asker;
    std::unique_ptr<Block> found;
    bool isCancelled = false;
    bool isStopped = false; ///< no message will tell its end
  };

  void LetOldStoppedOnesGo();

  const SocketLibrary& library_;
  EventLoop& loop_;
  std::list<LookUp> underWay_;
  std::uint32_t last_ = 0;
};

} // namespace quendra::platform::windows
