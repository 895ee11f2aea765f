#include "platform/linux/programs/DesktopEntry.h"
#include "platform/linux/programs/KeyFile.h"
#include "platform/linux/system/SystemNames.h"

#include <gtest/gtest.h>

namespace quendra::platform::linux_ {

namespace {

std::string Entry(const std::string& keys) { return "[Desktop Entry]\nType=Application\n" + keys; }

using Words = std::vector<std::string>;

TEST(LinuxDesktopEntry, An_entry_gives_name_comment_icon_and_program) {
  const auto entry =
      ParseDesktopEntry(Entry("Name=Browser\nComment=Browse the web\nIcon=browser\nExec=browser %u\n"));
  ASSERT_TRUE(entry);
  EXPECT_EQ(entry->name, u"Browser");
  EXPECT_EQ(entry->comment, u"Browse the web");
  EXPECT_EQ(entry->icon, "browser");
  EXPECT_EQ(entry->program, "browser");
  EXPECT_FALSE(entry->hasArguments);
  EXPECT_TRUE(entry->isShown);
}

TEST(LinuxDesktopEntry, The_Hebrew_name_is_taken_before_the_one_without_a_language) {
  const auto entry = ParseDesktopEntry(Entry("Name=Browser\nName[de]=Netz\nName[he]=דפדפן\nExec=b\n"));
  ASSERT_TRUE(entry);
  EXPECT_EQ(entry->name, u"דפדפן");
}

TEST(LinuxDesktopEntry, An_entry_without_a_name_or_a_command_is_none) {
  EXPECT_FALSE(ParseDesktopEntry(Entry("Exec=b\n")));
  EXPECT_FALSE(ParseDesktopEntry(Entry("Name= \nExec=b\n")));
  EXPECT_FALSE(ParseDesktopEntry(Entry("Name=B\n")));
  EXPECT_FALSE(ParseDesktopEntry(Entry("Name=B\nExec=\"\"\n")));
}

TEST(LinuxDesktopEntry, A_link_and_a_deleted_entry_are_none) {
  EXPECT_FALSE(ParseDesktopEntry("[Desktop Entry]\nType=Link\nName=B\nExec=b\n"));
  EXPECT_FALSE(ParseDesktopEntry("[Desktop Entry]\nName=B\nExec=b\n"));
  EXPECT_FALSE(ParseDesktopEntry(Entry("Name=B\nExec=b\nHidden=true\n")));
}

TEST(LinuxDesktopEntry, Keys_of_other_groups_do_not_count) {
  const auto entry =
      ParseDesktopEntry(Entry("Name=Mail\nExec=mail\n[Desktop Action new]\nName=New\nExec=other\n"));
  ASSERT_TRUE(entry);
  EXPECT_EQ(entry->name, u"Mail");
  EXPECT_EQ(entry->program, "mail");
}

TEST(LinuxDesktopEntry, Words_beside_the_places_for_files_are_arguments) {
  EXPECT_FALSE(ParseDesktopEntry(Entry("Name=B\nExec=office %U %i\n"))->hasArguments);
  EXPECT_TRUE(ParseDesktopEntry(Entry("Name=B\nExec=office --writer %U\n"))->hasArguments);
}

TEST(LinuxDesktopEntry, Env_with_its_assignments_is_passed_over) {
  EXPECT_EQ(ParseDesktopEntry(Entry("Name=B\nExec=env -i A=1 game\n"))->program, "game");
  EXPECT_EQ(ParseDesktopEntry(Entry("Name=B\nExec=/usr/bin/env A=1 B=2 game %f\n"))->program, "game");
  EXPECT_FALSE(ParseDesktopEntry(Entry("Name=B\nExec=env A=1\n")));
}

TEST(LinuxDesktopEntry, A_program_that_only_starts_another_is_not_named_after_it) {
  for (const std::string exec :
       {"sh -c game", "/usr/bin/python3 /opt/game.py", "flatpak run org.game", "java -jar g.jar"})
    EXPECT_FALSE(ParseDesktopEntry(Entry("Name=Game\nExec=" + exec + "\n"))) << exec;
  EXPECT_TRUE(ParseDesktopEntry(Entry("Name=Python\nExec=/usr/bin/python3.11\n")));
}

TEST(LinuxDesktopEntry, Quotes_keep_words_together_and_a_backslash_in_them_keeps_a_character) {
  EXPECT_EQ(ExecWords("\"/opt/my game/run\" -a  b"), (Words{"/opt/my game/run", "-a", "b"}));
  EXPECT_EQ(ExecWords("\"a\\\"b\" c\\d"), (Words{"a\"b", "c\\d"}));
  EXPECT_EQ(ExecWords("\"never ended"), (Words{"never ended"}));
  EXPECT_EQ(ExecWords(""), Words{});
}

TEST(LinuxDesktopEntry, Line_breaks_and_controls_in_a_name_become_blanks_and_direction_marks_go) {
  const auto entry =
      ParseDesktopEntry(Entry("Name=Two\\nlines\\tand\x01 \u202Emore\u2069\u200F\u061C\nExec=b\n"));
  ASSERT_TRUE(entry);
  EXPECT_EQ(entry->name, u"Two lines and  more");
}

TEST(LinuxDesktopEntry, A_name_of_4_KB_is_cut_to_255_characters) {
  const auto entry = ParseDesktopEntry(Entry("Name=" + std::string(4096, 'n') + "\nExec=b\n"));
  ASSERT_TRUE(entry);
  EXPECT_EQ(entry->name, Text(255, u'n'));
}

TEST(LinuxDesktopEntry, A_name_that_is_no_text_does_no_harm) {
  const auto entry = ParseDesktopEntry(Entry("Name=a\xFF\xC3\nExec=b\n"));
  ASSERT_TRUE(entry);
  EXPECT_EQ(entry->name, u"a\uFFFD\uFFFD");
}

TEST(LinuxDesktopEntry, An_entry_cut_anywhere_is_read_no_further_than_it_goes) {
  const std::string whole =
      Entry("Name=Browser\\\\\nName[he]=דפדפן\nExec=\"b\\\\\" %u\nIcon=x\n[Other]\nA=1\n");
  for (std::size_t length = 0; length <= whole.size(); ++length) {
    const std::vector<char> cut(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length));
    ParseDesktopEntry({cut.data(), cut.size()});
  }
  EXPECT_TRUE(ParseDesktopEntry(whole));
}

TEST(LinuxKeyFile, The_first_of_two_equal_keys_holds_and_comments_and_other_lines_are_passed_over) {
  const KeyFile file = ParseKeyFile("# c\n[A]\r\nx = 1 \r\nx=2\nnonsense\n=empty\n[B\ny=3\n");
  EXPECT_EQ(ValueIn(file, "A", "x"), "1");
  EXPECT_EQ(ValueIn(file, "A", "y"), "3");
  EXPECT_EQ(ValueIn(file, "B", "y"), "");
}

TEST(LinuxKeyFile, Escapes_are_resolved_and_unknown_ones_stay) {
  EXPECT_EQ(Unescaped("a\\sb\\nc\\td\\re\\\\f\\x\\"), "a b\nc\td\re\\f\\x\\");
}

} // namespace

} // namespace quendra::platform::linux_
