#include "platform/capture/ScriptedLines.h"

#include <algorithm>
#include <utility>

namespace quendra::platform {

/// What a subscription calls from the loop, unless it has gone by then.
class ScriptedLines::Bell : public EventLoop::Subscription {
 public:
  Bell(EventLoop& loop, std::vector<Bell*>& bells, std::function<void()> ring)
      : loop_(loop), bells_(bells), ring_(std::make_shared<std::function<void()>>(std::move(ring))) {
    bells_.push_back(this);
  }
  ~Bell() override { std::erase(bells_, this); }

  void Ring() {
    loop_.Post([weak = std::weak_ptr(ring_)] {
      if (const auto ring = weak.lock()) (*ring)();
    });
  }

 private:
  EventLoop& loop_;
  std::vector<Bell*>& bells_;
  std::shared_ptr<std::function<void()>> ring_;
};

class ScriptedLines::Source : public FrameSource {
 public:
  Source(ScriptedLines& lines, const Line& line, FrameShaper& shaper)
      : lines_(lines), adapter_(line.adapter), shaper_(shaper) {
    ++lines_.openSources;
    ++lines_.opened;
  }
  ~Source() override { --lines_.openSources; }

  int Fill() override {
    Line* line = FindLine();
    if (line == nullptr || line->failsAlways || std::exchange(line->fails, false)) return -1;
    int count = 0;
    for (; count < kBatch && !line->waiting.empty(); ++count) {
      const auto packet = std::move(line->waiting.front());
      line->waiting.pop_front();
      shaper_.Deliver({7, 8}, packet, static_cast<std::uint32_t>(packet.size()));
    }
    lines_.largestFill = std::max(lines_.largestFill, static_cast<std::size_t>(count));
    return count;
  }
  std::uint64_t Dropped() const override {
    const Line* line = FindLine();
    return line != nullptr ? line->dropped : 0;
  }
  std::unique_ptr<EventLoop::Subscription> Watch(std::function<void()> ready) override {
    if (lines_.pace_ == Pace::Timer) return lines_.loop_.StartTimer(kTimerMilliseconds, std::move(ready));
    auto bell = std::make_unique<Bell>(lines_.loop_, lines_.bells_, std::move(ready));
    if (const Line* line = FindLine(); line != nullptr && !line->waiting.empty()) bell->Ring();
    return bell;
  }

 private:
  /// nullptr for one that has gone, also when another one bears its name.
  Line* FindLine() const {
    Line* line = lines_.Find(adapter_.name);
    return line != nullptr && line->isUp && line->adapter.number == adapter_.number ? line : nullptr;
  }

  ScriptedLines& lines_;
  const LiveAdapter adapter_;
  FrameShaper& shaper_;
};

class ScriptedLines::Adapters : public CaptureAdapters {
 public:
  explicit Adapters(ScriptedLines& lines) : lines_(lines) {}

  bool HasLibrary() const override { return lines_.hasLibrary; }
  bool MayCapture() const override { return lines_.mayCapture; }
  std::vector<LiveAdapter> List() const override {
    std::vector<LiveAdapter> adapters;
    for (const auto& [name, line] : lines_.lines_)
      if (line.isUp) adapters.push_back(line.adapter);
    return adapters;
  }
  unsigned NumberIfUp(const std::string& name) const override {
    const Line* line = lines_.Find(name);
    return line != nullptr && line->isUp ? line->adapter.number : 0;
  }
  Ipv4Address AddressOf(const std::string& name) const override {
    const Line* line = lines_.Find(name);
    return line != nullptr ? line->address : Ipv4Address();
  }
  std::unique_ptr<FrameSource> Open(const std::string& name, FrameShaper& shaper) override {
    const Line* line = lines_.Find(name);
    if (line == nullptr || !lines_.mayCapture || !lines_.knowsItsLinks) return nullptr;
    shaper.SetForm(line->form);
    return std::make_unique<Source>(lines_, *line, shaper);
  }
  std::unique_ptr<EventLoop::Subscription> Watch(std::function<void()> changed) override {
    return std::make_unique<Bell>(lines_.loop_, lines_.changeBells_, std::move(changed));
  }

 private:
  ScriptedLines& lines_;
};

ScriptedLines::Line& ScriptedLines::Add(const std::string& name, const std::string& address) {
  Line line;
  line.adapter = {name, "Line (" + name + ")", ++lastNumber_};
  line.address = Ipv4Address::FromText(std::string_view(address)).value_or(Ipv4Address());
  Line& added = lines_[name] = std::move(line);
  TellOfChange();
  return added;
}

void ScriptedLines::Remove(const std::string& name) {
  lines_.erase(name);
  TellOfChange();
}

void ScriptedLines::Change(const std::string& name, const std::function<void(Line&)>& change) {
  change(lines_.at(name));
  TellOfChange();
}

void ScriptedLines::Arrive(const std::string& name, const std::vector<integration::Bytes>& packets) {
  auto& waiting = lines_.at(name).waiting;
  waiting.insert(waiting.end(), packets.begin(), packets.end());
  for (Bell* bell : bells_) bell->Ring();
}

ScriptedLines::Line* ScriptedLines::Find(const std::string& name) {
  const auto found = lines_.find(name);
  return found == lines_.end() ? nullptr : &found->second;
}

std::unique_ptr<CaptureAdapters> ScriptedLines::MakeAdapters() { return std::make_unique<Adapters>(*this); }

void ScriptedLines::TellOfChange() {
  for (Bell* bell : changeBells_) bell->Ring();
}

} // namespace quendra::platform
