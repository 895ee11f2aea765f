#include "platform/BehaviourFixture.h"
#include "platform/files/Files.h"
#include "runtime/Fault.h"

namespace quendra::platform {
namespace {

struct FilesBehaviourTest : BehaviourTest {
  Files& files = machine.files;

  /// The number of the fault that writing raises, 0 for none.
  int FaultOf(const std::string& path) {
    try {
      files.Output(path, "text");
    } catch (const Fault& fault) {
      return fault.number;
    }
    return 0;
  }
};

TEST_P(FilesBehaviourTest, The_Windows_directory_has_ten_characters_and_a_NUL_behind_them) {
  std::string buffer(250, ' ');

  EXPECT_EQ(files.GetWindowsDirectoryA(buffer), 10u);

  EXPECT_EQ(buffer, std::string("C:\\WINDOWS") + '\0' + std::string(239, ' '));
}

TEST_P(FilesBehaviourTest, A_buffer_without_room_for_the_NUL_gets_nothing_and_is_told_what_it_needs) {
  std::string room(11, 'x');
  EXPECT_EQ(files.GetWindowsDirectoryA(room), 10u);
  for (const std::size_t size : {0U, 1U, 10U}) {
    std::string buffer(size, 'x');
    EXPECT_EQ(files.GetWindowsDirectoryA(buffer), 11u);
    EXPECT_EQ(buffer, std::string(size, 'x'));
  }
}

TEST_P(FilesBehaviourTest, A_file_of_the_Windows_directory_holds_the_bytes_that_were_written) {
  std::string bytes;
  for (int byte = 0; byte < 256; ++byte) bytes.push_back(static_cast<char>(byte));

  files.Output("C:\\WINDOWS\\name.txt", bytes);

  EXPECT_EQ(backend->ContentOf("C:\\WINDOWS\\name.txt"), bytes);
}

TEST_P(FilesBehaviourTest, A_file_of_the_drive_itself_can_be_written) {
  files.Output("C:\\name.txt", "text");
  EXPECT_EQ(backend->ContentOf("C:\\name.txt"), "text");
}

TEST_P(FilesBehaviourTest, Writing_again_puts_the_new_bytes_in_place_of_all_old_ones) {
  files.Output("C:\\WINDOWS\\name.txt", "a long first text");
  files.Output("C:\\WINDOWS\\name.txt", "second");
  EXPECT_EQ(backend->ContentOf("C:\\WINDOWS\\name.txt"), "second");

  files.Output("C:\\WINDOWS\\name.txt", "");
  EXPECT_EQ(backend->ContentOf("C:\\WINDOWS\\name.txt"), "");
}

TEST_P(FilesBehaviourTest, A_path_ends_at_its_NUL) {
  files.Output(std::string("C:\\WINDOWS\\name\0.txt", 20), "text");
  EXPECT_EQ(backend->ContentOf("C:\\WINDOWS\\name"), "text");
}

TEST_P(FilesBehaviourTest, A_path_through_a_folder_that_isnt_there_is_fault_76) {
  for (const char* path : {"C:\\MISSING\\name", "C:\\WINDOWS\\MISSING\\name", "D:\\name", "name", "",
                           "C:", "C:\\", "C:\\WINDOWS\\", "C:\\WINDOWS\\\\name"})
    EXPECT_EQ(FaultOf(path), 76) << path;
}

TEST_P(FilesBehaviourTest, A_folder_is_not_written_over_which_is_fault_75) {
  files.Output("C:\\WINDOWS\\name.txt", "text");

  EXPECT_EQ(FaultOf("C:\\WINDOWS"), 75);

  EXPECT_EQ(backend->ContentOf("C:\\WINDOWS\\name.txt"), "text");
}

INSTANTIATE_TEST_SUITE_P(, FilesBehaviourTest, kEveryBackend, NameOfBackend);

} // namespace
} // namespace quendra::platform
