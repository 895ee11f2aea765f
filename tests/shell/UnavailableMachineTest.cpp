#include "platform/unavailable/UnavailableMachine.h"

#include "capture/CaptureState.h"
#include "platform/ReplacedFamilies.h"
#include "shell/ProgramFixture.h"

namespace quendra::shell {
namespace {

const Text kNoVersion = u"  Error Getting OS Information";

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
