#include "mail/ProfileTemplate.h"

#include "mail/ProfileFixture.h"

#include <gtest/gtest.h>

namespace quendra::mail {
namespace {

const ProfileValues kDana{u"mail.example.net", u"example.net", u"dana", u"דנה כהן"};

TEST(ProfileTemplate, The_text_equals_the_file_that_was_written_by_hand_byte_for_byte) {
  ASSERT_EQ(ProfileByHand().size(), 5251u);
  EXPECT_EQ(ToCodePage(ProfileText(kDana)), ProfileByHand());
}

TEST(ProfileTemplate, Every_line_ends_in_one_line_break_the_last_one_too) {
  const Text text = ProfileText(kDana);
  EXPECT_TRUE(text.ends_with(u"ConnectOID=PT_UNICODE,0x0010\r\n"));
  EXPECT_EQ(Replaced(text, u"\r\n", u"").find_first_of(u"\r\n"), Text::npos);
}

TEST(ProfileTemplate, One_empty_line_stands_between_two_sections_and_none_elsewhere) {
  const Text text = ProfileText(kDana);
  std::size_t sections = 0;
  for (std::size_t at = 0; (at = text.find(u"\r\n\r\n", at)) != Text::npos; ++at, ++sections)
    EXPECT_EQ(text[at + 4], u'[') << at;
  EXPECT_EQ(sections, 16u);
  EXPECT_EQ(text.find(u"\r\n\r\n\r\n"), Text::npos);
}

TEST(ProfileTemplate, The_address_has_a_blank_before_its_sign) {
  EXPECT_NE(ProfileText(kDana).find(u"\r\nEmailAddress=dana @example.net\r\n"), Text::npos);
}

TEST(ProfileTemplate, Empty_values_leave_their_lines) {
  const Text text = ProfileText({});
  for (const TextView line :
       {u"POP3Server = ", u"SMTPServer = ", u"POP3UserName = ", u"EmailAddress= @", u"DisplayName = "})
    EXPECT_NE(text.find(u"\r\n" + Text(line) + u"\r\n"), Text::npos) << ToUtf8(line);
}

TEST(ProfileTemplate, A_value_makes_no_line_of_its_own) {
  for (const Text& end : {Text(u"\r\n"), Text(u"\r"), Text(u"\n"), Text(1, u'\0')}) {
    const Text tail = end + u"POP3Server = elsewhere";
    EXPECT_EQ(ProfileText({u"mail.example.net", u"example.net", u"dana" + tail, u"דנה כהן" + tail}),
              ProfileText(kDana));
  }
}

TEST(ProfileTemplate, Other_signs_of_a_value_stand_as_they_are) {
  const Text text = ProfileText({u"", u"", u"a=[b]", u"\t%d;#\"x\""});
  EXPECT_NE(text.find(u"\r\nPOP3UserName = a=[b]\r\n"), Text::npos);
  EXPECT_NE(text.find(u"\r\nDisplayName = \t%d;#\"x\"\r\n"), Text::npos);
}

TEST(ProfileTemplate, No_line_holds_a_password) {
  const Text text = ProfileText(kDana);
  for (std::size_t at = 0; (at = text.find(u"Password", at)) != Text::npos; ++at) {
    const Text line = text.substr(at, text.find(u"\r\n", at) - at);
    // Mapped to properties by type and number.
    EXPECT_TRUE(line == u"Password=PT_STRING8,0x67f0" || line == u"Password=PT_STRING8,0x6703" ||
                line == u"Password=PT_BOOLEAN,0x6606" || line == u"Password=PT_BOOLEAN,0x6701")
        << ToUtf8(line);
  }
}

} // namespace
} // namespace quendra::mail
