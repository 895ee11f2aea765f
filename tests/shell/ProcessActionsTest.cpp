#include "shell/ProcessActions.h"

#include "shell/ProgramFixture.h"

namespace quendra::shell {
namespace {

class ProcessActionsTest : public ProgramTest {
 protected:
  void OpenWith(std::vector<platform::simulated::Process> processes) {
    for (auto& process : processes) machine.AddProcess(std::move(process));
    ComeHome();
    ClickEntry(0);
    machine.Calls.clear();
    machine.processes.OpenCalls.clear();
    // A pass over processes without a path leaves an error.
    machine.processes.LeaveError(0);
  }
  void Select(std::uint32_t processId) { list.Select(list.Find(u"p" + DecimalText(processId))); }
  bool HasRow(std::uint32_t processId) { return list.Find(u"p" + DecimalText(processId)) != nullptr; }
  bool ClickEnd() { return desktop.Click(page.main_lblEndProcess); }

  MonitorPage& page = program.monitorPage;
  forms::ListView& list = page.table.main_ListView1;
  const forms::headless::HeadlessDesktop::Box refused{u"אין אפשרות לסיים את התהליך!", 0x180010,
                                                      u"זלמר בינלאומי@נט"};
};

TEST_F(ProcessActionsTest, A_process_is_ended_and_its_row_goes_at_once) {
  OpenWith({{100, 1, "one.exe", ""}, {101, 1, "two.exe", ""}});
  Select(101);
  const int passes = machine.processes.SnapshotsTaken;
  ASSERT_TRUE(ClickEnd());
  EXPECT_EQ(machine.processes.TerminateCalls, (std::vector<std::string>{"101 0"}));
  EXPECT_FALSE(HasRow(101));
  EXPECT_TRUE(HasRow(100));
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_EQ(machine.processes.SnapshotsTaken, passes);
}

TEST_F(ProcessActionsTest, A_process_is_opened_to_be_ended_and_its_handle_is_closed) {
  OpenWith({{100, 1, "one.exe", ""}});
  const int open = machine.processes.OpenHandles();
  ClickEnd();
  ASSERT_EQ(machine.processes.OpenCalls.size(), 1U);
  EXPECT_EQ(machine.processes.OpenCalls[0].id, 100U);
  EXPECT_EQ(machine.processes.OpenCalls[0].access, 1U);
  EXPECT_EQ(machine.processes.OpenHandles(), open);
}

TEST_F(ProcessActionsTest, A_process_that_may_not_be_ended_is_told_of_and_stays) {
  OpenWith({{100, 1, "one.exe", ""}});
  machine.processes.RefuseToEnd(100);
  const int open = machine.processes.OpenHandles();
  ClickEnd();
  EXPECT_EQ(desktop.Boxes, (std::vector{refused}));
  EXPECT_TRUE(HasRow(100));
  EXPECT_EQ(machine.processes.OpenHandles(), open);
}

TEST_F(ProcessActionsTest,
       The_idle_process_and_one_that_cannot_be_opened_are_tried_all_the_same_and_told_of) {
  OpenWith({{0, 0, "idle", ""}, {4, 0, "System", ""}});
  machine.processes.FailOpen(4);
  for (const std::uint32_t id : {0U, 4U}) {
    Select(id);
    ClickEnd();
    EXPECT_TRUE(HasRow(id)) << id;
  }
  EXPECT_EQ(machine.processes.TerminateCalls, (std::vector<std::string>{"0 0", "0 0"}));
  EXPECT_EQ(desktop.Boxes, (std::vector{refused, refused}));
}

TEST_F(ProcessActionsTest, A_process_that_ended_meanwhile_is_told_of) {
  OpenWith({{100, 1, "one.exe", ""}});
  machine.EndProcess(100);
  ClickEnd();
  EXPECT_EQ(desktop.Boxes, (std::vector{refused}));
  EXPECT_TRUE(HasRow(100));
}

TEST_F(ProcessActionsTest, A_second_click_ends_whatever_is_selected_then) {
  OpenWith({{100, 1, "one.exe", ""}, {101, 1, "two.exe", ""}});
  Select(100);
  ClickEnd();
  ClickEnd();
  EXPECT_EQ(machine.processes.TerminateCalls, (std::vector<std::string>{"100 0", "101 0"}));
  EXPECT_EQ(list.Count(), 0);
}

TEST_F(ProcessActionsTest, The_program_ends_itself_when_its_own_row_is_selected) {
  OpenWith({{100, 1, "quendra.exe", ""}});
  program.mdlFileInfo.OwnPid = 100;
  ClickEnd();
  EXPECT_EQ(machine.processes.TerminateCalls, (std::vector<std::string>{"100 0"}));
}

TEST_F(ProcessActionsTest, The_privilege_is_asked_for_until_it_is_got) {
  OpenWith({{100, 1, "one.exe", ""}, {101, 1, "two.exe", ""}, {102, 1, "three.exe", ""}});
  EXPECT_EQ(program.portSource.SeDebugEnabled, kFalse16);
  ClickEnd();
  EXPECT_EQ(program.portSource.SeDebugEnabled, kTrue16);
  machine.processes.LeaveError(5); // would fail another try
  ClickEnd();
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(ProcessActionsTest, A_privilege_that_is_refused_is_told_of_and_the_process_ended_all_the_same) {
  OpenWith({{100, 1, "one.exe", ""}});
  machine.processes.LeaveError(5);
  ClickEnd();
  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_EQ(desktop.Boxes[0].text, u"GetCurrentProcess, Error: 5");
  EXPECT_EQ(program.portSource.SeDebugEnabled, kFalse16);
  EXPECT_FALSE(HasRow(100));
}

TEST_F(ProcessActionsTest, A_row_that_goes_while_a_box_stands_is_not_removed_twice) {
  OpenWith({{100, 1, "one.exe", ""}, {101, 1, "two.exe", ""}});
  Select(100);
  machine.processes.LeaveError(5);
  desktop.OnBox = [&] { list.Remove(1); };
  ClickEnd();
  EXPECT_TRUE(HasRow(101));
  EXPECT_EQ(machine.processes.TerminateCalls, (std::vector<std::string>{"100 0"}));
}

TEST_F(ProcessActionsTest, The_folder_of_the_process_is_opened_with_its_file_selected) {
  OpenWith({{100, 1, "one.exe", "C:\\Program Files\\one.exe"}});
  EXPECT_TRUE(desktop.Click(page.main_lblJumpToPath));
  EXPECT_EQ(machine.Calls,
            (std::vector<std::string>{"Shell 1 explorer.exe /n, /e, /select, C:\\Program Files\\one.exe"}));
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(ProcessActionsTest, A_process_without_a_known_file_is_told_of) {
  OpenWith({{100, 1, "one.exe", ""}});
  desktop.Click(page.main_lblJumpToPath);
  EXPECT_TRUE(machine.Calls.empty());
  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_EQ(desktop.Boxes[0], (forms::headless::HeadlessDesktop::Box{u"אין אפשרות לאתר את קובץ היישום.",
                                                                     0x180040, u"זלמר בינלאומי@נט"}));
}

TEST_F(ProcessActionsTest, The_applet_for_programs_is_started_in_style_5) {
  OpenWith({});
  EXPECT_TRUE(desktop.Click(page.main_cmdAddRemove));
  EXPECT_EQ(machine.Calls,
            (std::vector<std::string>{"Shell 5 rundll32.exe shell32.dll,Control_RunDLL appwiz.cpl,,"}));
}

TEST_F(ProcessActionsTest, Without_a_selected_row_nothing_is_done) {
  OpenWith({});
  ASSERT_EQ(list.SelectedItem(), nullptr);
  ClickEnd();
  desktop.Click(page.main_lblJumpToPath);
  desktop.MouseDown(list, forms::kRightButton);
  EXPECT_TRUE(machine.processes.OpenCalls.empty());
  EXPECT_TRUE(machine.processes.TerminateCalls.empty());
  EXPECT_TRUE(machine.Calls.empty());
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(ProcessActionsTest, A_press_of_the_right_button_changes_nothing) {
  OpenWith({{100, 1, "one.exe", ""}});
  const auto revision = list.Revision();
  EXPECT_TRUE(desktop.MouseDown(list, forms::kRightButton));
  EXPECT_EQ(list.Revision(), revision);
  EXPECT_TRUE(machine.Calls.empty());
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(ProcessActionsTest, A_second_click_on_a_header_turns_the_order_over_and_another_header_starts_anew) {
  OpenWith({{100, 1, "one.exe", ""}, {101, 1, "two.exe", ""}});
  desktop.ClickHeader(list, 2);
  EXPECT_EQ(list.SortKey(), 1);
  EXPECT_EQ(list.Order(), forms::SortOrder::Ascending);
  desktop.ClickHeader(list, 2);
  EXPECT_EQ(list.Order(), forms::SortOrder::Descending);
  desktop.ClickHeader(list, 4);
  EXPECT_EQ(list.SortKey(), 3);
  EXPECT_EQ(list.Order(), forms::SortOrder::Ascending);
  EXPECT_TRUE(list.Sorted());
}

TEST_F(ProcessActionsTest, Ports_are_sorted_as_text) {
  OpenWith({{100, 1, "one.exe", ""}, {101, 1, "two.exe", ""}});
  list.Find(u"p100")->SetCellText(3, u".80.");
  list.Find(u"p101")->SetCellText(3, u".1025.");
  desktop.ClickHeader(list, 4);
  EXPECT_EQ(list.Row(1).CellText(3), u".1025.");
}

TEST_F(ProcessActionsTest, The_next_pass_sorts_by_the_download_again) {
  OpenWith({{100, 1, "one.exe", ""}, {101, 1, "two.exe", ""}});
  desktop.ClickHeader(list, 2);
  program.processTable.RefreshProcessTable({});
  EXPECT_EQ(list.SortKey(), 5);
  EXPECT_EQ(list.Order(), forms::SortOrder::Descending);
}

TEST_F(ProcessActionsTest, A_dialog_comes_modally_after_the_main_window_leaves_the_topmost_band) {
  OpenWith({});
  const std::pair<forms::Label*, forms::Form*> offers[] = {{&page.main_cmdMemInfo, &program.frmMemInfo},
                                                           {&page.main_cmdChecks, &program.frmPortsChecks}};
  for (const auto& [button, dialog] : offers) {
    desktop.Calls.clear();
    bool stood = false;
    desktop.OnModal = [&stood, offered = dialog, this](forms::Form& form) {
      stood = &form == offered && form.Visible();
      desktop.Unload(form);
    };
    EXPECT_TRUE(desktop.Click(*button));
    EXPECT_TRUE(stood);
    EXPECT_EQ(desktop.Calls,
              (std::vector<std::string>{"SetWindowPos frmMenu -2 0 0 0 0 3",
                                        "Show " + ToUtf8(dialog->Name()) + " modal owner frmMenu"}));
  }
}

} // namespace
} // namespace quendra::shell
