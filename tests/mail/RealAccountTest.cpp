// The accounts as this machine keeps them: read back by other means than the program's own.

#include "forms/Form.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "mail/ExpressAccount.h"
#include "mail/OutlookProfile.h"
#include "mail/ProfileFixture.h"
#include "mail/mdlEmail.h"
#include "platform/linux/LinuxMachine.h"
#include "platform/linux/system/Files.h"
#include "platform/linux/system/SessionFixture.h"
#include "runtime/Settings.h"

#include <sched.h>
#include <sqlite3.h>
#include <sys/mount.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cctype>
#include <filesystem>

namespace quendra::mail {
namespace {

struct RealBoxes : forms::Form {
  RealBoxes() : Form(u"boxes") {}
  void Design() override {}
  forms::TextBox userName{*this, u"frsCon_txtEmailUN"};
  forms::TextBox fullName{*this, u"frsCon_txtFullName"};
  forms::TextBox connection{*this, u"frsCon_txtUsername"};
};

struct RealAccountTest : platform::linux_::SessionTest {
  RealAccountTest() {
    environment.Set("XDG_DATA_HOME", folder / "data");
    AddProgram("xdg-open");
    boxes.userName.Value = u"Dana@097";
    boxes.fullName.Value = u"דנה כהן";
    boxes.connection.Value = u"dana@097";
  }

  /// The icon flags of the boxes that came.
  std::vector<int> Create(std::int16_t tile) {
    selectedMail = tile;
    platform::linux_::LinuxMachine machine(desktop, desktop);
    const platform::Machine operations = machine.Operations();
    ExpressAccount express(operations.registry);
    OutlookProfile outlook(operations.files, operations.shellStart, operations.processes);
    mdlEmail({selectedMail, boxes.userName, boxes.fullName, boxes.connection}, desktop, express, outlook)
        .CreateMailAccount();
    std::vector<int> icons;
    for (const auto& box : desktop.Boxes) icons.push_back(box.flags & 0xF0);
    return icons;
  }

  /// How the program ends when making the account fails, with the text of its last box.
  std::string EndOf(std::int16_t tile) {
    desktop.Dispatch([&] { Create(tile); });
    return (desktop.Ended ? "ended with " + std::to_string(desktop.EndStatus) : std::string("goes on")) +
           ": " + (desktop.Boxes.empty() ? std::string("no box") : ToUtf8(desktop.Boxes.back().text));
  }

  /// A line a value in their order of names, "type hexadecimal-bytes name", as the database's library reads
  /// them.
  std::string AccountInDatabase() const {
    sqlite3* database = nullptr;
    EXPECT_EQ(sqlite3_open_v2((folder / "data/quendra/registry.sqlite").c_str(), &database,
                              SQLITE_OPEN_READONLY, nullptr),
              SQLITE_OK);
    const char* sql = R"(
      SELECT data.type || ' ' || hex(data.bytes) || ' ' || data.name
      FROM data JOIN keys AS account ON account.number = data.key
      JOIN keys AS accounts ON accounts.number = account.parent AND accounts.name = 'Accounts'
      JOIN keys AS manager ON manager.number = accounts.parent AND manager.name = 'Internet Account Manager'
      JOIN keys AS maker ON maker.number = manager.parent AND maker.name = 'Microsoft'
      JOIN keys AS software ON software.number = maker.parent AND software.name = 'Software'
      WHERE software.parent = 0x80000001 AND account.name = ? COLLATE BINARY ORDER BY data.name)";
    sqlite3_stmt* statement = nullptr;
    EXPECT_EQ(sqlite3_prepare_v2(database, sql, -1, &statement, nullptr), SQLITE_OK);
    std::string key = ToUtf8(settings::IspMailDomain);
    key[0] = static_cast<char>(std::toupper(key[0]));
    sqlite3_bind_text(statement, 1, key.c_str(), -1, SQLITE_TRANSIENT);
    std::string lines;
    while (sqlite3_step(statement) == SQLITE_ROW)
      lines += std::string(reinterpret_cast<const char*>(sqlite3_column_text(statement, 0))) + "\n";
    sqlite3_finalize(statement);
    sqlite3_close(database);
    return lines;
  }

  static std::string Hexadecimal(const std::string& bytes) {
    constexpr std::string_view digits = "0123456789ABCDEF";
    std::string text;
    for (const char byte : bytes) {
      text.push_back(digits[static_cast<unsigned char>(byte) >> 4]);
      text.push_back(digits[static_cast<unsigned char>(byte) & 15]);
    }
    return text;
  }

