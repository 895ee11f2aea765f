// The program's capture backend alone: its events drained through vpCapture, without decoders, rows and
// window.
//
//   live-drain LINK

#include "platform/linux/capture/LinuxCapture.h"

#include <array>
#include <csignal>
#include <cstdio>
#include <cstring>
#include <deque>
#include <poll.h>
#include <vector>

namespace {

using namespace quendra;

volatile std::sig_atomic_t ended = 0;

/// The least of a loop: two descriptors, one timer and what was posted.
class PollLoop : public platform::EventLoop, public platform::DescriptorWatch {
 public:
  void Post(std::function<void()> work) override { posted_.push_back(std::move(work)); }
  std::unique_ptr<Subscription> WatchDescriptor(int descriptor, std::function<void()> ready) override {
    auto& place = watches_.front() ? watches_.back() : watches_.front();
    return Keep(place, {descriptor, std::move(ready)});
  }
  std::unique_ptr<Subscription> StartTimer(int milliseconds, std::function<void()> tick) override {
    return Keep(timer_, {milliseconds, std::move(tick)});
  }
  void PumpOnce() override { Pump(0); }
  int ModalDepth() const override { return 0; }

  void Pump(int milliseconds) {
    for (; !posted_.empty(); posted_.pop_front()) std::function<void()>(posted_.front())();
    const auto watches = watches_;
    const auto timer = timer_;
    std::vector<pollfd> polled;
    for (const auto& watch : watches) polled.push_back({watch ? watch->number : -1, POLLIN, 0});
    const int ready = poll(polled.data(), polled.size(), timer ? timer->number : milliseconds);
    for (std::size_t i = 0; i < watches.size() && ready > 0; ++i)
      if (watches[i] && polled[i].revents != 0) watches[i]->call();
    if (ready == 0 && timer) timer->call();
  }

 private:
  struct Source {
    int number;
    std::function<void()> call;
  };
  class Ending : public Subscription {
   public:
    explicit Ending(std::shared_ptr<Source>& source) : source_(source) {}
    ~Ending() override { source_.reset(); }

   private:
    std::shared_ptr<Source>& source_;
  };

  static std::unique_ptr<Subscription> Keep(std::shared_ptr<Source>& place, Source source) {
    place = std::make_shared<Source>(std::move(source));
    return std::make_unique<Ending>(place);
  }

  std::array<std::shared_ptr<Source>, 2> watches_; // of the machine's links and of the frames
  std::shared_ptr<Source> timer_;
  std::deque<std::function<void()>> posted_;
};

int IndexOf(platform::CaptureLibrary& library, const char* link) {
  const int last = library.VBPcapInit();
  for (int index = 0; index <= last; ++index) {
    platform::AdapterInfo info;
    library.vpGetAdapterInfo(static_cast<std::int16_t>(index), info);
    if (std::strcmp(info.AdapterName.data(), link) == 0) return index;
  }
  return -1;
}

} // namespace

int main(int argc, char** argv) {
  PollLoop loop;
  platform::linux_::LinuxCapture capture(loop, loop);
  const int adapter = argc == 2 ? IndexOf(capture, argv[1]) : -1;
  if (adapter < 0) {
    std::fprintf(stderr, "usage: live-drain LINK (needs the right to capture)\n");
    return 1;
  }
  std::signal(SIGTERM, [](int) { ended = 1; });
  std::uint64_t frames = 0;
  std::uint64_t bytes = 0;
  auto control = capture.Create();
  control->PacketReceived = [&] {
    platform::FrameBytes frame;
    platform::CaptureHeader header{};
    while (capture.vpCapture(frame, header) > 0) {
      ++frames;
      bytes += header[3];
    }
  };
  capture.vpSetCurrentAdapter(static_cast<std::int16_t>(adapter));
  capture.vpBegin(1000);
  std::int32_t result = 0;
  control->BindAdapter(argv[1], result);
  control->OpenChannel(result);
  control->StartEvents(result);
  while (!ended) loop.Pump(1000);
  std::printf("%llu frames %llu bytes\n", static_cast<unsigned long long>(frames),
              static_cast<unsigned long long>(bytes));
  return 0;
}
