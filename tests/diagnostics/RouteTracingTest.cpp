#include "diagnostics/RouteTracing.h"

#include "diagnostics/SurfFixture.h"

namespace quendra::diagnostics {
namespace {

/// The panel on its page, and a route of four hops to what the user typed.
class TraceOnThePage : public SurfTest {
 protected:
  TraceOnThePage() {
    machine.hostNames.Add("www.example.com", {"192.0.2.1"});
    machine.icmp.RouteTo("192.0.2.1").Hop("10.0.0.138").Hop("10.1.0.1").Hop("10.2.0.1").Target();
  }

  void OpenPanel() {
    WebByName(); // which stays silent, so that the first check waits
    OpenPage();
    ASSERT_TRUE(desktop.Click(page.frmSurf_cmdAdvanced));
    panel.frmSurf_txtping.Value = u"www.example.com";
  }
  /// Starts a trace. After its first echo the user does something.
  void TraceWhile(std::function<void()> userActs) {
    desktop.OnYield = [&, acted = false]() mutable {
      if (!std::exchange(acted, true)) userActs();
    };
    ASSERT_TRUE(desktop.Click(panel.frmSurf_cmdStart));
  }
  void ExpectAWholeTrace() {
    EXPECT_EQ(panel.frmSurf_txtPingResult.Value(),
              u"Tracing to www.example.com (192.0.2.1)...\r\nHop #\t1\t<10 ms\t10.1.0.1\r\n"
              u"Hop #\t2\t<10 ms\t10.2.0.1\r\nHop #\t3\t<10 ms\t192.0.2.1\r\n\r\nTrace Route Complete");
    ASSERT_EQ(desktop.Boxes.size(), 1u);
    EXPECT_EQ(desktop.Boxes[0], (forms::headless::HeadlessDesktop::Box{u"המעקב הסתיים. \r\nהאם לשלוח דו\"ח?",
                                                                       0x180024, u"זלמר בינלאומי@נט"}));
    EXPECT_EQ(panel.frmSurf_cmdStart.Caption(), u"התחל");
    EXPECT_TRUE(panel.frmSurf_cmdStart.Enabled());
    EXPECT_EQ(machine.icmp.CountOpen(), 0u);
    EXPECT_FALSE(desktop.Ended);
  }

