#include "mail/mdlEmail.h"

#include "forms/Form.h"
#include "forms/headless/HeadlessDesktop.h"
#include "mail/ExpressAccount.h"
#include "mail/OutlookProfile.h"
#include "mail/ProfileFixture.h"
#include "mail/ProfileTemplate.h"
#include "platform/simulated/SimulatedMachine.h"
#include "runtime/Fault.h"
#include "runtime/Settings.h"

#include <gtest/gtest.h>

namespace quendra::mail {
namespace {

using Box = forms::headless::HeadlessDesktop::Box;

constexpr const char* kProfile = "C:\\WINDOWS\\bi.prf";
constexpr const char16_t* kBoxTitle = u"זלמר בינלאומי@נט";
constexpr int kStopBox = 0x180010;
constexpr int kInformationBox = 0x180040;

const Box kChoose{u"יש לבחור תוכנת דואר להגדרה!", kStopBox, kBoxTitle};
const Box kGiveName{u"יש לתת שם משתמש!", kStopBox, kBoxTitle};
const Box kDiffers{u"שם המשתמש בתוכנת הדואר יהיה שונה מזה שבחייגן!", kStopBox, kBoxTitle};
const Box kDone{u"חשבון דואר אלקטרוני נוצר בהצלחה.", kInformationBox, kBoxTitle};

Box Problem(const Text& number) {
  return {u"בעיה ביצירת חשבון הדואר.\r\n מס' שגיאה: " + number, kStopBox, kBoxTitle};
}

/// The boxes that the module reads.
struct MailBoxes : forms::Form {
  MailBoxes() : Form(u"boxes") {}
  void Design() override {}
  forms::TextBox userName{*this, u"frsCon_txtEmailUN"};
  forms::TextBox fullName{*this, u"frsCon_txtFullName"};
  forms::TextBox connection{*this, u"frsCon_txtUsername"};
};

struct EmailTest : testing::Test {
  EmailTest() {
    boxes.userName.Value = u"dana";
    boxes.fullName.Value = u"דנה כהן";
  }
  std::vector<Box> BoxesOf(std::int16_t tile) {
    selectedMail = tile;
    desktop.Boxes.clear();
    email.CreateMailAccount();
    return desktop.Boxes;
  }
  /// The text of the account that stands in the registry.
  std::string Registered(const std::string& name) {
    std::string domain = ToCodePage(settings::IspMailDomain);
    domain[0] = static_cast<char>(std::toupper(domain[0]));
    const auto value = machine.registry.Value(
        "HKEY_CURRENT_USER\\Software\\Microsoft\\Internet Account Manager\\Accounts\\" + domain, name);
    return value ? std::string(value->data.begin(), value->data.end() - 1) : "none";
  }
  bool HasDoneNothing() {
    return machine.registry.Calls.empty() && machine.Calls.empty() &&
           machine.processes.TerminateCalls.empty();
  }

