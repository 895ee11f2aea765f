#pragma once

#include "app/Program.h"
#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachine.h"
#include "runtime/Settings.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>

namespace quendra::diagnostics {

/// The caption of the list's last row, and what the details say of a connection that was reset.
inline constexpr const char16_t* kEnd = u"הסתיים";
inline constexpr const char16_t* kReset = u"10054 - Connection reset by peer.";

/// Tells when something is drawn at once: what stands then is what the user sees.
class WatchedDesktop : public forms::headless::HeadlessDesktop {
 public:
  std::function<void(const forms::Control&)> OnRepaint;

  void Repaint(forms::Control& control) override {
    HeadlessDesktop::Repaint(control);
    if (OnRepaint) OnRepaint(control);
  }
};

/// A whole program on a network whose web and mail servers the test plays.
class SurfTest : public testing::Test {
 protected:
  SurfTest() {
    machine.hostNames.Addresses = {"127.0.0.1", "10.0.0.5"};
    machine.hostNames.Add(webName, {kWebAddressOfName});
    if (mailName != webName) machine.hostNames.Add(mailName, {kWebAddressOfName});
    platform::InterfaceRow card;
    card.Set(platform::InterfaceRow::kSpeed, 10'000'000);
    card.Set(platform::InterfaceRow::kOperStatus, platform::kOperational);
    machine.ipHelper.Interfaces = {card};
    machine.performanceData.SetProcessors({{}}, 1);
  }

  void ComeHome() {
    program.Start();
    ASSERT_TRUE(desktop.Click(program.frmSplash.Label2));
  }
  /// The surf page, with all that happens by itself.
  void OpenPage() {
    ComeHome();
    ClickSurf();
    Run();
  }
  void ClickSurf() { ASSERT_TRUE(desktop.Click(menu.lblCaption[1])); }
  void Run() { desktop.RunUntilIdle(); }

  platform::simulated::SimulatedServer& WebByName() { return machine.sockets.Listen(kWebAddressOfName, 80); }
  platform::simulated::SimulatedServer& WebByAddress() {
    return machine.sockets.Listen(ToUtf8(settings::ProbeWebAddress), 80);
  }
  platform::simulated::SimulatedServer& IncomingMail() {
    return machine.sockets.Listen(kWebAddressOfName, 110);
  }
  platform::simulated::SimulatedServer& OutgoingMail() {
    return machine.sockets.Listen(kWebAddressOfName, 25);
  }
  /// All four servers answer as they should.
  void AllServersAnswer() {
    WebByName().Answer({"HTTP/1.0 200 OK\r\n\r\n"});
    WebByAddress().Answer({"HTTP/1.0 200 OK\r\n\r\n"});
    IncomingMail().Greet("+OK\r\n");
    OutgoingMail().Greet("220 ready\r\n");
  }
  /// That of a network check, from 1.
  platform::simulated::SimulatedServer& ServerOf(int step) {
    switch (step) {
    case 1: return WebByName();
    case 2: return WebByAddress();
    case 3: return IncomingMail();
    default: return OutgoingMail();
    }
  }
  /// Every server is there. Those of the steps before this one answer, the others accept and wait.
  void AnswerBefore(int step) {
    for (int other = 1; other <= 4; ++other)
      if (auto& server = ServerOf(other); other < step) server.Greet("x");
  }
  static platform::simulated::SimulatedPeer& Connection(platform::simulated::SimulatedServer& server) {
    return *server.Connections.at(0);
  }

  forms::ListView& List() { return page.surf_ListView1; }
  int RowCount() { return List().Count(); }
  forms::ListRow& Row(int row) { return List().Row(row); }
  Text Detail(int row) { return Row(row).CellText(1); }
  Text CaptionOf(int row) { return Row(row).CellText(2); }
  /// The icon of the row's diagnosis: 1 for a tick, 2 for a cross, 0 where there is no such cell.
  int Icon(int row) { return Row(row).CellCount() < 3 ? 0 : Row(row).CellIcon(3); }
  std::vector<int> Icons(int rows) {
    std::vector<int> icons;
    for (int row = 1; row <= rows; ++row) icons.push_back(Icon(row));
    return icons;
  }
  bool Bold(int row) { return Row(row).CellBold(2); }
  std::vector<bool> Rules() const {
    std::vector<bool> shown;
    for (const auto& rule : program.surfPage.surf_picLine) shown.push_back(rule.Visible());
    return shown;
  }

  static constexpr const char* kWebAddressOfName = "192.0.2.80";
  static constexpr int kTick = 1;
  static constexpr int kCross = 2;
  const std::string webName = ToUtf8(settings::ProbeWebHost);
  const std::string mailName = ToUtf8(settings::IspMailHost);

  WatchedDesktop desktop;
  platform::simulated::SimulatedMachine machine{desktop};
  app::Program program{machine.Operations(), desktop};
  shell::frmMenu& menu = program.frmMenu;
  SurfPage& page = program.surfPage;
  SurfChecks& checks = program.surf.surfChecks;
};

} // namespace quendra::diagnostics
