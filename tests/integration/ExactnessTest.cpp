#include "app/Program.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "integration/FrameLedger.h"
#include "integration/LinkedNamespaces.h"
#include "integration/Worker.h"
#include "monitor/ProcessRow.h"
#include "platform/linux/LinuxMachine.h"
#include "platform/linux/capture/LinuxCapture.h"

#include <cmath>
#include <deque>
#include <gtest/gtest.h>

namespace quendra::integration {

namespace {

constexpr std::uint64_t kTcpFrames = 1'000'000;
constexpr int kShortConnections = 500;

/// This host with its program and processes, another host, and a second capture on the link between them.
class Exactness : public testing::Test {
 protected:
  void SetUp() override {
    if (!NetworkNamespace::Possible()) GTEST_SKIP() << NetworkNamespace::kSkipReason;
    hosts.emplace();
    StartWorkers();
    ledger.emplace(LinkedNamespaces::kNearLink, LinkedNamespaces::kNearAddress);
    machine.emplace(desktop, desktop);
    program.emplace(machine->Operations(), desktop);
    program->Start();
    ASSERT_TRUE(desktop.Click(program->frmSplash.Label2));
    ASSERT_TRUE(desktop.Click(program->frmMenu.lblCaption[0]));
    ASSERT_TRUE(program->captureSession.CaptureRunning);
  }

  void TearDown() override {
    program.reset();
    machine.reset();
    ledger.reset();
    workers.clear();
    hosts.reset();
  }

  /// 200 connections: 160 from four processes here to two servers there, 40 from there to a server here.
  void StartWorkers() {
    const auto& near = hosts->Near();
    const auto& far = hosts->Far();
    workers.push_back(Worker::Server(far, LinkedNamespaces::kFarAddress, 80));
    workers.push_back(Worker::Server(far, LinkedNamespaces::kFarAddress, 7000));
    workers.push_back(Worker::Server(near, LinkedNamespaces::kNearAddress, 8080));
    Worker& localServer = workers.back();
    for (const std::uint16_t port : {80, 80, 7000, 7000})
      workers.push_back(Worker::Client(near, LinkedNamespaces::kFarAddress, port));
    bulk = {&workers[3], &workers[4]};
    interactive = {&workers[5], &workers[6]};
    workers.push_back(Worker::Client(far, LinkedNamespaces::kNearAddress, 8080));
    visitor = &workers.back();
    workers.push_back(Worker::Client(near, LinkedNamespaces::kFarAddress, 7000));
    datagrams = &workers.back();

    owners[8080] = localServer.Process();
    Connect(bulk, 20);
    Connect(interactive, 60);
    visitor->Tell({Order::Kind::Connect, 40});
    AwaitAnswer(*visitor);
  }

  void Connect(const std::vector<Worker*>& clients, int count) {
    for (Worker* client : clients) {
      client->Tell({Order::Kind::Connect, count});
      for (const std::uint16_t port : AwaitAnswer(*client).localPorts)
        ASSERT_TRUE(owners.emplace(port, client->Process()).second) << "port " << port << " has two owners";
    }
  }

  Answer AwaitAnswer(Worker& worker) {
    Answer answer;
    Await([&] { return worker.HasAnswered(answer); }, "a worker's answer");
    return answer;
  }

  void Await(const std::function<bool()>& condition, const char* what, int milliseconds = 30000) {
    if (!desktop.WaitFor(condition, milliseconds))
      throw std::runtime_error(std::string("waited in vain for ") + what);
  }

  /// Each of them has done as told. The program runs meanwhile.
  void AwaitAll(const std::vector<Worker*>& all) {
    for (Worker* worker : all) AwaitAnswer(*worker);
  }

  /// A short exchange on every connection that a process here has.
  void Trickle() {
    std::vector<Worker*> all = bulk;
    all.insert(all.end(), interactive.begin(), interactive.end());
    all.push_back(visitor);
    for (Worker* client : all) client->Tell({Order::Kind::Exchange, 1, 100, 100});
    AwaitAll(all);
  }

  platform::CaptureCounters Counters() { return machine->Capture().Counters(); }

