#include "platform/linux/files/DrivePath.h"

#include <gtest/gtest.h>

namespace quendra::platform::linux_ {
namespace {

TEST(DrivePathTest, A_path_is_parted_into_its_folders_and_a_name) {
  EXPECT_EQ(ParseDrivePath("C:\\bi.prf"), (DrivePath{{}, "bi.prf"}));
  EXPECT_EQ(ParseDrivePath("C:\\WINDOWS\\bi.prf"), (DrivePath{{"WINDOWS"}, "bi.prf"}));
  EXPECT_EQ(ParseDrivePath("C:\\a b\\..c\\d..\\..."), (DrivePath{{"a b", "..c", "d.."}, "..."}));
}

TEST(DrivePathTest, Names_come_from_the_code_page) {
  EXPECT_EQ(ParseDrivePath("C:\\\xE0\\\xFA"), (DrivePath{{"\u05D0"}, "\u05EA"}));
}

TEST(DrivePathTest, A_path_ends_at_its_NUL) {
  EXPECT_EQ(ParseDrivePath(std::string("C:\\a\0\\..", 8)), (DrivePath{{}, "a"}));
}

TEST(DrivePathTest, A_path_of_another_kind_has_no_parts) {
  for (const char* path :
       {"", "C", "C:", "C:\\", "C:a", "c:\\a", "D:\\a", "\\a", "/a", "a", "\\\\C:\\a", "C:/a"})
    EXPECT_FALSE(ParseDrivePath(path)) << path;
}

TEST(DrivePathTest, No_name_leads_up_or_aside) {
  for (const char* path : {"C:\\..", "C:\\.", "C:\\..\\a", "C:\\a\\..\\b", "C:\\a\\.\\b", "C:\\a\\..",
                           "C:\\a/b", "C:\\/etc/passwd", "C:\\a\\/b", "C:\\a:b", "C:\\a:\\b"})
    EXPECT_FALSE(ParseDrivePath(path)) << path;
}

TEST(DrivePathTest, No_name_is_empty) {
  for (const char* path : {"C:\\\\a", "C:\\a\\", "C:\\a\\\\b", "C:\\\\"})
    EXPECT_FALSE(ParseDrivePath(path)) << path;
}

} // namespace
} // namespace quendra::platform::linux_
