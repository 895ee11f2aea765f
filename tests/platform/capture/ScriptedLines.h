#pragma once

#include "integration/Packets.h"
#include "platform/capture/CaptureAdapters.h"

#include <deque>
#include <map>

namespace quendra::platform {

/// How a scripted source tells that packets may wait: as soon as they do, as a descriptor would, or by a
/// timer of its own.
enum class Pace { Bell, Timer };

/// The adapters of a machine as a test says they are, with the packets that wait on each.
class ScriptedLines {
 public:
  struct Line {
    LiveAdapter adapter;
    Ipv4Address address;
    LinkForm form = LinkForm::Ethernet;
    bool isUp = true;
    std::deque<integration::Bytes> waiting{};
    bool fails = false;        ///< the next Fill does, which ends its source
    bool failsAlways = false;  ///< each Fill does
    std::uint64_t dropped = 0; ///< by the system, of the source that is open
  };

  ScriptedLines(EventLoop& loop, Pace pace) : loop_(loop), pace_(pace) {}

  bool hasLibrary = true;
  bool mayCapture = true;
  bool knowsItsLinks = true; ///< otherwise no source can be opened
  int openSources = 0;
  int opened = 0; ///< sources in all
  std::size_t largestFill = 0;

  /// An adapter comes, or comes again under its name and another number.
  Line& Add(const std::string& name, const std::string& address);
  void Remove(const std::string& name);
  void Change(const std::string& name, const std::function<void(Line&)>& change);
  void Arrive(const std::string& name, const std::vector<integration::Bytes>& packets);
  /// nullptr when it has none of that name.
  Line* Find(const std::string& name);

  /// For the adapters that are watched; they may be asked as long as the lines are there.
  std::unique_ptr<CaptureAdapters> MakeAdapters();

 private:
  class Adapters;
  class Source;
  class Bell;

  void TellOfChange();

  static constexpr int kTimerMilliseconds = 40;

  EventLoop& loop_;
  const Pace pace_;
  unsigned lastNumber_ = 0;
  std::map<std::string, Line> lines_;
  std::vector<Bell*> bells_;
  std::vector<Bell*> changeBells_;
};

} // namespace quendra::platform
