#pragma once

#include "app/windows/StartedProgram.h"

#include <memory>
#include <string>

namespace quendra::app::windows {

/// How many requests go one way, and the bytes of each and of the reply to it.
struct Requests {
  int count = 0, request = 0, reply = 0;
};

/// An event of the system, for programs that know its name.
class NamedEvent {
 public:
  explicit NamedEvent(const std::string& name, bool isForMany = false);
  ~NamedEvent() { ::CloseHandle(event_); }
  NamedEvent(const NamedEvent&) = delete;

  void Set() const { ::SetEvent(event_); }
  bool IsSet() const { return ::WaitForSingleObject(event_, 0) == WAIT_OBJECT_0; }

 private:
  HANDLE event_;
};

/// Lets all talkers begin that wait.
class TalkBegin : public NamedEvent {
 public:
  TalkBegin() : NamedEvent("begin", true) {}
};

/// The ports that Windows XP gives to programs, each of which goes to one talker whatever its address.
struct FreePorts {
  unsigned lowest = 1025;
  unsigned highest = 5000;
};

/// A process of its own that talks over TCP by one port, the first that is free: those that call take the
/// lowest, those that serve the highest.
class PortTalker {
 public:
  /// It listens.
  static PortTalker Server(FreePorts& ports, const std::string& address, const Requests& requests);
  /// It is connected, and waits until it may begin.
  static PortTalker Caller(FreePorts& ports, const std::string& address, const Requests& requests,
                           const std::string& server, unsigned serverPort);

  unsigned Port() const { return port_; }
  /// ADDRESS:PORT
  const std::string& End() const { return end_; }
  DWORD Process() const { return program_->Id(); }
  /// Whether all is said, which it tells once.
  bool IsDone() const { return told_->IsSet(); }

 private:
  PortTalker(const char* role, const std::string& address, unsigned port, const std::string& words);
  static PortTalker OnFreePort(const char* role, const std::string& address,
                               const std::function<unsigned()>& next, const std::string& words);

  unsigned port_;
  std::string end_;
  std::unique_ptr<NamedEvent> told_;
  std::unique_ptr<StartedProgram> program_;
};

} // namespace quendra::app::windows
