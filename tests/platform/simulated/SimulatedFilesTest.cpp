#include "platform/simulated/SimulatedMachineFixture.h"
#include "runtime/Fault.h"

namespace quendra::platform::simulated {
namespace {

TEST_F(SimulatedMachineTest, Writing_a_file_is_a_call_that_counts_also_when_it_fails) {
  operations.files.Output("C:\\WINDOWS\\name", "text");
  EXPECT_THROW(operations.files.Output("C:\\MISSING\\name", "text"), Fault);

  EXPECT_EQ(machine.Calls, (Lines{"Output C:\\WINDOWS\\name", "Output C:\\MISSING\\name"}));
}

TEST_F(SimulatedMachineTest, A_scripted_fault_leaves_the_file_as_it_was) {
  operations.files.Output("C:\\WINDOWS\\name", "before");
  machine.files.OutputFault = Fault::kDiskFull;

  EXPECT_THROW(operations.files.Output("C:\\WINDOWS\\name", "after"), Fault);

  EXPECT_EQ(machine.files.Contents.at("C:\\WINDOWS\\name"), "before");
}

TEST_F(SimulatedMachineTest, A_folder_that_a_test_adds_takes_files) {
  machine.files.Folders = {"D:\\TEMP"};

  operations.files.Output("D:\\TEMP\\name", "text");

  EXPECT_EQ(machine.files.Contents.at("D:\\TEMP\\name"), "text");
}

TEST_F(SimulatedMachineTest, A_scripted_answer_to_the_directory_query_holds_whatever_the_directory_is) {
  machine.files.DirectoryAnswer = 300;
  std::string buffer(20, ' ');

  EXPECT_EQ(operations.files.GetWindowsDirectoryA(buffer), 300u);

  EXPECT_TRUE(buffer.starts_with("C:\\WINDOWS"));
}

} // namespace
} // namespace quendra::platform::simulated