  std::int16_t selectedMail = -1;
  RealBoxes boxes;
  forms::headless::PolledDesktop desktop;
};

TEST_F(RealAccountTest, The_database_holds_the_account_of_Outlook_Express) {
  EXPECT_EQ(Create(kOutlookExpress), std::vector<int>{forms::kInformation});

  const std::string host = Hexadecimal(ToUtf8(settings::IspMailHost)) + "00";
  const std::string address = Hexadecimal("dana@" + ToUtf8(settings::IspMailDomain)) + "00";
  EXPECT_EQ(AccountInDatabase(), "1 E6ECEEF820E1E9F0ECE0E5EEE900 Account Name\n"
                                 "4 03000000 Connection Type\n"
                                 "4 02000000 DCEmail\n"
                                 "4 00000000 Leave Mail On Server\n"
                                 "4 6E000000 POP3 Port\n"
                                 "4 00000000 POP3 Prompt for Password\n"
                                 "1 " +
                                     host +
                                     " POP3 Server\n"
                                     "4 00000000 POP3 Skip Account\n"
                                     "4 B4000000 POP3 Timeout\n"
                                     "1 64616E6100 POP3 User Name\n"
                                     "1 E3F0E420EBE4EF00 SMTP Display Name\n"
                                     "1 " +
                                     address +
                                     " SMTP Email Address\n"
                                     "4 19000000 SMTP Port\n"
                                     "1 " +
                                     host +
                                     " SMTP Server\n"
                                     "4 B4000000 SMTP Timeout\n");
}

TEST_F(RealAccountTest, The_account_is_written_again_by_a_later_run) {
  Create(kOutlookExpress);
  const std::string first = AccountInDatabase();
  boxes.userName.Value = u"other";
  boxes.connection.Value = u"";
  Create(kOutlookExpress);
  EXPECT_NE(AccountInDatabase(), first);
  boxes.userName.Value = u"dana";
  Create(kOutlookExpress);

  EXPECT_EQ(AccountInDatabase(), first);
}

TEST_F(RealAccountTest, The_profile_file_lies_in_the_folder_for_the_drive_byte_for_byte_and_is_opened) {
  EXPECT_EQ(Create(kOutlook2003), std::vector<int>{forms::kInformation});

  const std::string file = folder / "data/quendra/drive_c/WINDOWS/bi.prf";
  Text expected = FromCodePage(ProfileByHand());
  expected = Replaced(expected, u"mail.example.net", settings::IspMailHost);
  expected = Replaced(expected, u"example.net", settings::IspMailDomain);
  EXPECT_EQ(platform::linux_::ReadFile(file, 100'000), ToCodePage(expected));
  EXPECT_EQ(GivenTo("xdg-open"), file + "\n");
  struct stat status {};
  ASSERT_EQ(::stat(file.c_str(), &status), 0);
  EXPECT_EQ(status.st_mode & 0777U, 0600U);
}

TEST_F(RealAccountTest, Both_accounts_are_what_the_tour_reads_with_libraries_of_its_own) {
  Create(kOutlookExpress);
  Create(kOutlook2000);

  const std::string read =
      "( cd " QUENDRA_SOURCE_DIR "/scripts/lib && /usr/bin/python3 -B -c 'import mail, sys; "
      "print(*mail.lines(), sep=\"\\n\"); sys.exit(len(mail.wrong_with(*sys.argv[1:])))' ";
  const std::string domain = " " + ToUtf8(settings::IspMailDomain) + " > " + (folder / "said") + " )";
  EXPECT_TRUE(platform::linux_::RunShell(read + "dana '\u05D3\u05E0\u05D4 \u05DB\u05D4\u05DF'" + domain));
  const std::string said = platform::linux_::ReadFile(folder / "said", 100'000).value_or("nothing");
  EXPECT_NE(said.find(": Account Name = \u05D6\u05DC\u05DE\u05E8 "), std::string::npos) << said;
  EXPECT_NE(said.find("mode 600, 17 sections, 160 entries\n"), std::string::npos) << said;
  EXPECT_FALSE(platform::linux_::RunShell(read + "other Other" + domain));
}

TEST_F(RealAccountTest, Without_an_opener_the_profile_file_is_there_and_the_account_counts_as_made) {
  std::filesystem::remove(folder / "programs/xdg-open");

  EXPECT_EQ(Create(kOutlookXp), std::vector<int>{forms::kInformation});

  EXPECT_TRUE(std::filesystem::exists(folder / "data/quendra/drive_c/WINDOWS/bi.prf"));
}

TEST_F(RealAccountTest, A_full_disk_ends_the_program_with_fault_61_and_leaves_nothing_of_the_file) {
  if (::geteuid() != 0)
    GTEST_SKIP() << "needs root: mounts a small disk, seen by a process of the test alone";
  const std::string data = folder / "data";
  std::filesystem::create_directory(data);
  const platform::linux_::Child other([&] {
    if (::unshare(CLONE_NEWNS) != 0 || ::mount("none", "/", nullptr, MS_REC | MS_PRIVATE, nullptr) != 0 ||
        ::mount("tmpfs", data.c_str(), "tmpfs", 0, "size=4k") != 0)
      return std::string("no disk");
    const std::string said = EndOf(kOutlook2000);
    return said + (std::filesystem::is_empty(data + "/quendra/drive_c/WINDOWS") ? ", empty" : ", something");
  });

  EXPECT_EQ(other.Answer(), "ended with 1: Run-time error '61':\n\nDisk full, empty");
}

TEST_F(RealAccountTest, A_folder_without_rights_ends_the_program_with_fault_70) {
  std::filesystem::create_directories(folder / "data/quendra/drive_c/WINDOWS");
  ASSERT_EQ(::chmod((folder / "data/quendra/drive_c/WINDOWS").c_str(), 0555), 0);
  for (const char* above : {"", "data", "data/quendra", "data/quendra/drive_c"})
    ASSERT_EQ(::chmod((folder / above).c_str(), 0755), 0);
  const platform::linux_::Child other([&] {
    if (::geteuid() == 0 && (::setgid(65534) != 0 || ::setuid(65534) != 0)) return std::string("no user");
    return EndOf(kOutlook2003);
  });

  EXPECT_EQ(other.Answer(), "ended with 1: Run-time error '70':\n\nPermission denied");
}

TEST_F(RealAccountTest, A_registry_that_cannot_be_opened_is_told_with_its_number) {
  folder.Write("data", "a file where the folder should be");

  EXPECT_EQ(Create(kOutlookExpress), std::vector<int>{forms::kCritical});

  EXPECT_TRUE(desktop.Boxes[0].text.ends_with(u": 5")) << ToUtf8(desktop.Boxes[0].text);
}

} // namespace
} // namespace quendra::mail
