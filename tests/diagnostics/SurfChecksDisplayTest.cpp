#include "diagnostics/SurfChecks.h"

#include "diagnostics/SurfFixture.h"

namespace quendra::diagnostics {
namespace {

/// What the user sees each time that something is drawn at once, a line each: on the form the rules and the
/// rows with those of them that are bold; in the list the last row with a star where it is bold, its details
/// and its icon.
class SurfDisplay : public SurfTest {
 protected:
  SurfDisplay() {
    machine.performanceData.SetProcessors({{}}, 128'000'000'000'000'000);
    desktop.OnRepaint = [this](const forms::Control& control) {
      seen.push_back(&control == &List() ? LastRow() : Form());
    };
  }
  void WaitInStep(int step) {
    AnswerBefore(step);
    OpenPage();
    ASSERT_EQ(checks.Step(), step);
  }
  /// The last check's server answers, and all local checks run.
  std::vector<std::string> RunLocalChecks() {
    WaitInStep(4);
    seen.clear();
    Connection(OutgoingMail()).Send("220\r\n");
    Run();
    return seen;
  }

  std::vector<std::string> seen;

 private:
  std::string Form() {
    int rules = 0;
    for (const bool shown : Rules()) rules += shown;
    std::string text = "form: " + std::to_string(rules) + " rules, " + std::to_string(RowCount()) + " rows,";
    for (int row = 1; row <= RowCount(); ++row)
      if (Bold(row)) text += " bold " + std::to_string(row);
    return text;
  }
  std::string LastRow() {
    const char* icons[] = {"-", "tick", "cross"};
    const int row = RowCount();
    return std::to_string(row) + (Bold(row) ? "* '" : " '") + ToUtf8(Detail(row)) + "' " + icons[Icon(row)];
  }
};

using Lines = std::vector<std::string>;

TEST_F(SurfDisplay, Shows_the_rule_of_a_network_check_and_then_its_row) {
  WaitInStep(4);

  EXPECT_EQ(seen, (Lines{"form: 1 rules, 0 rows,", "1* '' -", "form: 2 rules, 1 rows,", "2* '' -",
                         "form: 3 rules, 2 rows,", "3* '' -", "form: 4 rules, 3 rows,", "4* '' -"}));
}

TEST_F(SurfDisplay, Shows_all_that_changes_while_the_local_checks_hold_the_thread) {
  for (int entry = 1; entry <= 11; ++entry) machine.urlCache.Add("http://a/" + std::to_string(entry));
  for (std::uint32_t process = 101; process <= 107; ++process) machine.AddProcess({process, 0, "emule", ""});

  const Lines shown = RunLocalChecks();

  const Lines cache{"form: 5 rules, 4 rows,", "5* '' -", "5* '11/0' -", "5* '11/10' -", "5* '11/11' tick"};
  const Lines processor{"form: 6 rules, 5 rows,",
                        "6* '' -",
                        "6* '|' -",
                        "6* '||' -",
                        "6* '|||' -",
                        "6* '||||' -",
                        "6* '|||||' -",
                        "6* '||||||' -",
                        "6* '|||||||' -",
                        "6* '6.67%' tick"};
  const Lines line{"form: 7 rules, 6 rows,",
                   "7* '' -",
                   "7* '|' -",
                   "7* '||' -",
                   "7* '|||' -",
                   "7* '||||' -",
                   "7* '|||||' -",
                   "7* '||||||' -",
                   "7* '|||||||' -",
                   "7* '0.00%' tick"};
  Lines expected;
  for (const Lines& part : {cache, processor, line})
    expected.insert(expected.end(), part.begin(), part.end());
  for (const char* text : {"form: 8 rules, 7 rows,", "8* '' -", "8* '|' -", "8* '||' -"})
    expected.push_back(text);
  ASSERT_GE(shown.size(), expected.size());
  EXPECT_EQ(Lines(shown.begin(), shown.begin() + static_cast<std::ptrdiff_t>(expected.size())), expected);
}

TEST_F(SurfDisplay, Shows_the_cross_of_a_load_too_high_before_the_next_check_begins) {
  machine.ipHelper.Interfaces[0].Set(platform::InterfaceRow::kInOctets, 30'000'000);
  machine.ipHelper.Interfaces[0].Set(platform::InterfaceRow::kSpeed, 10'000);

  const Lines shown = RunLocalChecks();

  const auto cross = std::find(shown.begin(), shown.end(), "7* '420.00%' cross");
  const auto next = std::find(shown.begin(), shown.end(), "form: 8 rules, 7 rows,");
  ASSERT_NE(cross, shown.end());
  EXPECT_LT(cross, next);
  EXPECT_EQ(checks.FailCount(), 1);
}

TEST_F(SurfDisplay, Has_no_rule_before_the_page_is_opened_first_and_keeps_all_when_it_is_opened_again) {
  ComeHome();
  EXPECT_EQ(Rules(), std::vector<bool>(8, false));
  AllServersAnswer();
  ClickSurf();
  Run();
  desktop.Click(page.surf_lblBack);
  WebByName() = platform::simulated::SimulatedServer();

  ClickSurf();
  Run();

  EXPECT_EQ(Rules(), std::vector<bool>(8, true));
  EXPECT_EQ(RowCount(), 1);
}

/// A fault that nobody traps, in a local check.
class FaultOfCheck : public SurfTest {
 protected:
  void ExpectEnd(const char16_t* fault) {
    AllServersAnswer();
    OpenPage();
    ASSERT_EQ(desktop.Boxes.size(), 1u);
    EXPECT_EQ(desktop.Boxes[0].text, fault);
    EXPECT_TRUE(desktop.Ended);
    EXPECT_EQ(desktop.EndStatus, 1);
  }
};

TEST_F(FaultOfCheck, Of_the_cache_with_32768_entries_ends_the_program_with_all_of_them_kept) {
  machine.urlCache.Entries.assign(32'768, {"http://a/"});

  ExpectEnd(u"Run-time error '6':\n\nOverflow");

  EXPECT_EQ(Detail(5), u"");
  EXPECT_EQ(Icon(5), 0);
  EXPECT_EQ(machine.urlCache.Entries.size(), 32'768u);
}

TEST_F(FaultOfCheck, Of_a_line_without_a_speed_ends_the_program) {
  machine.ipHelper.Interfaces[0].Set(platform::InterfaceRow::kInOctets, 1);
  machine.ipHelper.Interfaces[0].Set(platform::InterfaceRow::kSpeed, 0);

  ExpectEnd(u"Run-time error '11':\n\nDivision by zero");

  EXPECT_EQ(Detail(7), u"|||||||");
}

TEST_F(FaultOfCheck, Of_a_machine_without_interfaces_ends_the_program) {
  machine.ipHelper.Interfaces.clear();

  ExpectEnd(u"Run-time error '9':\n\nSubscript out of range");
}

TEST_F(FaultOfCheck, Of_a_line_that_carried_too_much_ends_the_program_before_its_first_bar) {
  machine.ipHelper.Interfaces[0].Set(platform::InterfaceRow::kInOctets, 0x7FFFFFFF);
  machine.ipHelper.Interfaces[0].Set(platform::InterfaceRow::kOutOctets, 1);

  ExpectEnd(u"Run-time error '6':\n\nOverflow");

  EXPECT_EQ(Detail(7), u"");
}

} // namespace
} // namespace quendra::diagnostics
