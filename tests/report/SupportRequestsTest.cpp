#include "report/SupportRequests.h"

#include "forms/Form.h"
#include "monitor/ProcessRow.h"
#include "runtime/Settings.h"

#include <gtest/gtest.h>

#include <array>

namespace quendra::report {
namespace {

class SupportRequests : public testing::Test {
 protected:
  /// The texts of the seven cells that a report holds.
  using Cells = std::array<Text, 7>;

  forms::ListRow& AddRow(const Cells& texts) {
    forms::ListRow& row = table.Add(u"p" + DecimalText(table.Count() + 1), texts[0], 1);
    for (std::size_t cell = 1; cell < texts.size(); ++cell) row.AddCell(texts[cell], {});
    for (int hidden = 0; hidden < 3; ++hidden) row.AddCell(u"hidden", {});
    return row;
  }

  struct PlainForm : forms::Form {
    using Form::Form;
    void Design() override {}
  };
  PlainForm form{u"form"};
  forms::ListView table{form, u"table"};
  const Text webHost = settings::SupportServerWebHost;
  const Text host = settings::SupportServerHost;
  const Text foreignHost = settings::RequestHostHeader;
};

TEST_F(SupportRequests, A_fetch_names_its_server_in_the_address_and_a_foreign_site_in_the_Host_header) {
  EXPECT_EQ(GetRequest(u"help.example", u"/getid.asp"), u"GET http://help.example/getid.asp HTTP/1.1 \r\n"
                                                        u"Host: " +
                                                            foreignHost +
                                                            u"\r\n"
                                                            u"Connection: Close\r\n"
                                                            u"Accept: */*\r\n"
                                                            u"\r\n");
}

TEST_F(SupportRequests, A_post_has_its_headers_its_body_and_two_line_ends_that_its_length_leaves_out) {
  EXPECT_EQ(PostRequest(u"id=7&procs="), u"POST http://" + host +
                                             u"/procreport.asp HTTP/1.1 \r\n"
                                             u"Host: " +
                                             webHost +
                                             u"\r\n"
                                             u"Content-Type: application/x-www-form-urlencoded\r\n"
                                             u"Content-Length: 11\r\n"
                                             u"Connection: Close\r\n"
                                             u"Accept: */*\r\n"
                                             u"\r\n"
                                             u"id=7&procs="
                                             u"\r\n\r\n");
}

TEST_F(SupportRequests, A_Hebrew_character_counts_once_in_the_length_and_becomes_one_byte) {
  const Text body = u"id=7&procs=דפדפן|שלום|||||}";

  const Text request = PostRequest(body);

  EXPECT_NE(request.find(u"Content-Length: 27\r\n"), Text::npos);
  const std::string bytes = ToCodePage(request);
  EXPECT_EQ(bytes.substr(bytes.find("\r\n\r\n") + 4),
            "id=7&procs=\xE3\xF4\xE3\xF4\xEF|\xF9\xEC\xE5\xED|||||}\r\n\r\n");
}

TEST_F(SupportRequests, A_record_holds_seven_fields_with_bars_between_them_and_a_brace_behind_the_last) {
  AddRow({u"Browser", u"browser.exe", u"User", u".80.1025.", u"001.50", u"012.25", u"0013.75"});

  EXPECT_EQ(ProcessRecords(table), u"Browser|browser.exe|User|.80.1025.|001.50|012.25|0013.75}");
}

TEST_F(SupportRequests, Records_stand_one_behind_the_other_with_nothing_behind_the_last) {
  AddRow({u"A", u"a.exe", u"User", u"", u"0", u"0", u"0"});
  AddRow({u"B", u"b.exe", u"System", u"", u"0", u"0", u"0"});

  EXPECT_EQ(ProcessRecords(table), u"A|a.exe|User||0|0|0}B|b.exe|System||0|0|0}");
}

TEST_F(SupportRequests, Records_follow_the_order_in_which_the_table_is_sorted) {
  AddRow({u"low", u"a", u"", u"", u"", u"001.00", u""});
  AddRow({u"none", u"b", u"", u"", u"", u"", u""});
  AddRow({u"high", u"c", u"", u"", u"", u"100.00", u""});

  table.Sort(monitor::kDownloadCell, forms::SortOrder::Descending);

  EXPECT_EQ(ProcessRecords(table), u"high|c||||100.00|}low|a||||001.00|}none|b|||||}");
}

TEST_F(SupportRequests, A_row_without_ports_gives_two_bars_in_a_row) {
  AddRow({u"Mail", u"mail.exe", u"User", u"", u"0", u"0", u"0"});

  EXPECT_NE(ProcessRecords(table).find(u"User||0"), Text::npos);
}

TEST_F(SupportRequests, Empty_cells_give_empty_fields) {
  AddRow({});

  EXPECT_EQ(ProcessRecords(table), u"||||||}");
}

TEST_F(SupportRequests, An_application_name_keeps_its_commas) {
  AddRow({u"Draw, Paint, Print", u"draw.exe", u"", u"", u"", u"", u""});

  EXPECT_EQ(ProcessRecords(table), u"Draw, Paint, Print|draw.exe|||||}");
}

TEST_F(SupportRequests, Every_comma_of_an_executable_name_becomes_a_tilde) {
  AddRow({u"", u",a,,b,", u"", u"", u"", u"", u""});

  EXPECT_EQ(ProcessRecords(table), u"|~a~~b~|||||}");
}

TEST_F(SupportRequests, Commas_become_tildes_in_each_of_the_six_cells_and_in_no_other_field) {
  AddRow({u"0,0", u"1,1", u"2,2", u"3,3", u"4,4", u"5,5", u"6,6"});

  EXPECT_EQ(ProcessRecords(table), u"0,0|1~1|2~2|3~3|4~4|5~5|6~6}");
}

TEST_F(SupportRequests, Only_the_comma_itself_is_replaced) {
  AddRow({u"", u"a،b、c;d", u"", u"", u"", u"", u""}); // commas of other scripts

  EXPECT_EQ(ProcessRecords(table), u"|a،b、c;d|||||}");
}

TEST_F(SupportRequests, Bars_braces_ampersands_tildes_blanks_and_line_ends_in_values_go_as_they_are) {
  AddRow({u"a|b}c&d=e %20~\r\n", u"x|y}z&id=8 +~", u"", u"", u"", u"", u""});

  EXPECT_EQ(ProcessRecords(table), u"a|b}c&d=e %20~\r\n|x|y}z&id=8 +~|||||}");
}

TEST_F(SupportRequests, Tags_and_the_hidden_cells_do_not_travel) {
  forms::ListRow& row = AddRow({u"A", u"a.exe", u"", u"", u"000.00", u"000.00", u"0000.00"});
  row.CellTag(monitor::kUploadCell) = 123456.0;
  row.CellTag(monitor::kNameCell) = Text(u"C:\\secret\\a.exe");
  row.SetCellText(monitor::kOverallCell, u"overall");

  EXPECT_EQ(ProcessRecords(table), u"A|a.exe|||000.00|000.00|0000.00}");
}

TEST_F(SupportRequests, The_body_of_an_empty_table_ends_behind_its_equals_sign) {
  EXPECT_EQ(ReportBody(u"1234", table), u"id=1234&procs=");
}

TEST_F(SupportRequests, The_body_holds_the_number_and_all_records) {
  AddRow({u"A", u"a.exe", u"User", u".80.", u"0", u"0", u"0"});

  EXPECT_EQ(ReportBody(u"1234", table), u"id=1234&procs=A|a.exe|User|.80.|0|0|0}");
}

TEST_F(SupportRequests, A_number_with_signs_of_its_own_goes_into_the_body_as_it_is) {
  EXPECT_EQ(ReportBody(u"7&procs=\r\n~", table), u"id=7&procs=\r\n~&procs=");
}

TEST_F(SupportRequests, A_report_has_no_size_limit) {
  const Text longName(100'000, u'x');
  for (int row = 0; row < 30; ++row) AddRow({longName, u"a.exe", u"", u"", u"", u"", u""});

  EXPECT_EQ(ReportBody(u"1", table).size(), TextView(u"id=1&procs=").size() + 30u * (100'000 + 5 + 7));
}

TEST_F(SupportRequests, The_number_stands_behind_eight_tildes_and_two_characters_of_line_end) {
  EXPECT_EQ(ReportNumberIn(u"HTTP/1.1 200 OK\r\nConnection: close\r\n\r\n~~~~~~~~\r\n4711"), u"4711");
}

TEST_F(SupportRequests, The_number_goes_up_to_the_end_of_the_reply) {
  EXPECT_EQ(ReportNumberIn(u"~~~~~~~~\r\n47 11\r\n\r\n"), u"47 11\r\n\r\n");
}

TEST_F(SupportRequests, The_two_characters_of_line_end_are_skipped_whatever_they_are) {
  EXPECT_EQ(ReportNumberIn(u"~~~~~~~~4711"), u"11");
}

TEST_F(SupportRequests, The_first_mark_counts_and_a_ninth_tilde_is_taken_for_line_end) {
  EXPECT_EQ(ReportNumberIn(u"~~~~~~~~~\r\n5"), u"\n5");
  EXPECT_EQ(ReportNumberIn(u"~~~~~~~~\r\n5~~~~~~~~\r\n6"), u"5~~~~~~~~\r\n6");
}

TEST_F(SupportRequests, A_reply_without_the_mark_counts_from_its_tenth_character_on) {
  EXPECT_EQ(ReportNumberIn(u"HTTP/1.1 404 Not Found"), u"404 Not Found");
  EXPECT_EQ(ReportNumberIn(u"~~~~~~~890"), u"0");
}

TEST_F(SupportRequests, A_reply_that_ends_before_its_tenth_character_gives_an_empty_number) {
  EXPECT_EQ(ReportNumberIn(u""), u"");
  EXPECT_EQ(ReportNumberIn(u"123456789"), u"");
  EXPECT_EQ(ReportNumberIn(u"~~~~~~~~"), u"");
  EXPECT_EQ(ReportNumberIn(u"~~~~~~~~\r\n"), u"");
}

TEST_F(SupportRequests, A_number_may_hold_NUL_characters) {
  EXPECT_EQ(ReportNumberIn(TextView(u"~~~~~~~~\r\n1\0002", 13)), Text(TextView(u"1\0002", 3)));
}

} // namespace
} // namespace quendra::report
