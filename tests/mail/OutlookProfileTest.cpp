#include "mail/OutlookProfile.h"

#include "mail/ProfileTemplate.h"
#include "platform/simulated/SimulatedMachine.h"
#include "runtime/Fault.h"
#include "runtime/Settings.h"

#include <gtest/gtest.h>

namespace quendra::mail {
namespace {

constexpr const char* kFile = "C:\\WINDOWS\\bi.prf";

struct OutlookProfileTest : testing::Test {
  /// The number of the fault that making the profile raises, 0 for none.
  int FaultOfCreating() {
    try {
      profile.CreateOutlookProfile(u"dana", u"Dana");
    } catch (const Fault& fault) {
      return fault.number;
    }
    return 0;
  }

  platform::simulated::SimulatedMachine machine;
  OutlookProfile profile{machine.files, machine.shellStart, machine.processes};
};

TEST_F(OutlookProfileTest, The_file_is_written_then_opened_hidden_by_the_command_interpreter) {
  EXPECT_EQ(profile.CreateOutlookProfile(u"dana", u"Dana"), 0);

  EXPECT_EQ(machine.Calls, (std::vector<std::string>{"Output C:\\WINDOWS\\bi.prf",
                                                     "Shell 0 CMD /c \"C:\\WINDOWS\\bi.prf\""}));
}

TEST_F(OutlookProfileTest, A_process_is_ended_by_a_handle_of_none_with_exit_code_0_which_ends_nothing) {
  machine.AddProcess({.id = 4, .name = "System"});

  profile.CreateOutlookProfile(u"dana", u"Dana");

  EXPECT_EQ(machine.processes.TerminateCalls, std::vector<std::string>{"0 0"});
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

TEST_F(OutlookProfileTest, The_file_holds_the_provider_s_servers_and_the_names) {
  profile.CreateOutlookProfile(u"dana", u"Dana Cohen");

  EXPECT_EQ(
      machine.files.Contents[kFile],
      ToCodePage(ProfileText({settings::IspMailHost, settings::IspMailDomain, u"dana", u"Dana Cohen"})));
}

TEST_F(OutlookProfileTest, A_Hebrew_name_is_written_in_the_code_page) {
  profile.CreateOutlookProfile(u"dana", u"דנה");

  EXPECT_NE(machine.files.Contents[kFile].find("DisplayName = \xE3\xF0\xE4\r\n"), std::string::npos);
}

TEST_F(OutlookProfileTest, What_the_code_page_lacks_becomes_a_question_mark) {
  profile.CreateOutlookProfile(u"dana", u"日本");

  EXPECT_NE(machine.files.Contents[kFile].find("DisplayName = ??\r\n"), std::string::npos);
}

TEST_F(OutlookProfileTest, A_second_run_overwrites_the_file) {
  profile.CreateOutlookProfile(u"first", u"First of a longer name");
  profile.CreateOutlookProfile(u"second", u"Second");

  const std::string content = machine.files.Contents[kFile];
  EXPECT_EQ(content.find("first"), std::string::npos);
  EXPECT_NE(content.find("POP3UserName = second\r\n"), std::string::npos);
}

TEST_F(OutlookProfileTest, A_directory_of_another_length_is_the_result_and_nothing_is_written) {
  for (const std::string directory : {"C:\\WINNT", "C:\\WINDOWS1", "C:\\WINDOW", "D:\\SYSTEMS\\WIN"}) {
    machine.files.WindowsDirectory = directory;
    EXPECT_EQ(profile.CreateOutlookProfile(u"dana", u"Dana"), static_cast<std::int32_t>(directory.size()));
  }
  EXPECT_TRUE(machine.Calls.empty());
  EXPECT_TRUE(machine.processes.TerminateCalls.empty());
}

TEST_F(OutlookProfileTest, Any_directory_of_ten_characters_will_do) {
  machine.files.WindowsDirectory = "D:\\WINDOZE";

  EXPECT_EQ(profile.CreateOutlookProfile(u"dana", u"Dana"), 0);

  EXPECT_TRUE(machine.files.Contents.contains("D:\\WINDOZE\\bi.prf"));
}

TEST_F(OutlookProfileTest, A_query_that_fails_gives_0_with_nothing_written) {
  machine.files.DirectoryAnswer = 0;

  EXPECT_EQ(profile.CreateOutlookProfile(u"dana", u"Dana"), 0);

  EXPECT_TRUE(machine.Calls.empty());
}

TEST_F(OutlookProfileTest, A_length_with_the_highest_bit_is_a_negative_result) {
  machine.files.DirectoryAnswer = 0xFFFFFFFF;

  EXPECT_EQ(profile.CreateOutlookProfile(u"dana", u"Dana"), -1);
}

TEST_F(OutlookProfileTest, The_directory_ends_at_its_first_NUL_whatever_its_length_is_said_to_be) {
  machine.files.WindowsDirectory = "C:\\WINNT";
  machine.files.DirectoryAnswer = 10;

  EXPECT_EQ(profile.CreateOutlookProfile(u"dana", u"Dana"), 0);

  EXPECT_TRUE(machine.files.Contents.contains("C:\\WINNT\\bi.prf"));
}

/// Writes down with what it is asked.
struct AskedFiles : platform::simulated::SimulatedFiles {
  using SimulatedFiles::SimulatedFiles;
  std::string buffer;
  std::uint32_t GetWindowsDirectoryA(std::span<char> room) override {
    buffer.assign(room.begin(), room.end());
    return SimulatedFiles::GetWindowsDirectoryA(room);
  }
};

TEST_F(OutlookProfileTest, The_directory_is_asked_for_with_a_buffer_of_250_blanks) {
  platform::simulated::Core core;
  AskedFiles asked(core);

  OutlookProfile(asked, machine.shellStart, machine.processes).CreateOutlookProfile(u"dana", u"Dana");

  EXPECT_EQ(asked.buffer, std::string(250, ' '));
}

TEST_F(OutlookProfileTest, A_file_that_cannot_be_written_is_a_fault_and_nothing_is_started) {
  for (const int fault : {76, 75, 70, 61}) {
    machine.files.OutputFault = fault;
    EXPECT_EQ(FaultOfCreating(), fault);
  }
  EXPECT_EQ(machine.Calls, std::vector<std::string>(4, "Output C:\\WINDOWS\\bi.prf"));
  EXPECT_TRUE(machine.processes.TerminateCalls.empty());
}

TEST_F(OutlookProfileTest, A_start_that_fails_is_fault_53_and_the_file_stays) {
  machine.shellStart.Fail = true;

  EXPECT_EQ(FaultOfCreating(), 53);

  EXPECT_TRUE(machine.files.Contents.contains(kFile));
  EXPECT_TRUE(machine.processes.TerminateCalls.empty());
}

} // namespace
} // namespace quendra::mail