  /// Both captures have seen the same TCP frames, and no more come.
  void AwaitSilence() {
    std::uint64_t before = 0;
    Await(
        [&] {
          before = ledger->TcpFrames();
          desktop.WaitFor([] { return false; }, 150);
          return ledger->TcpFrames() == before && Counters().received == before;
        },
        "silence on the link");
  }

  forms::ListRow* RowOf(pid_t process) {
    return program->monitorPage.table.main_ListView1.Find(
        monitor::KeyOfProcess(static_cast<std::uint32_t>(process)));
  }

  bool EveryPortStandsInItsRow() {
    for (const auto& [port, process] : owners) {
      const forms::ListRow* row = RowOf(process);
      if (row == nullptr) return false;
      if (row->CellText(monitor::kPortsCell).find(u"." + DecimalText(port) + u".") == Text::npos)
        return false;
    }
    return true;
  }

  static std::uint64_t BytesOf(const Variant& total) {
    const double bytes = total.IsEmpty() ? 0.0 : total.Number() * 1024.0;
    EXPECT_EQ(bytes, std::floor(bytes));
    return static_cast<std::uint64_t>(bytes);
  }

  /// The running totals of all rows that have any.
  std::map<pid_t, Totals> Rows() {
    std::map<pid_t, Totals> result;
    auto& list = program->monitorPage.table.main_ListView1;
    for (int i = 1; i <= list.Count(); ++i) {
      const auto& row = list.Row(i);
      const Totals totals{BytesOf(row.CellTag(monitor::kUploadCell)),
                          BytesOf(row.CellTag(monitor::kDownloadCell))};
      if (totals != Totals{}) result[static_cast<pid_t>(monitor::ProcessIdOfKey(row.Key()))] = totals;
    }
    return result;
  }

  /// Bulk both ways, interactive exchanges and visitors of the local server, all at once.
  void Round(int number) {
    const bool down = number % 2 == 0;
    for (Worker* client : bulk)
      client->Tell({Order::Kind::Exchange, 1, down ? 2000 : 300000, down ? 300000 : 200});
    for (Worker* client : interactive) client->Tell({Order::Kind::Exchange, 20, 50, 200});
    visitor->Tell({Order::Kind::Exchange, 1, 400, 30000});
    std::vector<Worker*> all = bulk;
    all.insert(all.end(), interactive.begin(), interactive.end());
    all.push_back(visitor);
    AwaitAll(all);
    // A round is far below what the kernel's rings hold: the captures catch up before the next one.
    const std::uint64_t seen = ledger->TcpFrames();
    Await([&] { return Counters().received >= seen; }, "the program's capture to catch up");
  }

  void PutEveryPortInItsRow() {
    for (int attempt = 0; attempt < 10 && !EveryPortStandsInItsRow(); ++attempt) {
      Trickle();
      desktop.WaitFor([&] { return EveryPortStandsInItsRow(); }, 500);
    }
    ASSERT_TRUE(EveryPortStandsInItsRow());
  }

  void ExpectNoDrops() {
    const auto counters = Counters();
    std::printf("drops: the program's capture %llu in the kernel, %llu in its queue; the "
                "second capture %llu\n",
                static_cast<unsigned long long>(counters.droppedByKernel),
                static_cast<unsigned long long>(counters.droppedByQueue),
                static_cast<unsigned long long>(ledger->Drops()));
    EXPECT_EQ(counters.droppedByKernel, 0u);
    EXPECT_EQ(counters.droppedByQueue, 0u);
    EXPECT_EQ(program->packetAttribution.MalformedFrames(), 0u);
    EXPECT_EQ(ledger->Drops(), 0u);
  }

  std::optional<LinkedNamespaces> hosts;
  std::deque<Worker> workers;
  std::vector<Worker*> bulk;
  std::vector<Worker*> interactive;
  Worker* visitor = nullptr;
  Worker* datagrams = nullptr;
  std::map<std::uint16_t, pid_t> owners;