  AdvancedPanel& panel = page.advanced;
};

TEST_F(TraceOnThePage, Runs_to_its_end_while_a_check_waits) {
  OpenPanel();

  TraceWhile([] {});

  ExpectAWholeTrace();
  EXPECT_EQ(checks.Step(), 1);
}

TEST_F(TraceOnThePage, Goes_on_hidden_when_the_back_link_closes_the_panel_and_then_the_page) {
  OpenPanel();

  TraceWhile([&] {
    EXPECT_TRUE(desktop.Click(page.surf_lblBack));
    EXPECT_FALSE(panel.frmSurf_frameAdvanced.Visible());
    EXPECT_TRUE(page.frameSurfProb.Visible());
    EXPECT_TRUE(desktop.Click(page.surf_lblBack));
  });

  EXPECT_FALSE(page.frameSurfProb.Visible());
  EXPECT_EQ(checks.Sockets(), nullptr);
  EXPECT_EQ(machine.sockets.OpenSockets(), 0);
  ExpectAWholeTrace();
}

TEST_F(TraceOnThePage, Goes_on_hidden_when_another_page_is_chosen) {
  OpenPanel();

  TraceWhile([&] { EXPECT_TRUE(desktop.Click(menu.lblCaption[2])); });

  EXPECT_FALSE(page.frameSurfProb.Visible());
  EXPECT_TRUE(program.firstConnectionPage.frameFirstConnection.Visible());
  EXPECT_EQ(checks.Sockets(), nullptr);
  ExpectAWholeTrace();
}

TEST_F(TraceOnThePage, Is_found_under_way_by_who_leaves_the_page_and_comes_back) {
  OpenPanel();

  TraceWhile([&] {
    desktop.Click(menu.lblCaption[2]);
    desktop.Click(menu.lblCaption[1]);
    EXPECT_EQ(panel.frmSurf_cmdStart.Caption(), u"המתן");
    EXPECT_FALSE(desktop.Click(panel.frmSurf_cmdStart));
  });

  EXPECT_EQ(checks.Step(), 1);
  EXPECT_NE(checks.Sockets(), nullptr);
  ExpectAWholeTrace();
}

TEST_F(TraceOnThePage, Lets_the_checks_run_to_their_end_between_two_echoes) {
  OpenPanel();
  for (int step = 2; step <= 4; ++step) ServerOf(step).Greet("x");

  TraceWhile([&] {
    Connection(WebByName()).Send("x");
    Run();
    EXPECT_EQ(RowCount(), 10);
  });

  EXPECT_EQ(CaptionOf(10), u"הסתיים");
  ExpectAWholeTrace();
}

TEST_F(TraceOnThePage, Takes_no_second_press_while_it_runs) {
  OpenPanel();
  bool pressed = true;

  TraceWhile([&] { pressed = desktop.Click(panel.frmSurf_cmdStart); });

  EXPECT_FALSE(pressed);
  EXPECT_EQ(machine.icmp.Echoes.size(), 3u);
  ExpectAWholeTrace();
}

TEST_F(TraceOnThePage, Does_not_mind_that_its_target_is_typed_over) {
  OpenPanel();

  TraceWhile([&] { panel.frmSurf_txtping.Value = u"10.9.9.9"; });

  ExpectAWholeTrace();
}

TEST_F(TraceOnThePage, Ends_with_the_program_when_the_window_is_closed_in_the_middle) {
  OpenPanel();

  TraceWhile([&] { desktop.CloseBox(menu); });

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
  EXPECT_EQ(machine.icmp.Echoes.size(), 1u);
  EXPECT_EQ(machine.icmp.CountOpen(), 0u);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(TraceOnThePage, Ends_with_the_program_when_a_fault_ends_it_in_the_middle) {
  OpenPanel();
  for (int step = 2; step <= 4; ++step) ServerOf(step).Greet("x");
  machine.ipHelper.Interfaces.clear();

  TraceWhile([&] {
    Connection(WebByName()).Send("x");
    Run();
  });

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
  ASSERT_EQ(desktop.Boxes.size(), 1u);
  EXPECT_EQ(desktop.Boxes[0].text, u"Run-time error '9':\n\nSubscript out of range");
  EXPECT_EQ(machine.icmp.CountOpen(), 0u);
}

TEST_F(TraceOnThePage, Is_not_started_by_Enter_in_the_field_of_its_target) {
  OpenPanel();
  ASSERT_TRUE(desktop.Type(panel.frmSurf_txtping, u""));
  ASSERT_EQ(desktop.Focused(menu), &panel.frmSurf_txtping);

  desktop.PressKey(menu, 13);
  Run();

  EXPECT_TRUE(machine.icmp.Echoes.empty());
  EXPECT_EQ(panel.frmSurf_txtping.Value(), u"www.example.com");
  EXPECT_EQ(panel.frmSurf_cmdStart.Caption(), u"התחל");
}

/// What is typed into the field of the target.
class TypedTarget : public SurfTest {
 protected:
  Text Typed(TextView keys) {
    if (!page.frameSurfProb.IsShown()) OpenPage();
    page.advanced.frmSurf_frameAdvanced.Visible = true;
    page.advanced.frmSurf_txtping.Value = Text();
    EXPECT_TRUE(desktop.Type(page.advanced.frmSurf_txtping, keys));
    return page.advanced.frmSurf_txtping.Value();
  }
};

TEST_F(TypedTarget, Is_mended_when_the_Hebrew_layout_was_active) {
  EXPECT_EQ(Typed(u"חםיn.נםצ"), u"john.bom");
  EXPECT_EQ(Typed(u"WWW.Example.COM"), u"www.example.com");
}

TEST_F(TypedTarget, Takes_marks_of_names_and_refuses_all_others) {
  EXPECT_EQ(Typed(u"a_b-c.d#e@9"), u"a_b-c.d#e@9");
  EXPECT_EQ(Typed(u"a!b$c%d^e&f*g(h)i j:k\tl"), u"abcdefghijkl");
  EXPECT_EQ(Typed(u"aףבץcתd"), u"accd");
}

TEST_F(TypedTarget, Reads_the_two_marks_of_the_Q_and_W_keys_by_the_layout) {
  EXPECT_EQ(Typed(u"a/'b"), u"ab");

  machine.keyboardLayout.Name = "0000040D";

  EXPECT_EQ(Typed(u"a/'b"), u"aqwb");
}

TEST_F(TypedTarget, Loses_its_last_character_to_the_backspace_and_none_to_other_control_characters) {
  EXPECT_EQ(Typed(u"ab\b"), u"a");
  EXPECT_EQ(Typed(u"ab\x1\x3\x16\x1B"), u"ab");
}

} // namespace
} // namespace quendra::diagnostics
