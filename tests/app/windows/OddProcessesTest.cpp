#include "app/Program.h"
#include "app/windows/StartedProgram.h"
#include "app/windows/TestFolder.h"
#include "forms/win32/Win32Driver.h"
#include "monitor/ProcessRow.h"
#include "platform/windows/WindowsMachine.h"

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>

// Processes whose names, version blocks and icons nobody would expect, in the table of the whole program.

namespace quendra::app::windows {
namespace {

class OddProcesses : public testing::Test {
 protected:
  /// The cells of a process's row; empty without a row.
  std::vector<Text> RowOf(const StartedProgram& process) {
    user.Win32().Show(program.frmMenu);
    user.Click(program.frmMenu.lblCaption[shell::kMonitorPage]);
    user.Win32().PumpOnce();
    forms::ListRow* row = program.monitorPage.table.main_ListView1.Find(monitor::KeyOfProcess(process.Id()));
    if (!row) return {};
    return {row->CellText(monitor::kApplicationCell), row->CellText(monitor::kNameCell)};
  }
  /// A running program of that name, of which bytes were spoilt behind a mark in its file.
  Text Spoilt(const Text& name, std::string_view mark = {}) {
    const Text path = folder.Take(FolderOfBuild() + u"\\odd_program.exe", name);
    if (mark.empty()) return path;
    std::fstream file(ToCodePage(path), std::ios::binary | std::ios::in | std::ios::out);
    std::string bytes{std::istreambuf_iterator<char>(file), {}};
    const std::size_t at = bytes.find(mark);
    if (at == std::string::npos) throw std::runtime_error("the mark isn't there");
    file.clear();
    file.seekp(static_cast<std::streamoff>(at + mark.size()));
    for (int i = 0; i < 40; ++i) file.put('\xFF');
    return path;
  }

  TestFolder folder;
  forms::win32::Win32Driver user;
  platform::windows::WindowsMachine machine{user.Win32()};
  Program program{machine.Operations(), user.Win32()};
};

TEST_F(OddProcesses, Show_their_product_and_their_name_of_signs_that_few_files_have) {
  const StartedProgram odd(Spoilt(u"a%s&b 'c' ;#~ שלום.exe"));
  EXPECT_EQ(RowOf(odd), (std::vector<Text>{u"Odd", u"a%s&b 'c' ;#~ שלום.exe"}));
}

TEST_F(OddProcesses, Show_what_the_code_page_lacks_of_their_name_as_question_marks) {
  const StartedProgram odd(Spoilt(u"жук.exe"));
  const std::vector<Text> row = RowOf(odd);
  ASSERT_EQ(row.size(), 2U);
  EXPECT_EQ(row[1], u"???.exe");
}

TEST_F(OddProcesses, Show_no_product_when_their_version_block_is_broken) {
  const std::string mark("V\0S\0_\0V\0E\0R\0S\0I\0O\0N\0_\0I\0N\0F\0O\0", 30);
  const StartedProgram odd(Spoilt(u"version.exe", mark));
  const std::vector<Text> row = RowOf(odd);
  ASSERT_EQ(row.size(), 2U);
  EXPECT_EQ(row[0], u"");
  EXPECT_EQ(row[1], u"version.exe");
}

TEST_F(OddProcesses, Have_a_row_when_their_icon_is_broken) {
  // The header of its first image.
  const StartedProgram odd(Spoilt(u"icon.exe", std::string("\x28\0\0\0\x10\0\0\0\x20\0\0\0", 12)));
  EXPECT_EQ(RowOf(odd), (std::vector<Text>{u"Odd", u"icon.exe"}));
}

TEST_F(OddProcesses, Lose_their_row_after_they_were_killed_while_the_table_is_made) {
  std::vector<std::unique_ptr<StartedProgram>> crowd;
  for (int i = 0; i < 10; ++i)
    crowd.push_back(std::make_unique<StartedProgram>(FolderOfBuild() + u"\\idle_program.exe"));
  for (const auto& process : crowd) process->Kill(); // and no waiting for their end
  RowOf(*crowd.front());
  for (const auto& process : crowd) ASSERT_TRUE(process->Ends());

  // One row that goes lets the next one wait for another pass, and the last is never looked at.
  forms::ListView& list = program.monitorPage.table.main_ListView1;
  for (int pass = 0; pass < 12; ++pass) {
    program.processTable.LastRefreshTick = static_cast<std::int32_t>(::GetTickCount() - 1000);
    program.processTable.RefreshProcessTable({});
  }

  int left = 0;
  for (const auto& process : crowd) left += list.Find(monitor::KeyOfProcess(process->Id())) != nullptr;
  EXPECT_LE(left, 1);
}

} // namespace
} // namespace quendra::app::windows
