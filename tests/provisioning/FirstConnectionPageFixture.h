#pragma once

#include "provisioning/FirstConnectionPage.h"

#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace quendra::provisioning {

inline constexpr forms::PageRow kRow{u"התחברות ראשונה", "menu_connect", u"frameFirstConnection", false};
/// Red 220, green 247, blue 193.
inline constexpr forms::Colour kGreenRow = forms::Rgb(220, 247, 193);

/// A window with nothing but the page.
class WindowOfPage : public forms::PageWindow {
 public:
  explicit WindowOfPage(platform::KeyboardLayout& layout)
      : PageWindow(u"frmMenu"), page(*this, kRow, layout) {}

  void Design() override {
    Move(0, 0, 14580, 8550);
    page.frame.Visible = false;
    page.frame.Move(0, 0, 14580, 8550);
    page.Design();
  }
  void resetButtons() override {}
  void ShowHandCursor() override { ++Hands; }

  int Hands = 0;
  FirstConnectionPage page;
};

class FirstConnectionPageTest : public testing::Test {
 protected:
  FirstConnectionPageTest() {
    page.DetectMailClients = [this] { return tokens; };
    desktop.Show(window);
  }

  /// As the main window's menu does.
  void OpenPage() { page.Start(); }
  void OpenConnectionStep() {
    OpenPage();
    ASSERT_TRUE(desktop.Click(page.menu.frsCon_lblCaption[1]));
  }
  void OpenMailStep() {
    OpenPage();
    ASSERT_TRUE(desktop.Click(page.menu.frsCon_lblCaption[0]));
  }
  void FillConnection() {
    desktop.Type(connection.frsCon_txtUsername, u"dana");
    desktop.Type(connection.frsCon_txtPassword, u"secret");
  }

  using Rows = std::vector<std::size_t>;
  /// The rows whose ground a rule holds for.
  template <typename Rule> static Rows RowsWhere(const std::array<forms::Label, 5>& grounds, Rule rule) {
    Rows rows;
    for (std::size_t row = 0; row < grounds.size(); ++row)
      if (rule(grounds[row])) rows.push_back(row);
    return rows;
  }
  static Rows Opaque(const std::array<forms::Label, 5>& grounds) {
    return RowsWhere(grounds, [](const forms::Label& ground) { return !ground.Transparent(); });
  }
  static Rows Green(const std::array<forms::Label, 5>& grounds) {
    return RowsWhere(grounds, [](const forms::Label& ground) { return ground.BackColour() == kGreenRow; });
  }
  static Rows White(const std::array<forms::Label, 5>& grounds) {
    return RowsWhere(grounds,
                     [](const forms::Label& ground) { return ground.BackColour() == forms::kWhite; });
  }
  std::vector<bool> Marks() const {
    std::vector<bool> shown;
    for (const forms::Label& mark : page.frsCon_lblError) shown.push_back(mark.Visible());
    return shown;
  }
  void ShowAllMarks() {
    for (forms::Label& mark : page.frsCon_lblError) mark.Visible = true;
  }
  /// The hands that the mouse brought up over a control.
  int HandsOver(forms::Control& control) {
    const int before = window.Hands;
    EXPECT_TRUE(desktop.MouseMove(control)) << ToUtf8(control.Name());
    return window.Hands - before;
  }

  forms::headless::HeadlessDesktop desktop;
  platform::simulated::SimulatedMachine machine;
  WindowOfPage window{machine.keyboardLayout};
  FirstConnectionPage& page = window.page;
  ConnectionPanel& connection = page.connection;
  MailPanel& mail = page.mail;
  std::array<forms::Label, 5>& modemGrounds = connection.frsCon_lblModemBG;
  std::array<forms::Label, 5>& mailGrounds = mail.frsCon_lblMailBG2;
  Text tokens = u"OE|";
};

} // namespace quendra::provisioning
