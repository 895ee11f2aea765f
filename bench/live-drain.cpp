// The program's capture backend alone: its events drained through vpCapture, without decoders, rows and
// window.
//
//   live-drain LINK

#include "platform/linux/LinuxCapture.h"

#include <csignal>
#include <cstdio>
#include <cstring>
#include <deque>
#include <poll.h>

namespace {

using namespace quendra;

volatile std::sig_atomic_t ended = 0;

/// The least of a loop: one descriptor and what was posted.
class PollLoop : public platform::EventLoop {
 public:
  void Post(std::function<void()> work) override { posted_.push_back(std::move(work)); }
  std::unique_ptr<Subscription> WatchDescriptor(int descriptor, std::function<void()> ready) override {
    watch_ = std::make_shared<Watch>(Watch{descriptor, std::move(ready)});
    return std::make_unique<Ending>(*this);
  }
  std::unique_ptr<Subscription> StartTimer(int, std::function<void()>) override { return nullptr; }
  void PumpOnce() override { Pump(0); }

  void Pump(int milliseconds) {
    for (; !posted_.empty(); posted_.pop_front()) std::function<void()>(posted_.front())();
    const auto watch = watch_;
    pollfd polled{watch ? watch->descriptor : -1, POLLIN, 0};
    if (poll(&polled, 1, milliseconds) > 0) watch->ready();
  }

 private:
  struct Watch {
    int descriptor;
    std::function<void()> ready;
  };
  class Ending : public Subscription {
   public:
    explicit Ending(PollLoop& loop) : loop_(loop) {}
    ~Ending() override { loop_.watch_.reset(); }

   private:
    PollLoop& loop_;
  };
  std::shared_ptr<Watch> watch_;
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
  platform::linux_::LinuxCapture capture(loop);
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
