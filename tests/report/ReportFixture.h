#pragma once

#include "app/Program.h"
#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachine.h"
#include "runtime/Settings.h"

#include <gtest/gtest.h>

#include <deque>

namespace quendra::report {

/// A desktop whose boxes stand until what the test has planned for that time has happened.
class DesktopWithStandingBoxes : public forms::headless::HeadlessDesktop {
 public:
  /// What happens while the next boxes stand, one step a box.
  std::deque<std::function<void()>> WhileBoxStands;
  /// A program that was ended while a box stood doesn't come back from it.
  int MessageBox(const Text& text, int flags, const Text& title) override {
    const int answer = HeadlessDesktop::MessageBox(text, flags, title);
    if (WhileBoxStands.empty()) return answer;
    const auto step = std::move(WhileBoxStands.front());
    WhileBoxStands.pop_front();
    step();
    if (Ended) End(EndStatus);
    return answer;
  }
};

/// A whole program on a network with a support server whose part the test plays.
class ReportTest : public testing::Test {
 protected:
  using Box = forms::headless::HeadlessDesktop::Box;
  using Boxes = std::vector<Box>;

  ReportTest() {
    machine.hostNames.Addresses = {"127.0.0.1", "10.0.0.5"};
    machine.hostNames.Add(host, {kServerAddress});
    machine.AddCaptureAdapter({"eth0", "Network card", "10.0.0.5"});
  }

  /// The monitor page, with nothing in its table.
  void OpenPage() {
    program.Start();
    ASSERT_TRUE(desktop.Click(program.frmSplash.Label2));
    ASSERT_TRUE(desktop.Click(menu.lblCaption[0]));
    program.monitorPage.table.main_ListView1.Clear();
  }
  void LeavePage() { ASSERT_TRUE(desktop.Click(menu.lblCaption[2])); }
  void AddRow(const Text& application, const std::vector<Text>& cells) {
    forms::ListView& table = program.monitorPage.table.main_ListView1;
    forms::ListRow& row = table.Add(u"p" + DecimalText(1000 + table.Count()), application, 1);
    for (const Text& cell : cells) row.AddCell(cell, {});
  }

  void ClickReport() { ASSERT_TRUE(desktop.Click(program.monitorPage.reporting.main_cmdRpt)); }
  /// A click that the disabled button would not let through.
  void ClickReportAllTheSame() {
    EXPECT_FALSE(desktop.Click(program.monitorPage.reporting.main_cmdRpt));
    desktop.Dispatch([this] { program.monitorPage.reporting.main_cmdRpt.Click(); });
  }
  /// Lets all happen that is under way.
  void Run() { desktop.RunUntilIdle(); }

  /// The server by name; a build may name it by its address.
  platform::simulated::SimulatedServer& Server() {
    const bool dotted = platform::Sockets::inet_addr(host) != platform::kNoAddress;
    return machine.sockets.Listen(dotted ? host : kServerAddress, 80);
  }
  /// The same server by address, where the load comes from.
  platform::simulated::SimulatedServer& LoadServer() {
    return machine.sockets.Listen(ToUtf8(settings::SupportServerAddress), 80);
  }
  /// A connection to the server, counted from 0 in the order in which they came.
  platform::simulated::SimulatedPeer& Connection(std::size_t number) {
    return *Server().Connections.at(number);
  }
  std::size_t ConnectionCount() { return Server().Connections.size(); }

  /// Click, connection, request; then the server says this.
  void AskForNumberAndAnswer(const std::string& reply) {
    ClickReport();
    Run();
    ASSERT_EQ(ConnectionCount(), 1u);
    Connection(0).Send(reply);
    Run();
  }
  void GetNumber() { AskForNumberAndAnswer("~~~~~~~~\r\n4711"); }
  /// The second connection's reply and end.
  void AnswerReport(const std::vector<std::string>& pieces) {
    ASSERT_EQ(ConnectionCount(), 2u);
    for (const std::string& piece : pieces) {
      Connection(1).Send(piece);
      Run();
    }
    Connection(1).Close();
    Run();
  }

  foundation::SocketState StateOf(std::int16_t index) {
    return program.supportExchange.Sockets()->State(index);
  }
  /// What stands between the headers of a request and the two line ends after its body.
  static std::string BodyOf(const std::string& request) {
    const auto start = request.find("\r\n\r\n") + 4;
    return request.substr(start, request.size() - start - 4);
  }

  static constexpr int kOkOnly = 0;
  static constexpr int kHebrewInformation = 0x180040;
  static constexpr int kHebrewCritical = 0x180010;
  static constexpr const char* kServerAddress = "192.0.2.80";
  const Text kTitle = u"זלמר בינלאומי@נט";
  const Text kSuccess = u"הדו\"ח נשלח בהצלחה.";
  const Text kFailure = u"בעיה בשליחת הדו\"ח!";
  const Text kNumberIs = u"מספר הדו\"ח שלך הוא: ";
  const std::string host = ToUtf8(settings::SupportServerHost);

  DesktopWithStandingBoxes desktop;
  platform::simulated::SimulatedMachine machine{desktop};
  app::Program program{machine.Operations(), desktop};
  shell::frmMenu& menu = program.frmMenu;
};

} // namespace quendra::report

namespace quendra::forms::headless {

inline void PrintTo(const HeadlessDesktop::Box& box, std::ostream* out) {
  *out << '"' << ToUtf8(box.text) << "\" flags " << box.flags << " title \"" << ToUtf8(box.title) << '"';
}

} // namespace quendra::forms::headless
