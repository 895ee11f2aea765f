#include "platform/linux/files/DriveFixture.h"

#include <sys/file.h>
#include <sys/resource.h>

#include <csignal>

namespace quendra::platform::linux_ {
namespace {

struct LinuxFilesTest : DriveTest {};

TEST_F(LinuxFilesTest, Nothing_is_made_before_the_first_file_is_written) {
  std::string buffer(20, ' ');
  files.GetWindowsDirectoryA(buffer);
  drive.FileOf(kFile);
  EXPECT_FALSE(std::filesystem::exists(folder / "data"));
}

TEST_F(LinuxFilesTest, The_drive_and_its_Windows_directory_are_made_for_the_user_alone) {
  files.Output(kFile, "text");

  EXPECT_EQ(Content("WINDOWS/bi.prf"), "text");
  for (const char* made : {"data", "data/quendra", "data/quendra/drive_c", "data/quendra/drive_c/WINDOWS"})
    EXPECT_EQ(ModeOf(folder / made), 0700u) << made;
}

TEST_F(LinuxFilesTest, A_file_is_the_users_alone_also_in_place_of_one_that_others_could_read) {
  files.Output(kFile, "text");
  EXPECT_EQ(ModeOf(Place("WINDOWS/bi.prf")), 0600u);

  ASSERT_EQ(::chmod(Place("WINDOWS/bi.prf").c_str(), 0666), 0);
  files.Output(kFile, "text");
  EXPECT_EQ(ModeOf(Place("WINDOWS/bi.prf")), 0600u);
}

TEST_F(LinuxFilesTest, No_other_folder_is_made_and_names_differ_by_their_case) {
  EXPECT_EQ(FaultOf("C:\\windows\\bi.prf"), 76);
  EXPECT_EQ(FaultOf("C:\\WINDOWS\\system\\bi.prf"), 76);
  EXPECT_EQ(FaultOf("c:\\WINDOWS\\bi.prf"), 76);

  files.Output(kFile, "one");
  files.Output("C:\\WINDOWS\\BI.PRF", "two");
  EXPECT_EQ(Names("WINDOWS"), (std::vector<std::string>{"BI.PRF", "bi.prf"}));
}

TEST_F(LinuxFilesTest, A_folder_that_the_user_made_takes_files) {
  std::filesystem::create_directories(Place("WINDOWS/system"));
  files.Output("C:\\WINDOWS\\system\\bi.prf", "text");
  EXPECT_EQ(Content("WINDOWS/system/bi.prf"), "text");
}

TEST_F(LinuxFilesTest, A_name_in_Hebrew_is_the_same_name_on_this_system) {
  files.Output("C:\\WINDOWS\\\xE0\xE1", "text");
  EXPECT_EQ(Content("WINDOWS/\u05D0\u05D1"), "text");
}

TEST_F(LinuxFilesTest, No_name_leads_out_of_the_drive) {
  files.Output(kFile, "text");
  folder.Write("data/quendra/outside", "before");
  for (const char* path : {"C:\\..\\outside", "C:\\WINDOWS\\..\\..\\outside", "C:\\../outside",
                           "C:\\WINDOWS/../../outside", "C:\\.."})
    EXPECT_EQ(FaultOf(path), 76) << path;
  EXPECT_EQ(ReadFile(folder / "data/quendra/outside", 100), "before");
}

TEST_F(LinuxFilesTest, A_link_of_a_folder_is_not_followed) {
  std::filesystem::create_directories(folder / "outside");
  std::filesystem::create_directories(Place(""));
  std::filesystem::create_directory_symlink(folder / "outside", Place("WINDOWS"));

  EXPECT_EQ(FaultOf(kFile), 76);

  EXPECT_TRUE(std::filesystem::is_empty(folder / "outside"));
}

TEST_F(LinuxFilesTest, A_link_in_the_place_of_the_drive_is_not_followed) {
  std::filesystem::create_directories(folder / "outside");
  std::filesystem::create_directories(folder / "data/quendra");
  std::filesystem::create_directory_symlink(folder / "outside", folder / "data/quendra/drive_c");

  EXPECT_EQ(FaultOf(kFile), 76);
  EXPECT_EQ(FaultOf("C:\\bi.prf"), 76);

  EXPECT_TRUE(std::filesystem::is_empty(folder / "outside"));
}

TEST_F(LinuxFilesTest, A_link_of_a_file_is_neither_followed_nor_replaced) {
  files.Output("C:\\WINDOWS\\other", "text");
  const std::string outside = folder.Write("outside", "before");
  std::filesystem::create_symlink(outside, Place("WINDOWS/bi.prf"));

  EXPECT_EQ(FaultOf(kFile), 75);

  EXPECT_EQ(ReadFile(outside, 100), "before");
  EXPECT_TRUE(std::filesystem::is_symlink(Place("WINDOWS/bi.prf")));
}

TEST_F(LinuxFilesTest, A_pipe_under_the_name_is_not_waited_on_and_stays) {
  std::filesystem::create_directories(Place("WINDOWS"));
  ASSERT_EQ(::mkfifo(Place("WINDOWS/bi.prf").c_str(), 0600), 0);

  EXPECT_EQ(FaultOf(kFile), 75);

  EXPECT_TRUE(std::filesystem::is_fifo(Place("WINDOWS/bi.prf")));
}

TEST_F(LinuxFilesTest, A_file_in_the_place_of_a_folder_is_fault_76) {
  folder.Write("data/quendra/drive_c/WINDOWS", "text");
  EXPECT_EQ(FaultOf(kFile), 76);
}

TEST_F(LinuxFilesTest, A_file_in_the_place_of_the_drive_is_fault_76) {
  folder.Write("data/quendra/drive_c", "text");
  EXPECT_EQ(FaultOf(kFile), 76);
}

TEST_F(LinuxFilesTest, A_data_folder_that_cannot_be_made_is_fault_76) {
  folder.Write("data", "a file where the folder should be");
  EXPECT_EQ(FaultOf(kFile), 76);
}

TEST_F(LinuxFilesTest, A_name_that_is_too_long_is_fault_75_and_a_folder_s_is_fault_76) {
  EXPECT_EQ(FaultOf("C:\\WINDOWS\\" + std::string(255, 'x')), 0);
  EXPECT_EQ(FaultOf("C:\\WINDOWS\\" + std::string(256, 'x')), 75);
  EXPECT_EQ(FaultOf("C:\\" + std::string(256, 'x') + "\\bi.prf"), 76);
  EXPECT_EQ(Names("WINDOWS"), std::vector<std::string>{std::string(255, 'x')});
}

TEST_F(LinuxFilesTest, A_folder_without_the_right_to_write_is_fault_70_and_its_file_stays) {
  files.Output(kFile, "before");
  ASSERT_EQ(::chmod(Place("WINDOWS").c_str(), 0500), 0);

  const Child other([&] {
    if (!BecomeUser()) return std::string("no user");
    return Written("text");
  });

  EXPECT_EQ(other.Answer(), "70 before");
}

TEST_F(LinuxFilesTest, A_drive_or_data_folder_that_may_not_be_made_is_fault_70) {
  std::filesystem::create_directories(folder / "data");
  ASSERT_EQ(::chmod((folder / "data").c_str(), 0500), 0);
  const Child noData([&] { return BecomeUser() ? std::to_string(FaultOf(kFile)) : "no user"; });
  EXPECT_EQ(noData.Answer(), "70");

  ASSERT_EQ(::chmod((folder / "data").c_str(), 0700), 0);
  std::filesystem::create_directories(Place(""));
  ASSERT_EQ(::chmod(Place("").c_str(), 0500), 0);
  const Child noWindows([&] { return BecomeUser() ? std::to_string(FaultOf(kFile)) : "no user"; });
  EXPECT_EQ(noWindows.Answer(), "70");
}

TEST_F(LinuxFilesTest, A_file_that_its_owner_made_read_only_is_fault_70_and_stays) {
  files.Output(kFile, "before");
  ASSERT_EQ(::chmod(Place("WINDOWS/bi.prf").c_str(), 0400), 0);

  const Child other([&] {
    if (!BecomeUser()) return std::string("no user");
    return Written("text");
  });

  EXPECT_EQ(other.Answer(), "70 before");
}

TEST_F(LinuxFilesTest, A_full_disk_is_fault_61_keeps_the_old_file_and_leaves_no_part) {
  if (::geteuid() != 0)
    GTEST_SKIP() << "needs root: mounts a small disk, seen by a process of the test alone";
  const Child other([&] {
    if (!MountSmallDisk()) return std::string("no disk");
    files.Output(kFile, "before");
    std::string said = Written(std::string(1'000'000, 'x'));
    for (const std::string& name : Names("WINDOWS")) said += " " + name;
    return said + " " + Written("after");
  });

  EXPECT_EQ(other.Answer(), "61 before bi.prf 0 after");
}

TEST_F(LinuxFilesTest, A_full_disk_without_an_old_file_leaves_none_under_the_name) {
  if (::geteuid() != 0)
    GTEST_SKIP() << "needs root: mounts a small disk, seen by a process of the test alone";
  const Child other([&] {
    if (!MountSmallDisk()) return std::string("no disk");
    const std::string said = Written(std::string(1'000'000, 'x'));
    return said + (Names("WINDOWS").empty() ? " empty" : " something");
  });

  EXPECT_EQ(other.Answer(), "61 none empty");
}

TEST_F(LinuxFilesTest, A_disk_without_room_for_a_folder_is_fault_61) {
  if (::geteuid() != 0)
    GTEST_SKIP() << "needs root: mounts a small disk, seen by a process of the test alone";
  const Child other([&] {
    // Room for its own folder and one more entry.
    if (!MountSmallDisk() || ::mount("", folder.Path().c_str(), "", MS_REMOUNT, "size=128k,nr_inodes=2") != 0)
      return std::string("no disk");
    return std::to_string(FaultOf(kFile));
  });

  EXPECT_EQ(other.Answer(), "61");
}

TEST_F(LinuxFilesTest, A_disk_that_is_read_only_is_fault_70) {
  if (::geteuid() != 0)
    GTEST_SKIP() << "needs root: mounts a small disk, seen by a process of the test alone";
  const Child other([&] {
    if (!MountSmallDisk()) return std::string("no disk");
    files.Output(kFile, "before");
    if (::mount("", folder.Path().c_str(), "", MS_REMOUNT | MS_RDONLY, nullptr) != 0)
      return std::string("no mount");
    return Written("text");
  });

  EXPECT_EQ(other.Answer(), "70 before");
}

TEST_F(LinuxFilesTest, A_file_over_the_user_s_limit_of_size_is_fault_75_and_the_old_one_stays) {
  files.Output(kFile, "before");
  const Child other([&] {
    ::signal(SIGXFSZ, SIG_IGN);
    const rlimit limit{1000, 1000};
    if (::setrlimit(RLIMIT_FSIZE, &limit) != 0) return std::string("no limit");
    return Written(std::string(5000, 'x'));
  });

  EXPECT_EQ(other.Answer(), "75 before");
  EXPECT_EQ(Names("WINDOWS"), std::vector<std::string>{"bi.prf"});
}

TEST_F(LinuxFilesTest, A_program_that_is_killed_while_it_writes_leaves_the_old_file_under_the_name) {
  files.Output(kFile, "before");
  const Child killed([&] {
    const rlimit limit{1000, 1000};
    const rlimit noDump{0, 0};
    if (::setrlimit(RLIMIT_CORE, &noDump) != 0 || ::setrlimit(RLIMIT_FSIZE, &limit) != 0)
      return std::string("no limit");
    // The system's signal for a file over the limit ends the process in the midst of the bytes.
    files.Output(kFile, std::string(5000, 'x'));
    return std::string("not killed");
  });

  EXPECT_EQ(killed.Answer(), "");
  EXPECT_EQ(Content("WINDOWS/bi.prf"), "before");
}

TEST_F(LinuxFilesTest, Part_of_an_earlier_run_is_left_alone_and_does_not_hinder) {
  std::filesystem::create_directories(Place("WINDOWS"));
  const std::string leftover = ".part-" + std::to_string(::getpid()) + "-1";
  folder.Write("data/quendra/drive_c/WINDOWS/" + leftover, "left");

  files.Output(kFile, "text");

  EXPECT_EQ(Content("WINDOWS/bi.prf"), "text");
  EXPECT_EQ(Content("WINDOWS/" + leftover), "left");
}

TEST_F(LinuxFilesTest, Programs_that_write_at_once_leave_the_whole_file_of_one_of_them) {
  const auto writeMany = [&](char sign) -> std::function<std::string()> {
    return [this, sign] {
      for (int i = 0; i < 100; ++i) files.Output(kFile, std::string(50'000, sign));
      return std::string("done");
    };
  };
  const auto readMany = [&]() -> std::string {
    for (int i = 0; i < 2000; ++i) {
      const std::string content = Content("WINDOWS/bi.prf");
      if (content != "none" && content != std::string(50'000, content[0])) return "torn";
    }
    return "whole";
  };

  EXPECT_EQ(AtOnce({writeMany('a'), writeMany('b'), readMany}),
            (std::vector<std::string>{"done", "done", "whole"}));

  EXPECT_EQ(Names("WINDOWS"), std::vector<std::string>{"bi.prf"});
}

} // namespace
} // namespace quendra::platform::linux_
