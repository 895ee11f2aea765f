#include "shell/ProgramFixture.h"

#include <fstream>
#include <sstream>

namespace quendra::shell {
namespace {

/// What stands on the screen, as text, beside a file of the folder snapshots.
class Snapshot : public ProgramTest {
 protected:
  void ExpectScreen(forms::Form& form, const std::string& name) {
    const std::string path = QUENDRA_SOURCE_DIR "/tests/shell/snapshots/" + name + ".txt";
    std::ifstream file(path, std::ios::binary); // what a text has of carriage returns stays
    ASSERT_TRUE(file) << path;
    std::stringstream expected;
    expected << file.rdbuf();
    EXPECT_EQ(desktop.Render(form), expected.str());
  }
  /// Of the page for the first connection: 0 the mail account, 1 the connection.
  void OpenStep(std::size_t step) {
    ComeHome();
    ClickEntry(2);
    ASSERT_TRUE(desktop.Click(page.menu.frsCon_lblCaption[step]));
  }

  provisioning::FirstConnectionPage& page = program.firstConnectionPage;
};

TEST_F(Snapshot, Of_the_splash) {
  program.Start();
  ExpectScreen(program.frmSplash, "splash");
}

TEST_F(Snapshot, Of_the_splash_with_its_agreement) {
  program.Start();
  desktop.Click(program.frmSplash.Label1);
  ExpectScreen(program.frmSplash, "agreement");
}

TEST_F(Snapshot, Of_the_home_state) {
  ComeHome();
  ExpectScreen(program.frmMenu, "home");
}

TEST_F(Snapshot, Of_a_hovered_entry_of_the_second_row) {
  ComeHome();
  desktop.MouseMove(program.frmMenu.lblCaption[4]);
  ExpectScreen(program.frmMenu, "hover");
}

TEST_F(Snapshot, Of_the_monitor_page) {
  machine.AddProcess({4, 0, "System", ""});
  machine.AddProcess({100, 4, "browser.exe", "C:\\browser.exe"});
  machine.AddConnection({5, "10.0.0.5", 1025, "192.0.2.80", 80, 100});
  ComeHome();
  ClickEntry(0);
  ExpectScreen(program.frmMenu, "monitor");
}

TEST_F(Snapshot, Of_the_page_for_surf_problems) {
  ComeHome();
  ClickEntry(1);
  ExpectScreen(program.frmMenu, "surf");
}

TEST_F(Snapshot, Of_the_page_for_the_first_connection) {
  ComeHome();
  ClickEntry(2);
  ExpectScreen(program.frmMenu, "connect");
}

TEST_F(Snapshot, Of_the_step_of_the_connection) {
  OpenStep(1);
  desktop.Type(page.connection.frsCon_txtUsername, u"dana");
  desktop.Type(page.connection.frsCon_txtPassword, u"secret");
  desktop.Click(page.connection.frsCon_lblModems[2]);
  ExpectScreen(program.frmMenu, "connect_step");
}

TEST_F(Snapshot, Of_the_step_of_the_mail_account) {
  machine.installedProducts.Codes = {"{90E00409-6000-11D3-8CFE-0050048383C9}"};
  OpenStep(0);
  desktop.Type(page.mail.frsCon_txtFullName, u"דנה לוי");
  desktop.Type(page.mail.frsCon_txtEmailUN, u"dana");
  desktop.Click(page.mail.frsCon_lblMails[1]);
  ExpectScreen(program.frmMenu, "mail_step");
}

TEST_F(Snapshot, Of_the_dialog_for_network_cards) {
  machine.adapters.Cards = {"First card", "Second card"};
  OpenStep(1);
  desktop.Type(page.connection.frsCon_txtUsername, u"dana");
  desktop.Type(page.connection.frsCon_txtPassword, u"secret");
  desktop.Click(page.connection.frsCon_lblModems[2]);
  int shown = 0;
  desktop.OnModal = [&](forms::Form& cards) {
    ++shown;
    desktop.ChooseItem(program.connection.frmNetworkAdapters.lstNICs, 1);
    ExpectScreen(cards, "network_cards");
  };
  desktop.Click(page.connection.frsCon_cmdCreate);
  EXPECT_EQ(shown, 1);
}

TEST_F(Snapshot, Of_the_about_box) {
  ComeHome();
  desktop.Click(program.frmMenu.Label1);
  ExpectScreen(program.frmAbout, "about");
}

TEST_F(Snapshot, Of_the_dialog_for_connection_problems) {
  machine.ras.AddEntry("097").SetDevice("pppoe", "pppoe");
  machine.ras.AddEntry("Office");
  ComeHome();
  ClickEntry(2);
  desktop.Click(program.firstConnectionPage.menu.frsCon_lblConnectProb);
  provisioning::frmConnectProb& dialog = program.connection.frmConnectProb;
  desktop.ChooseItem(dialog.cmbDialups, 0);
  dialog.txtEmunrateError.Value = u"678";
  desktop.Click(dialog.cmdCheck);
  ExpectScreen(dialog, "connect_prob");
}

} // namespace
} // namespace quendra::shell