  forms::headless::PolledDesktop desktop;
  std::optional<FrameLedger> ledger;
  std::optional<platform::linux_::LinuxMachine> machine;
  std::optional<app::Program> program;
};

std::map<pid_t, Totals> Difference(const std::map<pid_t, Totals>& now,
                                   const std::map<pid_t, Totals>& before) {
  std::map<pid_t, Totals> result;
  for (const auto& [process, totals] : now) {
    const auto old = before.find(process);
    const Totals grown = old == before.end() ? totals : totals - old->second;
    if (grown != Totals{}) result[process] = grown;
  }
  return result;
}

void Print(const char* who, const std::map<pid_t, Totals>& totals) {
  for (const auto& [process, one] : totals)
    std::printf("  %-18s process %7d   upload %12llu   download %12llu bytes\n", who, process,
                static_cast<unsigned long long>(one.upload), static_cast<unsigned long long>(one.download));
}

std::uint64_t SumOf(const std::map<pid_t, Totals>& totals) {
  std::uint64_t sum = 0;
  for (const auto& [process, one] : totals) sum += one.upload + one.download;
  return sum;
}

} // namespace

TEST_F(Exactness, The_rows_hold_to_the_byte_what_a_second_capture_adds_up_over_a_million_TCP_frames) {
  PutEveryPortInItsRow();
  AwaitSilence();
  const auto rowsBefore = Rows();
  const auto pageBefore = ledger->Read();

  int rounds = 0;
  bool datagramsGo = false;
  Answer ignored;
  while (ledger->TcpFrames() < pageBefore.tcpFrames + kTcpFrames) {
    if (!datagramsGo) datagrams->Tell({Order::Kind::Datagrams, 1000, 300, 0, 500});
    datagramsGo = true;
    Round(rounds++);
    if (datagrams->HasAnswered(ignored)) datagramsGo = false;
    ASSERT_LT(rounds, 500);
  }
  if (datagramsGo) AwaitAnswer(*datagrams);
  desktop.WaitFor([] { return false; }, 100);
  Trickle();
  AwaitSilence();

  const auto page = ledger->Read();
  const auto rows = Difference(Rows(), rowsBefore);
  const auto reference = Difference(ByProcess(page, owners), ByProcess(pageBefore, owners));
  std::printf("%llu TCP, %llu UDP, %llu ICMP frames in %d rounds\n",
              static_cast<unsigned long long>(page.tcpFrames - pageBefore.tcpFrames),
              static_cast<unsigned long long>(page.udpFrames - pageBefore.udpFrames),
              static_cast<unsigned long long>(page.icmpFrames - pageBefore.icmpFrames), rounds);
  Print("rows", rows);
  Print("second capture", reference);
  ExpectNoDrops();
  EXPECT_GE(page.tcpFrames - pageBefore.tcpFrames, kTcpFrames);
  EXPECT_GT(page.udpFrames - pageBefore.udpFrames, 1000u);
  EXPECT_GT(page.icmpFrames - pageBefore.icmpFrames, 200u);
  EXPECT_EQ(rows.size(), 5u);
  EXPECT_EQ(rows, reference);
}

TEST_F(Exactness, Short_connections_stay_uncharged_until_a_pass_has_seen_their_ports) {
  PutEveryPortInItsRow();
  AwaitSilence();
  const auto rowsBefore = Rows();
  const auto pageBefore = ledger->Read();

  for (Worker* client : interactive)
    client->Tell({Order::Kind::ShortConnections, kShortConnections / 2, 1000, 4000});
  AwaitAll(interactive);
  desktop.WaitFor([] { return false; }, 100);
  Trickle();
  AwaitSilence();

  const auto page = ledger->Read();
  std::uint64_t all = 0;
  for (const auto& [port, totals] : page.byPort) {
    const auto old = pageBefore.byPort.find(port);
    const Totals grown = old == pageBefore.byPort.end() ? totals : totals - old->second;
    all += grown.upload + grown.download;
  }
  const std::uint64_t long_ = SumOf(Difference(ByProcess(page, owners), ByProcess(pageBefore, owners)));
  const std::uint64_t charged = SumOf(Difference(Rows(), rowsBefore));
  std::printf("%d short connections: %llu bytes, of which %llu were charged; %.1f %% stayed uncharged\n",
              kShortConnections, static_cast<unsigned long long>(all - long_),
              static_cast<unsigned long long>(charged - long_),
              100.0 * static_cast<double>(all - charged) / static_cast<double>(all - long_));
  ExpectNoDrops();
  EXPECT_GT(all - long_, kShortConnections * 5000u);
  EXPECT_GE(charged, long_);
  EXPECT_LE(charged, all);
}

} // namespace quendra::integration
