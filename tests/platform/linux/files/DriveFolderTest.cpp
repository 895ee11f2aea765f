#include "platform/linux/files/DriveFixture.h"

namespace quendra::platform::linux_ {
namespace {

struct DriveFolderTest : DriveTest {};

TEST_F(DriveFolderTest, A_file_of_the_drive_lies_below_its_folder) {
  files.Output(kFile, "text");
  EXPECT_EQ(drive.FileOf(kFile), Place("WINDOWS/bi.prf"));
}

TEST_F(DriveFolderTest, What_is_no_file_of_the_drive_lies_nowhere) {
  files.Output(kFile, "text");
  files.Output("C:\\here", "text");
  folder.Write("data/quendra/outside", "text");
  std::filesystem::create_symlink(Place("here"), Place("link"));
  std::filesystem::create_directory_symlink(folder.Path(), Place("out"));
  ASSERT_EQ(::mkfifo(Place("pipe").c_str(), 0600), 0);

  for (const char* path : {"C:\\missing", "C:\\WINDOWS", "C:\\WINDOWS\\missing", "C:\\missing\\name",
                           "C:\\link", "C:\\out\\data", "C:\\pipe", "C:\\..\\outside", "C:\\here\\name",
                           "C:\\here\\", "D:\\here", "", "here"})
    EXPECT_EQ(drive.FileOf(path), "") << path;
}

TEST_F(DriveFolderTest, A_drive_that_isnt_there_has_no_files) { EXPECT_EQ(drive.FileOf(kFile), ""); }

} // namespace
} // namespace quendra::platform::linux_
