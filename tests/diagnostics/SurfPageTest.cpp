#include "diagnostics/SurfPage.h"

#include "diagnostics/SurfFixture.h"
#include "forms/view/Accessible.h"
#include "forms/view/FocusOrder.h"

namespace quendra::diagnostics {
namespace {

using SurfPageTest = SurfTest;

TEST_F(SurfPageTest, The_list_has_a_first_column_of_no_width_and_three_in_their_ratio) {
  OpenPage();

  const auto& columns = List().Columns();
  ASSERT_EQ(columns.size(), 4u);
  EXPECT_EQ(columns[0].width, 0);
  EXPECT_EQ(columns[0].caption, u"");
  EXPECT_EQ(columns[1].caption, u"פרטים");
  EXPECT_EQ(columns[2].caption, u"בדיקה");
  EXPECT_EQ(columns[3].caption, u"אבחון");
  EXPECT_EQ(columns[1].width, 8978);
  EXPECT_EQ(columns[2].width, 5369);
  EXPECT_EQ(columns[3].width, 829);
}

TEST_F(SurfPageTest, The_sleeping_timer_has_an_interval_of_100_milliseconds) {
  OpenPage();

  EXPECT_EQ(page.surf_Timer1.Interval(), 100);
  EXPECT_FALSE(page.surf_Timer1.Enabled());
}

TEST_F(SurfPageTest, The_images_are_the_tick_and_the_cross_in_this_order) {
  OpenPage();

  ASSERT_EQ(page.surf_ImageList1.Count(), 2);
  EXPECT_EQ(page.surf_ImageList1.Item(1).Key, u"ico_check");
  EXPECT_EQ(page.surf_ImageList1.Item(1).picture.ArtworkName(), "ico_check");
  EXPECT_EQ(page.surf_ImageList1.Item(2).Key, u"ico_x");
  EXPECT_EQ(page.surf_ImageList1.Item(2).picture.ArtworkName(), "ico_x");
  EXPECT_EQ(List().SmallIcons, &page.surf_ImageList1);
}

TEST_F(SurfPageTest, The_button_of_outside_programs_is_hidden_and_no_path_leads_to_its_question) {
  OpenPage();

  EXPECT_EQ(page.surf_cmdDownload.Caption(), u"הורדת תוכנות עזר");
  EXPECT_FALSE(page.surf_cmdDownload.Visible());
  EXPECT_FALSE(desktop.Click(page.surf_cmdDownload));
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(SurfPageTest, The_question_before_outside_programs_has_its_words_kept) {
  OpenPage();
  for (const int answer : {6, 7}) desktop.AnswerNextBox(answer);

  program.surf.downloadOffer.surf_cmdDownload_Click();
  program.surf.downloadOffer.surf_cmdDownload_Click();

  const forms::headless::HeadlessDesktop::Box question{
      u"חשוב לציין:\r\nהתוכנות אינן של זלמר בינלאומי,\r\nואינן נתמכות במוקד התמיכה.\r\n\r\nלהמשיך?", 0x180034,
      u"זלמר בינלאומי@נט"};
  EXPECT_EQ(desktop.Boxes, (std::vector{question, question}));
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(SurfPageTest, The_panel_is_hidden_until_its_button_is_pressed) {
  OpenPage();
  EXPECT_EQ(page.frmSurf_cmdAdvanced.Caption(), u"מתקדם");
  EXPECT_FALSE(page.advanced.frmSurf_frameAdvanced.Visible());

  desktop.Click(page.frmSurf_cmdAdvanced);

  EXPECT_TRUE(page.advanced.frmSurf_frameAdvanced.Visible());
}

TEST_F(SurfPageTest, An_open_panel_leaves_the_keyboard_nothing_of_what_it_lies_over) {
  OpenPage();
  ASSERT_TRUE(desktop.Click(page.frmSurf_cmdAdvanced));

  std::vector<Text> reached;
  const forms::Control* control = &menu.Label1;
  while (control != &page.surf_lblBack) {
    control = forms::NextFocus(menu, control, forms::TabDirection::Forwards);
    reached.push_back(control->Name());
  }

  EXPECT_EQ(reached, (std::vector<Text>{u"frmSurf_txtping", u"frmSurf_cmdStart", u"frmSurf_txtPingResult",
                                        u"surf_lblBack"}));
}

TEST_F(SurfPageTest, Results_without_a_caption_have_a_name_for_assistive_technology) {
  OpenPage();

  EXPECT_EQ(forms::AccessibleOf(page.surf_ListView1).name, u"תוצאות הבדיקות");
  EXPECT_EQ(forms::AccessibleOf(page.advanced.frmSurf_txtPingResult).name, u"תוצאות המעקב");
  EXPECT_EQ(forms::AccessibleOf(page.advanced.frmSurf_txtping).name, u"כתובת מעקב:");
}

TEST_F(SurfPageTest, A_trace_shows_that_it_runs_before_the_thread_is_held) {
  OpenPage();
  desktop.Click(page.frmSurf_cmdAdvanced);
  page.advanced.frmSurf_txtping.Value = u"127.0.0.1";
  desktop.Calls.clear();
  desktop.OnYield = [&] {
    desktop.OnYield = nullptr;
    EXPECT_EQ(desktop.Calls, std::vector<std::string>{"Repaint frmSurf_frameAdvanced"});
    desktop.Calls.clear();
  };

  desktop.Click(page.advanced.frmSurf_cmdStart);

  EXPECT_EQ(desktop.CountOf("Repaint frmSurf_frameAdvanced"), 0);
}

/// The panel, open.
class AdvancedPanelTest : public SurfTest {
 protected:
  void OpenPanel() {
    OpenPage();
    ASSERT_TRUE(desktop.Click(page.frmSurf_cmdAdvanced));
    panel.Trace = [this](const Text& target) { traced.push_back(target); };
  }

  AdvancedPanel& panel = page.advanced;
  std::vector<Text> traced;
};

TEST_F(AdvancedPanelTest, Offers_three_hosts_of_which_one_is_the_web_host_of_the_checks_and_takes_any_text) {
  OpenPanel();

  EXPECT_EQ(panel.Label2.Caption(), u"כתובת מעקב:");
  ASSERT_EQ(panel.frmSurf_txtping.ListCount(), 3);
  EXPECT_EQ(panel.frmSurf_txtping.List(0), settings::ProbeWebHost);
  EXPECT_TRUE(panel.frmSurf_txtping.FreeText);
  EXPECT_TRUE(panel.frmSurf_txtPingResult.MultiLine);
  EXPECT_TRUE(panel.frmSurf_txtPingResult.VerticalScrollBar());
  EXPECT_TRUE(panel.frmSurf_txtPingResult.Monospaced());
}

TEST_F(AdvancedPanelTest, A_press_waits_empties_the_report_and_traces_the_text_of_the_box) {
  OpenPanel();
  panel.frmSurf_txtPingResult.Value = u"before";
  panel.frmSurf_txtping.Value = u"10.0.0.1";

  desktop.Click(panel.frmSurf_cmdStart);

  EXPECT_EQ(traced, std::vector<Text>{u"10.0.0.1"});
  EXPECT_EQ(panel.frmSurf_cmdStart.Caption(), u"המתן");
  EXPECT_FALSE(panel.frmSurf_cmdStart.Enabled());
  EXPECT_EQ(panel.frmSurf_txtPingResult.Value(), u"");
}

TEST_F(AdvancedPanelTest, A_press_without_a_target_leaves_the_button_waiting_for_good) {
  OpenPanel();

  desktop.Click(panel.frmSurf_cmdStart);
  desktop.Advance(3'600'000);

  EXPECT_TRUE(traced.empty());
  EXPECT_EQ(panel.frmSurf_cmdStart.Caption(), u"המתן");
  EXPECT_FALSE(desktop.Click(panel.frmSurf_cmdStart));
}

TEST_F(AdvancedPanelTest, A_press_under_another_caption_frees_the_button_and_traces_nothing) {
  OpenPanel();
  panel.frmSurf_cmdStart.Caption = u"המתן";
  panel.frmSurf_txtping.Value = u"10.0.0.1";

  desktop.Click(panel.frmSurf_cmdStart);

  EXPECT_TRUE(traced.empty());
  EXPECT_EQ(panel.frmSurf_cmdStart.Caption(), u"התחל");
  EXPECT_TRUE(panel.frmSurf_cmdStart.Enabled());
}

TEST_F(AdvancedPanelTest, The_box_of_the_target_selects_its_text_when_it_gets_the_focus) {
  OpenPanel();
  panel.frmSurf_txtping.Value = u"10.0.0.1";

  panel.frmSurf_txtping.GotFocus();

  EXPECT_EQ(panel.frmSurf_txtping.SelStart(), 0);
  EXPECT_EQ(panel.frmSurf_txtping.SelLength(), 8);
}

TEST_F(AdvancedPanelTest, The_report_can_be_read_and_not_changed) {
  OpenPanel();

  EXPECT_TRUE(panel.frmSurf_txtPingResult.ReadOnly());
}

TEST_F(AdvancedPanelTest, A_second_design_offers_the_hosts_once) {
  OpenPanel();

  page.Design();

  EXPECT_EQ(panel.frmSurf_txtping.ListCount(), 3);
}

TEST_F(AdvancedPanelTest, The_caret_of_the_report_follows_its_end) {
  OpenPanel();

  panel.frmSurf_txtPingResult.Value = u"one\r\ntwo";

  EXPECT_EQ(panel.frmSurf_txtPingResult.SelStart(), 8);
}

TEST_F(AdvancedPanelTest, What_is_typed_into_the_target_is_mended_and_what_no_host_has_is_refused) {
  OpenPanel();
  const auto typed = [&](int keyCode) {
    panel.frmSurf_txtping.KeyPress(keyCode);
    return keyCode;
  };

  EXPECT_EQ(typed(u'A'), u'a');
  EXPECT_EQ(typed(u'ש'), u'a');
  EXPECT_EQ(typed(u'5'), u'5');
  EXPECT_EQ(typed(u'.'), u'.');
  EXPECT_EQ(typed(8), 8);
  EXPECT_EQ(typed(u' '), 0);
  EXPECT_EQ(typed(0xFB2A), 0);
  EXPECT_EQ(typed(0x1F600), 0);
}

} // namespace
} // namespace quendra::diagnostics
