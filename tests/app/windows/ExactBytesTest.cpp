#include "app/Program.h"
#include "app/windows/LoopbackRecording.h"
#include "app/windows/PortTalker.h"
#include "forms/win32/Win32Driver.h"
#include "monitor/ProcessRow.h"
#include "platform/ReplacedFamilies.h"
#include "platform/windows/WindowsMachine.h"
#include "platform/windows/capture/StandInWpcapFixture.h"
#include "platform/windows/capture/WindowsCapture.h"

#include <gtest/gtest.h>

#include <deque>
#include <iostream>
#include <map>
#include <set>

// Programs that talk over loopback, with the ports that Windows XP gives to programs, and what the whole
// program charges to their rows. The frames are those that the system below Wine saw pass; the capture
// library of the tests hands them on from the file of their recording. Who owns which port the program asks
// Wine.

namespace quendra::app::windows {
namespace {

/// Bytes of a process, sent and received.
struct Totals {
  std::int64_t upload = 0;
  std::int64_t download = 0;

  friend bool operator==(const Totals&, const Totals&) = default;
  friend std::ostream& operator<<(std::ostream& out, const Totals& totals) {
    return out << totals.upload << " up, " << totals.download << " down";
  }
};

using ByProcess = std::map<DWORD, Totals>;

class ExactBytes : public testing::Test {
 protected:
  ExactBytes() {
    wpcap.script.devices.push_back(
        {.name = "\\Device\\NPF_Loopback", .description = "Loopback", .file = ToCodePage(recording.File())});
    user.Win32().Show(program.frmMenu);
    user.Click(program.frmMenu.lblCaption[shell::kMonitorPage]);
  }

  std::string OwnAddress() const { return ToUtf8(program.ownAddresses.LocalAddressLast); }
  /// Two addresses that no other run on this machine is likely to use at the same time.
  static std::string AddressOfThisRun(unsigned last) {
    LARGE_INTEGER ticks{};
    ::QueryPerformanceCounter(&ticks);
    static const auto run = static_cast<std::uint32_t>(ticks.QuadPart ^ ticks.QuadPart >> 16);
    return platform::Ipv4Address::FromHost(0x7F400000U | (run & 0x3FFFU) << 8 | last).AsAscii();
  }

  /// Two processes, one of which calls the other.
  void Connect(const std::string& caller, const std::string& server, const Requests& requests) {
    talkers.push_back(PortTalker::Server(ports, server, requests));
    const unsigned port = talkers.back().Port();
    talkers.push_back(PortTalker::Caller(ports, caller, requests, server, port));
    said[port] = std::uint64_t(requests.count) * static_cast<unsigned>(requests.reply);
    said[talkers.back().Port()] = std::uint64_t(requests.count) * static_cast<unsigned>(requests.request);
  }

  /// A good while, for others may keep this machine busy.
  bool Await(const std::function<bool()>& condition) {
    constexpr int kTries = 12; // of five seconds
    for (int i = 0; i < kTries; ++i)
      if (user.WaitUntil(condition)) return true;
    return false;
  }

  void Pass() {
    program.processTable.LastRefreshTick = static_cast<std::int32_t>(::GetTickCount() - 1000);
    program.processTable.RefreshProcessTable({});
  }
  bool StandsInItsRow(const PortTalker& talker) {
    const forms::ListRow* row = List().Find(monitor::KeyOfProcess(talker.Process()));
    return row &&
           row->CellText(monitor::kPortsCell).find(u"." + DecimalText(talker.Port()) + u".") != Text::npos;
  }
  bool PutPortsInRows() {
    return Await([&] {
      Pass();
      return std::ranges::all_of(talkers, [&](const PortTalker& one) { return StandsInItsRow(one); });
    });
  }

  /// Has all of them say what they have to, with everything recorded.
  bool Talk() {
    std::vector<std::string> ends;
    for (const PortTalker& talker : talkers) ends.push_back(talker.End());
    if (!recording.Begin(ends)) return false;
    std::set<unsigned> done;
    begin.Set();
    const bool isSaid = Await([&] {
      for (const PortTalker& talker : talkers)
        if (talker.IsDone()) done.insert(talker.Port());
      return done.size() == said.size();
    });
    return recording.End() && isSaid;
  }