  std::int16_t selectedMail = 0;
  MailBoxes boxes;
  forms::headless::HeadlessDesktop desktop;
  platform::simulated::SimulatedMachine machine;
  ExpressAccount express{machine.registry};
  OutlookProfile outlook{machine.files, machine.shellStart, machine.processes};
  mdlEmail email{{selectedMail, boxes.userName, boxes.fullName, boxes.connection}, desktop, express, outlook};
};

TEST_F(EmailTest, Without_a_chosen_program_a_box_asks_for_one_and_nothing_else_happens) {
  boxes.userName.Value = u"Dana@x";

  EXPECT_EQ(BoxesOf(-1), std::vector{kChoose});

  EXPECT_EQ(boxes.userName.Value(), u"Dana@x");
  EXPECT_TRUE(HasDoneNothing());
}

TEST_F(EmailTest, Neither_program_nor_name_asks_for_the_program_alone) {
  boxes.userName.Value = u"";
  EXPECT_EQ(BoxesOf(-1), std::vector{kChoose});
}

TEST_F(EmailTest, Without_a_user_name_a_box_asks_for_one_and_nothing_else_happens) {
  boxes.userName.Value = u"";

  EXPECT_EQ(BoxesOf(0), std::vector{kGiveName});

  EXPECT_TRUE(HasDoneNothing());
}

TEST_F(EmailTest, Outlook_Express_gets_its_account_in_the_registry) {
  EXPECT_EQ(BoxesOf(0), std::vector{kDone});

  EXPECT_EQ(Registered("POP3 User Name"), "dana");
  EXPECT_EQ(Registered("SMTP Display Name"), "\xE3\xF0\xE4 \xEB\xE4\xEF");
  EXPECT_TRUE(machine.Calls.empty());
}

TEST_F(EmailTest, Outlook_XP_2000_and_2003_get_the_same_profile_file_and_no_account_in_the_registry) {
  // The file by hand, with the names of this build.
  Text expected = FromCodePage(ProfileByHand());
  expected = Replaced(expected, u"mail.example.net", settings::IspMailHost);
  expected = Replaced(expected, u"example.net", settings::IspMailDomain);
  for (const std::int16_t tile : {1, 2, 4}) {
    machine.files.Contents.clear();

    EXPECT_EQ(BoxesOf(tile), std::vector{kDone}) << tile;

    EXPECT_EQ(machine.files.Contents[kProfile], ToCodePage(expected)) << tile;
  }
  EXPECT_TRUE(machine.registry.Calls.empty());
}

TEST_F(EmailTest, A_program_without_treatment_reports_the_number_minus_1) {
  for (const std::int16_t tile : {3, 5, 32767}) EXPECT_EQ(BoxesOf(tile), std::vector{Problem(u"-1")}) << tile;
  EXPECT_TRUE(HasDoneNothing());
}

TEST_F(EmailTest, A_name_with_a_domain_is_cut_to_what_stands_before_the_first_sign) {
  boxes.userName.Value = u"dana@one@two";

  EXPECT_EQ(BoxesOf(0), std::vector{kDone});

  EXPECT_EQ(boxes.userName.Value(), u"dana");
  EXPECT_EQ(Registered("POP3 User Name"), "dana");
}

TEST_F(EmailTest, A_name_is_made_small_and_loses_its_blanks_at_both_ends) {
  boxes.userName.Value = u"  Dana Cohen ";

  EXPECT_EQ(BoxesOf(0), std::vector{kDone});

  EXPECT_EQ(boxes.userName.Value(), u"dana cohen");
  EXPECT_EQ(Registered("POP3 User Name"), "dana cohen");
}

TEST_F(EmailTest, A_name_of_which_nothing_is_left_goes_on_as_the_box_was_not_empty) {
  boxes.userName.Value = u"@example.net";

  EXPECT_EQ(BoxesOf(0), std::vector{kDone});

  EXPECT_EQ(boxes.userName.Value(), u"");
  EXPECT_EQ(Registered("POP3 User Name"), "");
}

TEST_F(EmailTest, The_full_name_is_taken_as_it_stands) {
  boxes.fullName.Value = u" Dana@Home ";

  BoxesOf(0);

  EXPECT_EQ(Registered("SMTP Display Name"), " Dana@Home ");
  EXPECT_EQ(boxes.fullName.Value(), u" Dana@Home ");
}

TEST_F(EmailTest, A_connection_name_that_ends_in_097_and_is_the_same_otherwise_gives_no_warning) {
  boxes.connection.Value = u"dana@097";
  EXPECT_EQ(BoxesOf(0), std::vector{kDone});
  EXPECT_EQ(boxes.connection.Value(), u"dana@097");
}

TEST_F(EmailTest, The_name_is_mended_before_it_is_compared) {
  boxes.userName.Value = u" DANA@097 ";
  boxes.connection.Value = u"dana@097";
  EXPECT_EQ(BoxesOf(0), std::vector{kDone});
}

TEST_F(EmailTest, A_connection_name_with_the_other_realm_gives_the_warning) {
  boxes.connection.Value = u"dana@IZelmar";

  EXPECT_EQ(BoxesOf(0), std::vector{kDiffers});

  EXPECT_TRUE(HasDoneNothing());
}

TEST_F(EmailTest, A_name_that_differs_stops_with_the_warning_and_stays_mended) {
  boxes.userName.Value = u"DAN@x";
  boxes.connection.Value = u"dana@097";
  for (const std::int16_t tile : {0, 1, 2, 3, 4}) EXPECT_EQ(BoxesOf(tile), std::vector{kDiffers}) << tile;

  EXPECT_EQ(boxes.userName.Value(), u"dan");
  EXPECT_TRUE(HasDoneNothing());
}

TEST_F(EmailTest, Only_the_name_is_mended_so_capitals_of_the_connection_make_it_differ) {
  boxes.connection.Value = u"Dana@097";
  EXPECT_EQ(BoxesOf(0), std::vector{kDiffers});
}

TEST_F(EmailTest, The_answer_yes_to_the_warning_goes_on_and_every_other_stops) {
  boxes.connection.Value = u"other";
  for (const int answer : {0, 1, 2, 7}) {
    desktop.AnswerNextBox(answer);
    EXPECT_EQ(BoxesOf(0), std::vector{kDiffers}) << answer;
  }
  desktop.AnswerNextBox(6);
  EXPECT_EQ(BoxesOf(0), (std::vector{kDiffers, kDone}));
}

TEST_F(EmailTest, An_empty_connection_name_gives_no_warning_and_one_of_its_realm_alone_does) {
  boxes.connection.Value = u"";
  EXPECT_EQ(BoxesOf(0), std::vector{kDone});
  boxes.connection.Value = u"@097";
  EXPECT_EQ(BoxesOf(0), std::vector{kDiffers});
}

TEST_F(EmailTest, An_error_of_the_registry_stands_behind_the_text) {
  machine.registry.RefuseAll(1009);
  EXPECT_EQ(BoxesOf(0), std::vector{Problem(u"1009")});
}

TEST_F(EmailTest, Another_Windows_directory_is_told_by_the_length_of_its_name) {
  machine.files.WindowsDirectory = "C:\\WINNT";
  for (const std::int16_t tile : {1, 2, 4}) EXPECT_EQ(BoxesOf(tile), std::vector{Problem(u"8")});
  EXPECT_TRUE(machine.files.Contents.empty());
}

TEST_F(EmailTest, A_directory_query_that_fails_is_told_as_a_success_with_nothing_written) {
  machine.files.DirectoryAnswer = 0;
  EXPECT_EQ(BoxesOf(1), std::vector{kDone});
  EXPECT_TRUE(machine.files.Contents.empty());
}

TEST_F(EmailTest, A_second_press_writes_the_same_again_without_complaint) {
  for (const std::int16_t tile : {0, 0, 1, 1}) EXPECT_EQ(BoxesOf(tile), std::vector{kDone});
}

TEST_F(EmailTest, A_file_that_cannot_be_written_ends_the_program_with_the_run_time_s_message) {
  machine.files.OutputFault = Fault::kDiskFull;
  selectedMail = 1;

  desktop.Dispatch([&] { email.CreateMailAccount(); });

  ASSERT_EQ(desktop.Boxes.size(), 1u);
  EXPECT_NE(desktop.Boxes[0].text.find(u"61"), Text::npos);
  EXPECT_EQ(desktop.EndStatus, 1);
}

TEST_F(EmailTest, A_command_interpreter_that_is_missing_ends_the_program_with_fault_53) {
  machine.shellStart.Fail = true;
  selectedMail = 4;

  desktop.Dispatch([&] { email.CreateMailAccount(); });

  ASSERT_EQ(desktop.Boxes.size(), 1u);
  EXPECT_NE(desktop.Boxes[0].text.find(u"53"), Text::npos);
  EXPECT_EQ(desktop.EndStatus, 1);
}

} // namespace
} // namespace quendra::mail
