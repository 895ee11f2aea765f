#include "diagnostics/LocalChecks.h"

#include "diagnostics/SurfFixture.h"

namespace quendra::diagnostics {
namespace {

/// One row of a list, with nothing else on the page.
class LocalCheckTest : public SurfTest {
 protected:
  LocalCheckTest() { rows.Add(u"caption", u""); }

  int Repaints() const { return desktop.CountOf("Repaint surf_ListView1"); }
  int Pauses() const {
    return static_cast<int>(std::count(machine.Calls.begin(), machine.Calls.end(), "Sleep 200"));
  }

  CheckRows rows{page.surf_ListView1, desktop};
};

struct LoadCase {
  double load;
  const char16_t* text;
  Outcome outcome;
};

class Load : public LocalCheckTest, public testing::WithParamInterface<LoadCase> {};

TEST_P(Load, Is_shown_with_two_places_and_fails_above_40) {
  EXPECT_EQ(ShowLoad(rows, GetParam().load), GetParam().outcome);
  EXPECT_EQ(Detail(1), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(Figures, Load,
                         testing::Values(LoadCase{0, u"0.00%", Outcome::Passed},
                                         LoadCase{40, u"40.00%", Outcome::Passed},
                                         LoadCase{39.996, u"40.00%", Outcome::Passed},
                                         LoadCase{40.001, u"40.00%", Outcome::Failed},
                                         LoadCase{40.01, u"40.01%", Outcome::Failed},
                                         LoadCase{100, u"100.00%", Outcome::Failed},
                                         LoadCase{1234.5, u"1234.50%", Outcome::Failed},
                                         LoadCase{-3, u"-3.00%", Outcome::Passed}));

TEST_F(LocalCheckTest, Fifteen_readings_take_three_seconds_and_show_seven_bars) {
  int readings = 0;

  TakeReadings(rows, machine.system, [&] { ++readings; });

  EXPECT_EQ(readings, 15);
  EXPECT_EQ(Pauses(), 15);
  EXPECT_EQ(Detail(1), u"|||||||");
  EXPECT_EQ(Repaints(), 7);
}

class Sharing : public LocalCheckTest {
 protected:
  Text Names(const std::vector<std::string>& processes) {
    std::uint32_t id = 100;
    for (const std::string& name : processes) machine.AddProcess({id++, 0, name, ""});
    EXPECT_EQ(program.surf.localChecks.sharing.Run(rows), Outcome::Passed);
    return Detail(1);
  }
};

TEST_F(Sharing, Finds_nothing_where_there_is_none) { EXPECT_EQ(Names({"explorer.exe", "a.exe"}), u""); }

TEST_F(Sharing, Knows_each_program_by_a_part_of_its_name_in_any_case) {
  EXPECT_EQ(Names({"eMule.exe"}), u"Emule - אימיול");
  EXPECT_EQ(Names({"KAZZA.EXE"}), u"Emule - אימיולKazza - קאזאה");
  EXPECT_EQ(Names({"SababaDC++.exe"}), u"Emule - אימיולKazza - קאזאהSababaDC - סבבה");
  EXPECT_EQ(Names({"mybittorent"}), u"Emule - אימיולKazza - קאזאהSababaDC - סבבהBittorent - ביטורנט");
}

TEST_F(Sharing, Runs_the_names_together_as_often_as_processes_match) {
  EXPECT_EQ(Names({"emule.exe", "emule.exe"}), u"Emule - אימיולEmule - אימיול");
}

TEST_F(Sharing, Takes_several_names_of_one_process_in_the_order_of_the_table) {
  EXPECT_EQ(Names({"bittorent-emule.exe"}), u"Emule - אימיולBittorent - ביטורנט");
}

TEST_F(Sharing, Shows_a_bar_after_every_third_process_and_closes_its_snapshot) {
  std::vector<Text> shown;
  const int handles = machine.processes.OpenHandles();

  Names({"1", "2", "3", "4", "5", "6", "7"});

  EXPECT_EQ(Repaints(), 2);
  EXPECT_EQ(Detail(1), u"");
  EXPECT_EQ(machine.processes.OpenHandles(), handles);
}

TEST_F(Sharing, Passes_with_nothing_found_where_no_snapshot_can_be_taken) {
  machine.processes.FailSnapshots = true;

  EXPECT_EQ(Names({"emule.exe"}), u"");
  EXPECT_EQ(Repaints(), 0);
}

class Cache : public LocalCheckTest {
 protected:
  void Run() { EXPECT_EQ(program.surf.localChecks.cache.Run(rows), Outcome::Passed); }
  std::optional<platform::RegistryValue> Limit(const std::string& key) {
    return machine.registry.Value(key, "CacheLimit");
  }

  const std::string kContent = "HKEY_CURRENT_USER\\Software\\Microsoft\\Windows\\CurrentVersion\\Internet "
                               "Settings\\5.0\\Cache\\Content";
  const std::string kOlderContent = "HKEY_CURRENT_USER\\Software\\Microsoft\\Windows\\CurrentVersion\\"
                                    "Internet Settings\\Cache\\Content";
};

TEST_F(Cache, That_is_empty_shows_0_of_0_and_hands_an_empty_name_over_to_be_deleted) {
  Run();

  EXPECT_EQ(Detail(1), u"0/0");
  EXPECT_EQ(machine.urlCache.Deleted, std::vector<std::string>{""});
}

TEST_F(Cache, Loses_its_entries_and_keeps_those_with_cookies) {
  for (const char* name : {"http://a/", "Cookie:user@a/", "http://b/Cookie", "http://cookie/"})
    machine.urlCache.Add(name);

  Run();

  EXPECT_EQ(machine.urlCache.Deleted, (std::vector<std::string>{"", "http://a/", "http://cookie/"}));
  EXPECT_EQ(Detail(1), u"4/4");
}

TEST_F(Cache, Is_shown_at_every_tenth_entry) {
  for (int i = 1; i <= 25; ++i) machine.urlCache.Add("http://a/" + std::to_string(i));

  Run();

  EXPECT_EQ(Repaints(), 3); // at 0, 10 and 20
  EXPECT_EQ(Detail(1), u"25/25");
}

TEST_F(Cache, Of_more_than_32767_entries_is_a_fault_before_anything_is_deleted) {
  machine.urlCache.Entries.assign(32768, {"http://a/"});
  int number = 0;

  try {
    program.surf.localChecks.cache.Run(rows);
  } catch (const Fault& fault) {
    number = fault.number;
  }

  EXPECT_EQ(number, Fault::kOverflow);
  EXPECT_TRUE(machine.urlCache.Deleted.empty());
}

TEST_F(Cache, Of_32767_entries_is_gone_through_to_the_last) {
  machine.urlCache.Entries.assign(32766, {"Cookie:user@a/"});
  machine.urlCache.Add("http://last/");

  Run();

  EXPECT_EQ(Detail(1), u"32767/32767");
  EXPECT_EQ(machine.urlCache.Deleted, (std::vector<std::string>{"", "http://last/"}));
}

TEST_F(Cache, Of_more_than_32767_entries_ends_the_program_with_the_run_times_box) {
  AllServersAnswer();
  machine.urlCache.Entries.assign(32768, {"http://a/"});

  OpenPage();

  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_EQ(desktop.Boxes[0].text, u"Run-time error '6':\n\nOverflow");
  EXPECT_EQ(desktop.EndStatus, 1);
  EXPECT_EQ(CaptionOf(RowCount()), u"מחיקת קבצי אינטרנט זמניים");
  EXPECT_TRUE(machine.urlCache.Deleted.empty());
}

TEST_F(Cache, Of_a_hundred_entries_of_one_name_is_emptied) {
  machine.urlCache.Entries.assign(100, {"http://a/"});

  Run();

  EXPECT_TRUE(machine.urlCache.Entries.empty());
}

TEST_F(Cache, Is_limited_in_both_keys_the_newer_first) {
  machine.registry.AddKey(kContent);
  machine.registry.AddKey(kOlderContent);

  Run();

  for (const std::string& key : {kContent, kOlderContent}) {
    ASSERT_TRUE(Limit(key)) << key;
    EXPECT_EQ(Limit(key)->type, platform::kRegDword);
    EXPECT_EQ(Limit(key)->data, (std::vector<std::uint8_t>{0x00, 0x2C, 0x01, 0x00})); // 76800
  }
  EXPECT_EQ(machine.registry.Calls,
            (std::vector<std::string>{"RegOpenKeyExA " + kContent, "RegSetValueExA CacheLimit", "RegCloseKey",
                                      "RegOpenKeyExA " + kOlderContent, "RegSetValueExA CacheLimit",
                                      "RegCloseKey"}));
}

TEST_F(Cache, Without_its_keys_is_limited_nowhere_and_passes_all_the_same) {
  machine.registry.RemoveKey("HKEY_CURRENT_USER\\Software\\Microsoft");

  Run();

  EXPECT_FALSE(machine.registry.HasKey(kContent));
  EXPECT_FALSE(machine.registry.HasKey(kOlderContent));
}

TEST_F(LocalCheckTest, An_idle_processor_shows_the_first_reading_that_says_nothing_and_passes) {
  machine.performanceData.SetProcessors({{}}, 128'000'000'000'000'000);

  EXPECT_EQ(program.surf.localChecks.processor.Run(rows), Outcome::Passed);

  // 100 of one reading and 0 of fourteen.
  EXPECT_EQ(Detail(1), u"6.67%");
  EXPECT_EQ(Pauses(), 15);
}

/// What the interfaces have carried, and how fast the last one is.
class Line : public LocalCheckTest {
 protected:
  void SetCard(std::uint32_t received, std::uint32_t sent, std::uint32_t speed) {
    platform::InterfaceRow card;
    card.Set(platform::InterfaceRow::kInOctets, received);
    card.Set(platform::InterfaceRow::kOutOctets, sent);
    card.Set(platform::InterfaceRow::kSpeed, speed);
    card.Set(platform::InterfaceRow::kOperStatus, platform::kDisconnected);
    machine.ipHelper.Interfaces.push_back(card);
  }
  Outcome Run() { return program.surf.localChecks.line.Run(rows); }
  int FaultOfRun() {
    try {
      Run();
    } catch (const Fault& fault) {
      return fault.number;
    }
    return 0;
  }
};

TEST_F(Line, Of_exactly_40_passes) {
  machine.ipHelper.Interfaces.clear();
  SetCard(2'000'000, 1'000'000, 10'500);

  EXPECT_EQ(Run(), Outcome::Passed);

  EXPECT_EQ(Detail(1), u"40.00%");
  EXPECT_EQ(Pauses(), 15);
  EXPECT_EQ(Repaints(), 7);
}

TEST_F(Line, A_little_above_40_fails) {
  machine.ipHelper.Interfaces.clear();
  SetCard(2'000'750, 1'000'000, 10'500);

  EXPECT_EQ(Run(), Outcome::Failed);

  EXPECT_EQ(Detail(1), u"40.01%");
}

TEST_F(Line, Goes_by_the_speed_of_the_last_interface_though_another_one_is_in_use) {
  SetCard(1'500'000, 0, 10'500);

  Run();

  EXPECT_EQ(Detail(1), u"20.00%");
}

TEST_F(Line, Without_a_speed_is_an_untrapped_fault) {
  machine.ipHelper.Interfaces.clear();
  SetCard(1, 0, 0);
  EXPECT_EQ(FaultOfRun(), Fault::kDivision);
  machine.ipHelper.Interfaces.clear();
  SetCard(0, 0, 0);
  EXPECT_EQ(FaultOfRun(), Fault::kOverflow);
}

TEST_F(Line, Without_an_interface_is_an_untrapped_fault) {
  machine.ipHelper.Interfaces.clear();

  EXPECT_EQ(FaultOfRun(), Fault::kSubscript);
}

TEST_F(Line, That_carried_more_than_31_bits_count_is_an_untrapped_fault) {
  machine.ipHelper.Interfaces.clear();
  SetCard(2'147'483'647, 1, 10'500);

  EXPECT_EQ(FaultOfRun(), Fault::kOverflow);
}

} // namespace
} // namespace quendra::diagnostics
