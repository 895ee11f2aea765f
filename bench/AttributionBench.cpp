// What a frame costs, from a recorded file of 1.5 million TCP frames: read by a bare loop, read and decoded,
// and drained, decoded and charged to a table of 300 rows with 5 ports each by the event of the capture
// control.

#include "capture/PacketAttribution.h"
#include "forms/headless/HeadlessDesktop.h"
#include "monitor/MonitorControls.h"
#include "monitor/ProcessRow.h"
#include "monitor/ProcessTable.h"
#include "platform/linux/system/LinuxSystem.h"
#include "platform/simulated/SimulatedMachine.h"

#include <benchmark/benchmark.h>
#include <fstream>
#include <iostream>
#include <pcap/pcap.h>

namespace quendra::capture {
namespace {

constexpr std::size_t kRows = 300;
const char* const kFile = QUENDRA_BENCH_FRAMES;

struct ClosePcap {
  void operator()(pcap_t* file) const { pcap_close(file); }
};
using PcapFile = std::unique_ptr<pcap_t, ClosePcap>;

PcapFile OpenFrames() {
  char error[PCAP_ERRBUF_SIZE] = "";
  PcapFile file(pcap_open_offline(kFile, error));
  if (!file) throw std::runtime_error(error);
  return file;
}

/// A capture library whose frames come from the file.
class OfflineCapture : public platform::simulated::SimulatedCapture {
 public:
  using SimulatedCapture::SimulatedCapture;

  void Rewind() { file_ = OpenFrames(); }

  std::int32_t vpCapture(platform::FrameBytes& frame, platform::CaptureHeader&) override {
    static constexpr std::uint8_t kBlank[60] = {};
    pcap_pkthdr* header = nullptr;
    const unsigned char* bytes = nullptr;
    if (pcap_next_ex(file_.get(), &header, &bytes) != 1) {
      frame = platform::FrameBytes(kBlank, sizeof kBlank);
      return 0;
    }
    frame = platform::FrameBytes(bytes, static_cast<int>(header->caplen));
    return static_cast<std::int32_t>(header->caplen);
  }

 private:
  PcapFile file_;
};

/// Nothing ever waits in the queue of this desktop.
class QuietDesktop : public forms::headless::HeadlessDesktop {
 public:
  void DoEvents() override { benchmark::ClobberMemory(); }
};

/// The program's capture side on a table of 300 processes.
class Program {
 public:
  Program() {
    addresses.LocalAddressLast = u"10.0.0.138";
    addresses.LocalAddressPrevious = u"192.168.7.1";
    control.Create();
    version.OsVersionCode = 2002;
    FillTable();
    PutNewestRecord();
  }

  /// One event that drains the whole file. `lastRefreshTick` decides whether a pass of the table is due in
  /// it.
  void Drain(std::int32_t lastRefreshTick) {
    table.LastRefreshTick = lastRefreshTick;
    attribution.vpacket_PacketReceived();
  }
  std::int32_t Now() { return static_cast<std::int32_t>(clock.GetTickCount()); }
  int Passes() const { return machine.processes.SnapshotsTaken; }

  double TotalOfAllRows() {
    double total = 0;
    for (int i = 1; i <= form.main_ListView1.Count(); ++i)
      for (const int cell : {monitor::kUploadCell, monitor::kDownloadCell})
        total += form.main_ListView1.Row(i).CellTag(cell).Number();
    return total;
  }

 private:
  /// Ports are dealt out to the rows in turn.
  void FillTable() {
    std::vector<Text> portsOf(kRows, u".");
    std::ifstream ports(std::string(kFile) + ".ports");
    std::size_t count = 0;
    for (int port = 0; ports >> port; ++count) portsOf[count % kRows] += DecimalText(port) + u".";
    for (std::uint32_t i = 0; i < kRows; ++i) {
      machine.AddProcess({i + 4, 1, "process" + std::to_string(i), ""});
      monitor::AddBareRow(form.main_ListView1, monitor::KeyOfProcess(i + 4), portsOf[i]);
    }
  }
  void PutNewestRecord() {
    std::vector<std::uint8_t> tcp(60);
    tcp[23] = 6;
    library.Deliver(tcp);
  }
  platform::simulated::Core core;

