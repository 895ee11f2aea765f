#include "report/ReportFixture.h"

#include "capture/TestFrames.h"

namespace quendra::report {
namespace {

/// A subscriber on the telephone: programs that talk, a pass that makes rates, and the table sent to the
/// agent.
class ReportScenario : public ReportTest {
 protected:
  ReportScenario() {
    machine.AddProcess({0, 0, "[System Process]", ""});
    machine.AddProcess({100, 1, "surf, fast.exe", "C:\\surf, fast.exe"});
    machine.AddProcess({200, 1, "\xE3\xE5\xE0\xF8.exe", "C:\\mail.exe"});
    machine.AddVersionBlock("C:\\surf, fast.exe", {0x09, 0x04, 0xE4, 0x04}, {{"ProductName", "Surf, Fast"}});
    machine.AddConnection({5, "10.0.0.5", 1025, "192.0.2.9", 443, 100});
    machine.AddConnection({5, "10.0.0.5", 1026, "192.0.2.9", 443, 100});
    machine.AddConnection({5, "10.0.0.5", 1110, "192.0.2.25", 110, 200});
  }

  void OpenMonitor() {
    program.Start();
    ASSERT_TRUE(desktop.Click(program.frmSplash.Label2));
    ASSERT_TRUE(desktop.Click(menu.lblCaption[0]));
  }
  void Download(unsigned port, unsigned length, int count) {
    for (int i = 0; i < count; ++i) {
      capture::TestFrame frame;
      frame.source = "192.0.2.9";
      frame.sourcePort = 443;
      frame.destination = "10.0.0.5";
      frame.destinationPort = port;
      frame.totalLength = length;
      machine.Deliver(frame.Build());
    }
  }
  /// A second with traffic and the pass at its end.
  void SecondWithTraffic() {
    Download(1025, 1024, 30);
    Download(1110, 1024, 5);
    Signal();
    machine.AdvanceTick(1000);
    Download(1025, 1024, 1);
    Signal();
  }
  void Signal() {
    desktop.Dispatch([this] { machine.capture.SignalWhileFramesAreTaken(); });
  }
};

TEST_F(ReportScenario, The_report_holds_the_table_as_its_last_pass_left_it) {
  Server();
  OpenMonitor();
  SecondWithTraffic();

  GetNumber();
  AnswerReport({"HTTP/1.1 200 OK\r\n\r\n~OK"});

  EXPECT_EQ(BodyOf(Connection(1).Received), "id=4711&procs="
                                            "Surf, Fast|surf~ fast.exe|Service|.1025.1026.||030.00|30.00}"
                                            "|\xE3\xE5\xE0\xF8.exe|Service|.1110.||005.00|5.00}"
                                            "|[System Process]|Service||||}");
  EXPECT_EQ(desktop.Boxes, (Boxes{{kNumberIs + u"4711", kHebrewInformation, kTitle},
                                  {kSuccess, kHebrewInformation, kTitle}}));
}

TEST_F(ReportScenario, A_pass_behind_the_numbers_box_is_in_the_report) {
  Server();
  OpenMonitor();
  SecondWithTraffic();
  desktop.WhileBoxStands.push_back([&] {
    machine.AdvanceTick(1000);
    Download(1110, 1024, 1);
    Signal();
  });

  GetNumber();

  EXPECT_EQ(BodyOf(Connection(1).Received), "id=4711&procs="
                                            "|\xE3\xE5\xE0\xF8.exe|Service|.1110.||001.00|1.00}"
                                            "Surf, Fast|surf~ fast.exe|Service|.1025.1026.|||}"
                                            "|[System Process]|Service||||}");
}

} // namespace
} // namespace quendra::report
