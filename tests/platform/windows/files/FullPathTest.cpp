#include "platform/windows/files/FullPath.h"

#include <gtest/gtest.h>

namespace quendra::platform::windows {
namespace {

TEST(FullPathTest, A_path_from_a_drive_on_is_full) {
  for (const TextView path : {u"C:\\name", u"d:\\a b\\..c\\name.txt", u"C:\\\u05D0\\..."})
    EXPECT_TRUE(IsFullPath(path)) << ToUtf8(path);
}

TEST(FullPathTest, What_the_working_folder_decides_is_not) {
  for (const TextView path : {u"", u"C", u"C:", u"C:\\", u"C:name", u"\\name", u"name", u"\\\\server\\share",
                              u"\\\\.\\C:\\name", u"1:\\name"})
    EXPECT_FALSE(IsFullPath(path)) << ToUtf8(path);
}

TEST(FullPathTest, No_name_is_empty_leads_up_or_aside) {
  for (const TextView path : {u"C:\\\\name", u"C:\\a\\", u"C:\\..", u"C:\\.\\a", u"C:\\a\\..\\b", u"C:\\a/b",
                              u"C:\\a:stream", u"C:\\a\\\\b"})
    EXPECT_FALSE(IsFullPath(path)) << ToUtf8(path);
}

} // namespace
} // namespace quendra::platform::windows
