// What the socket class costs: downloads from a loopback server through it and prints user and system time.
//   socket-download take PORT            the handler takes the data as it comes
//   socket-download leave PORT           the handler leaves the data in the object's buffer
//   socket-download many PORT COUNT      COUNT sockets of one object, all at once, each taking its data

#include "forms/headless/posix/PolledDesktop.h"
#include "foundation/CSocketPlus.h"
#include "platform/linux/net/LinuxHostNames.h"
#include "platform/linux/net/LinuxSockets.h"

#include <sys/resource.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>

using namespace quendra;

namespace {

constexpr int kMostMilliseconds = 100'000;

struct Download {
  forms::headless::PolledDesktop desktop;
  platform::linux_::ProcFolder folder{"/proc"};
  platform::linux_::LinuxHostNames hostNames{folder};
  platform::linux_::LinuxSockets library{desktop, desktop, hostNames};
  foundation::modSocketPlus module{library, hostNames, desktop};
  foundation::CSocketPlus sockets{module};
  bool take = true;
  int open = 0;
  int failed = 0;
  long long bytes = 0;

  void Listen() {
    auto& events = sockets.Events;
    events.Connect = [this](const Variant& index) {
      sockets.SendData(index, Text(u"GET / HTTP/1.1\r\nHost: localhost\r\nConnection: Close\r\n\r\n"));
    };
    events.DataArrival = [this](const Variant& index, std::int32_t) {
      if (!take) return;
      Variant data;
      sockets.GetData(index, data);
      bytes += static_cast<long long>(data.Find<ByteArray>()->size());
    };
    events.CloseSck = [this](const Variant& index) {
      if (!take) bytes += sockets.BytesReceived(index);
      Close(index);
    };
    events.Error = [this](const Variant& index, auto&&...) {
      ++failed;
      Close(index);
    };
  }

  void Close(Variant index) {
    sockets.CloseSck(index);
    --open;
  }

  void Start(int count, const Variant& port) {
    for (open = 0; open < count; ++open) sockets.Connect(sockets.ArrayAdd(), Text(u"127.0.0.1"), port);
  }
};

double Seconds(const timeval& time) {
  return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / 1e6;
}

} // namespace

int main(int argc, char** argv) {
  if (argc < 3) return 2;
  Download download;
  download.take = std::strcmp(argv[1], "leave") != 0;
  download.Listen();
  download.Start(argc > 3 ? std::atoi(argv[3]) : 1, static_cast<std::int32_t>(std::atoi(argv[2])));
  const bool ended = download.desktop.WaitFor([&] { return download.open == 0; }, kMostMilliseconds);
  rusage usage{};
  getrusage(RUSAGE_SELF, &usage);
  std::printf("%lld bytes, %d failed, user %.3f s, system %.3f s, peak %ld KB\n", download.bytes,
              download.failed, Seconds(usage.ru_utime), Seconds(usage.ru_stime), usage.ru_maxrss);
  return ended && download.failed == 0 ? 0 : 1;
}