  /// The running totals of all rows that have any.
  ByProcess Rows() {
    ByProcess rows;
    for (int i = 1; i <= List().Count(); ++i) {
      forms::ListRow& row = List().Row(i);
      const Totals totals{BytesOf(row.CellTag(monitor::kUploadCell)),
                          BytesOf(row.CellTag(monitor::kDownloadCell))};
      if (totals != Totals{}) rows[static_cast<DWORD>(monitor::ProcessIdOfKey(row.Key()))] = totals;
    }
    return rows;
  }
  static std::int64_t BytesOf(const Variant& kilobytes) {
    return kilobytes.IsEmpty() ? 0 : static_cast<std::int64_t>(kilobytes.Number() * 1024.0);
  }

  /// What these come to: an upload of the port that sent it where the machine's own address did, else a
  /// download of the port that got it.
  ByProcess Charged(const std::vector<LoopbackFrame>& frames) {
    const auto own = platform::Ipv4Address::FromText(std::string_view(OwnAddress()));
    std::map<unsigned, DWORD> owners;
    for (const PortTalker& talker : talkers) owners[talker.Port()] = talker.Process();
    ByProcess charged;
    for (const LoopbackFrame& frame : frames)
      if (frame.source == own)
        charged[owners.at(frame.sourcePort)].upload += frame.bytes;
      else
        charged[owners.at(frame.targetPort)].download += frame.bytes;
    return charged;
  }

  forms::ListView& List() { return program.monitorPage.table.main_ListView1; }

  LoopbackRecording recording;
  platform::windows::StandInWpcap wpcap;
  forms::win32::Win32Driver user;
  const platform::windows::IpHelperLibrary ipHelper;
  platform::windows::WindowsCapture capture{user.Win32(), ipHelper,
                                            platform::windows::StandInWpcap::Library()};
  platform::windows::WindowsMachine machine{user.Win32()};
  Program program{
      platform::WithReplaced(machine.Operations(), {.captureControls = &capture, .captureLibrary = &capture}),
      user.Win32()};
  const TalkBegin begin;
  FreePorts ports;
  std::deque<PortTalker> talkers;
  std::map<unsigned, std::uint64_t> said; ///< bytes that each port has to send
};

/// Each byte once, however often it was sent.
std::map<unsigned, std::uint64_t> PayloadsByPort(const std::vector<LoopbackFrame>& frames) {
  std::map<unsigned, std::uint64_t> payloads;
  std::set<std::pair<unsigned, std::uint32_t>> seen;
  for (const LoopbackFrame& frame : frames)
    if (frame.payload > 0 && seen.emplace(frame.sourcePort, frame.sequence).second)
      payloads[frame.sourcePort] += frame.payload;
  return payloads;
}

TEST_F(ExactBytes, Of_programs_that_talk_over_loopback_stand_in_their_rows_and_in_no_others) {
  const std::string here = AddressOfThisRun(1), there = AddressOfThisRun(2);
  // Without a network the program knows no address of the machine, and takes everything for a download.
  const bool hasNetwork = !OwnAddress().empty();
  const std::string own = hasNetwork ? OwnAddress() : here;
  Connect(own, there, {150, 100, 1000}); // as with another machine
  Connect(here, there, {4, 70'000, 5});
  Connect(own, own, {30, 7, 40'000});
  // Neither says a word: one has a port, too, the other none.
  talkers.push_back(PortTalker::Server(ports, there, {1, 1, 1}));
  const StartedProgram idle(FolderOfBuild() + u"\\idle_program.exe");
  ASSERT_TRUE(program.captureSession.CaptureRunning);
  ASSERT_TRUE(PutPortsInRows());

  ASSERT_TRUE(Talk());

  const std::vector<LoopbackFrame> frames = recording.Frames();
  const ByProcess charged = Charged(frames);
  Await([&] { return capture.Counters().received == frames.size() && Rows() == charged; });
  for (const auto& [process, totals] : charged) std::cout << "process " << process << ": " << totals << "\n";
  EXPECT_EQ(Rows(), charged);
  EXPECT_EQ(charged.size(), hasNetwork ? 5U : 6U); // the other machine's row has none
  EXPECT_EQ(PayloadsByPort(frames), said);
  EXPECT_EQ(capture.Counters().received, frames.size());
  EXPECT_EQ(program.packetAttribution.MalformedFrames(), 0U);
  Pass();
  EXPECT_NE(List().Find(monitor::KeyOfProcess(idle.Id())), nullptr);
  EXPECT_EQ(Rows(), charged);
}

} // namespace
} // namespace quendra::app::windows
