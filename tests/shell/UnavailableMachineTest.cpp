#include "platform/unavailable/UnavailableMachine.h"

#include "capture/CaptureState.h"
#include "foundation/Wording.h"
#include "platform/ReplacedFamilies.h"
#include "shell/ProgramFixture.h"

namespace quendra::shell {
namespace {

const Text kNoVersion = u"  Error Getting OS Information";
const Text kLayersError = u"  RAS API Error";

/// A whole program on a machine that lacks everything, save what a test puts in.
class UnavailableMachineTest : public testing::Test {
 protected:
  void ComeHome(const platform::Machine& operations) {
    program.emplace(operations, desktop);
    program->Start();
    ASSERT_TRUE(desktop.Click(program->frmSplash.Label2));
    ASSERT_TRUE(program->frmMenu.Visible());
  }
  void ClickEntry(std::size_t entry) { ASSERT_TRUE(desktop.Click(program->frmMenu.lblCaption[entry])); }
  void OpenConnectionStep() {
    ClickEntry(2);
    provisioning::FirstConnectionPage& page = program->firstConnectionPage;
    ASSERT_TRUE(desktop.Click(page.menu.frsCon_lblCaption[1]));
    ASSERT_TRUE(desktop.Type(page.connection.frsCon_txtUsername, u"dana"));
    ASSERT_TRUE(desktop.Type(page.connection.frsCon_txtPassword, u"secret"));
  }
  /// False when the user couldn't ask for it.
  bool Create(std::size_t modem) {
    provisioning::ConnectionPanel& step = program->firstConnectionPage.connection;
    return desktop.Click(step.frsCon_lblModems[modem]) && desktop.Click(step.frsCon_cmdCreate);
  }
  std::vector<Text> BoxTitles() const {
    std::vector<Text> titles;
    for (const auto& box : desktop.Boxes) titles.push_back(box.title);
    return titles;
  }
  /// The machine with sockets of another.
  platform::Machine WithSockets(platform::Sockets& sockets) {
    return platform::WithReplaced(machine.Operations(), {.sockets = &sockets});
  }

  platform::unavailable::UnavailableMachine machine;
  platform::simulated::SimulatedMachine other;
  forms::headless::HeadlessDesktop desktop;
  std::optional<app::Program> program;
};

TEST_F(UnavailableMachineTest, The_main_window_comes_up_and_says_that_the_version_is_not_known) {
  ComeHome(machine.Operations());
  EXPECT_EQ(BoxTitles(), std::vector<Text>{kNoVersion});
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(UnavailableMachineTest, Pages_that_ask_nothing_of_the_machine_open_and_close) {
  ComeHome(machine.Operations());
  ClickEntry(2);
  EXPECT_TRUE(program->firstConnectionPage.frameFirstConnection.Visible());
  desktop.CloseBox(program->frmMenu);
  EXPECT_EQ(BoxTitles(), std::vector<Text>{kNoVersion});
  EXPECT_EQ(desktop.EndStatus, 0);
}

TEST_F(UnavailableMachineTest, The_link_opens_the_dialog_after_the_boxes_of_failure) {
  ComeHome(machine.Operations());
  ClickEntry(2);

  ASSERT_TRUE(desktop.Click(program->firstConnectionPage.menu.frsCon_lblConnectProb));

  EXPECT_EQ(BoxTitles(), (std::vector<Text>{kNoVersion, kLayersError, foundation::kTitle}));
  EXPECT_EQ(desktop.Boxes.back().text, u"נכשל!");
  const provisioning::frmConnectProb& dialog = program->connection.frmConnectProb;
  EXPECT_TRUE(dialog.Visible());
  EXPECT_EQ(dialog.cmbDialups.ListCount(), 0);
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(UnavailableMachineTest, A_connection_for_each_modem_ends_in_the_box_of_failure) {
  ComeHome(machine.Operations());
  OpenConnectionStep();
  for (const std::size_t modem : {0, 1, 3, 4}) {
    desktop.Boxes.clear();

    ASSERT_TRUE(Create(modem));

    EXPECT_EQ(BoxTitles(), (std::vector<Text>{kNoVersion, kLayersError, foundation::kTitle})) << modem;
    EXPECT_EQ(desktop.Boxes.back().text, u"נכשל!") << modem;
    EXPECT_TRUE(program->firstConnectionPage.connection.frsCon_Frame1.IsShown());
  }
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(UnavailableMachineTest, A_connection_for_the_modem_with_a_card_ends_the_program) {
  ComeHome(machine.Operations());
  OpenConnectionStep();

  ASSERT_TRUE(Create(2));

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
  EXPECT_EQ(desktop.Boxes.back().text, u"Run-time error '429':\n\nActiveX component can't create object");
}

/// The pages that have sockets.
class UnavailableNetwork : public UnavailableMachineTest, public testing::WithParamInterface<std::size_t> {};

TEST_P(UnavailableNetwork, Ends_the_program_with_the_run_times_message) {
  ComeHome(machine.Operations());
  ClickEntry(GetParam());
  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[1].text, u"Run-time error '10091':\n\nNetwork subsystem is unavailable.");
}

INSTANTIATE_TEST_SUITE_P(OfThePage, UnavailableNetwork, testing::Values(0, 1));

TEST_F(UnavailableMachineTest,
       With_a_network_alone_the_monitor_page_shows_an_empty_table_and_why_nothing_is_captured) {
  ComeHome(WithSockets(other.sockets));
  ClickEntry(0);
  EXPECT_FALSE(desktop.Ended);
  EXPECT_EQ(BoxTitles(), std::vector<Text>{kNoVersion});
  EXPECT_TRUE(program->monitorPage.frameMain.Visible());
  EXPECT_EQ(program->monitorPage.table.main_ListView1.Count(), 0);
  EXPECT_EQ(program->monitorPage.adapters.main_cmbAdapters.ListCount(), 0);
  EXPECT_EQ(program->monitorPage.adapters.main_lblCaptureState.Caption(),
            capture::CaptureStateText(platform::CaptureLibrary::Availability::NoLibrary));
}

TEST_F(UnavailableMachineTest, With_a_network_alone_the_pages_follow_each_other_and_the_timers_go_on) {
  ComeHome(WithSockets(other.sockets));
  for (const std::size_t entry : {0, 1, 2, 0, 2, 1, 0}) {
    ClickEntry(entry);
    desktop.Advance(5000);
  }
  EXPECT_TRUE(program->monitorPage.frameMain.Visible());
  EXPECT_FALSE(desktop.Ended);
  EXPECT_EQ(BoxTitles(), std::vector<Text>{kNoVersion});
}

} // namespace
} // namespace quendra::shell