 public:
  platform::simulated::SimulatedMachine machine;
  platform::linux_::LinuxSystem clock;
  OfflineCapture library{core};
  QuietDesktop desktop;
  monitor::MonitorControls form;
  monitor::SystemVersion version{clock, desktop};
  monitor::mdlFileInfo fileInfo{machine.processes, machine.tokens, machine.versionInfo, desktop};
  monitor::modProcPort procPort{
      machine.ipHelper, {machine.processes, machine.handles}, desktop, form.main_ListView1, fileInfo};
  monitor::ProcessRowAdder adder{machine.icons, clock, desktop, form.table, fileInfo};
  monitor::PortSource ports{version, fileInfo, procPort};
  monitor::ProcessTable table{machine.processes, clock, form.table, adder, ports};
  HostAddresses host{machine.hostNames, machine.ipHelper};
  OwnAddresses addresses{host};
  PacketControl control{library};
  PacketAttribution attribution{library, desktop, control, addresses, table};
};

void ReportPerFrame(benchmark::State& state, double frames) {
  state.counters["frames"] = frames;
  state.counters["per_frame"] =
      benchmark::Counter(frames, benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert,
                         benchmark::Counter::kIs1000);
}

/// What the rows have to hold after one drain: found by ports in a plain map, without the program's classes.
double ExpectedTotal() {
  std::vector<bool> owned(65536);
  std::ifstream ports(std::string(kFile) + ".ports");
  for (std::size_t port = 0; ports >> port;) owned[port] = true;
  constexpr std::uint8_t kOwn[] = {10, 0, 0, 138};
  const PcapFile file = OpenFrames();
  pcap_pkthdr* header = nullptr;
  const unsigned char* bytes = nullptr;
  double total = 0;
  while (pcap_next_ex(file.get(), &header, &bytes) == 1) {
    const unsigned char* port = bytes + (std::equal(kOwn, kOwn + 4, bytes + 26) ? 34 : 36);
    if (owned[port[0] * 256u + port[1]]) total += (bytes[16] * 256 + bytes[17]) / 1024.0;
  }
  return total;
}

void BareLoopThatCounts(benchmark::State& state) {
  double frames = 0;
  for (auto _ : state) {
    state.PauseTiming();
    const PcapFile file = OpenFrames();
    state.ResumeTiming();
    pcap_pkthdr* header = nullptr;
    const unsigned char* bytes = nullptr;
    frames = 0;
    while (pcap_next_ex(file.get(), &header, &bytes) == 1) ++frames;
  }
  ReportPerFrame(state, frames);
}

void LoopThatDecodes(benchmark::State& state) {
  double frames = 0;
  for (auto _ : state) {
    state.PauseTiming();
    const PcapFile file = OpenFrames();
    FrameDecoders decoders;
    state.ResumeTiming();
    pcap_pkthdr* header = nullptr;
    const unsigned char* bytes = nullptr;
    frames = 0;
    while (pcap_next_ex(file.get(), &header, &bytes) == 1) {
      const platform::FrameBytes frame(bytes, static_cast<int>(header->caplen));
      decoders.ethernet.Decode(frame);
      decoders.ip.Decode(frame);
      decoders.tcp.Decode(frame, 4 * decoders.ip.TotalLength(), false);
      benchmark::DoNotOptimize(decoders);
      ++frames;
    }
  }
  ReportPerFrame(state, frames);
}

double FramesInFile() {
  const PcapFile file = OpenFrames();
  pcap_pkthdr* header = nullptr;
  const unsigned char* bytes = nullptr;
  double frames = 0;
  while (pcap_next_ex(file.get(), &header, &bytes) == 1) ++frames;
  return frames;
}

void DrainDecodeAttribute(benchmark::State& state, bool withPass) {
  Program program;
  double drains = 0;
  for (auto _ : state) {
    state.PauseTiming();
    program.library.Rewind();
    state.ResumeTiming();
    // A drain takes less than a second, so a pass comes once or not at all.
    program.Drain(program.Now() - (withPass ? 1000 : 0));
    ++drains;
  }
  if (program.TotalOfAllRows() != ExpectedTotal() * drains)
    state.SkipWithError("the rows don't hold what they have to");
  if (program.Passes() != (withPass ? drains : 0)) state.SkipWithError("not as many passes as meant");
  ReportPerFrame(state, FramesInFile());
}

BENCHMARK(BareLoopThatCounts)->Unit(benchmark::kMillisecond);
BENCHMARK(LoopThatDecodes)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(DrainDecodeAttribute, without_passes, false)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(DrainDecodeAttribute, with_one_pass_of_the_table, true)->Unit(benchmark::kMillisecond);

} // namespace
} // namespace quendra::capture

BENCHMARK_MAIN();
