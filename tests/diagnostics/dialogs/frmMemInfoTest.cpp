#include "diagnostics/dialogs/frmMemInfo.h"

#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/system/SimulatedSystem.h"

#include <gtest/gtest.h>

namespace quendra::diagnostics {
namespace {

using platform::MemoryStatus;

class frmMemInfoTest : public testing::Test {
 protected:
  void Set(MemoryStatus::Field field, std::uint32_t value) { system.Memory.Set(field, value); }
  void Open() { desktop.Show(form); }
  void Tick() { desktop.Advance(10); }
  std::vector<Text> Fields() const {
    return {form.txtPhysicalMemory.Value(), form.txtAPhysicalMemory.Value(), form.txtVirtualMemory.Value(),
            form.txtAVirtualMemory.Value(), form.txtPageFile.Value(),        form.txtAPageFile.Value(),
            form.txtMemoryUsage.Value()};
  }

  platform::simulated::Core core;
  platform::simulated::SimulatedSystem system{core};
  forms::headless::HeadlessDesktop desktop;
  frmMemInfo form{desktop, system};
};

TEST_F(frmMemInfoTest, Every_figure_stands_in_its_field_from_the_start) {
  system.Memory = platform::simulated::SimulatedSystem::MemoryOf(
      {42, 1024 * 1000, 1024 * 200'000, 1024 * 3000, 1024 * 400, 1024 * 500'000, 1024 * 1'234'567});
  Open();
  EXPECT_EQ(Fields(), (std::vector<Text>{u"1,000 Kb", u"200,000 Kb", u"500,000 Kb", u"1,234,567 Kb",
                                         u"3,000 Kb", u"400 Kb", u"42 %"}));
}

TEST_F(frmMemInfoTest, The_title_is_that_of_memory_figures) {
  Open();
  EXPECT_EQ(form.Caption(), u"נתוני זיכרון");
  EXPECT_EQ(form.cmdClose.Caption(), u"סגור");
}

TEST_F(frmMemInfoTest, Every_group_and_label_has_its_caption) {
  Open();
  const std::vector<Text> captions{form.Frame1.Caption(), form.Label1.Caption(), form.Label3.Caption(),
                                   form.Frame2.Caption(), form.Label2.Caption(), form.Label4.Caption(),
                                   form.Frame3.Caption(), form.Label6.Caption(), form.Label5.Caption(),
                                   form.Label7.Caption()};
  EXPECT_EQ(captions, (std::vector<Text>{u" זיכרון פיזי ", u"סה\"כ זיכרון פיזי:", u"זיכרון פיזי זמין:",
                                         u" זיכרון וירטואלי ", u"סה\"כ זיכרון וירטואלי:",
                                         u"זיכרון וירטואלי זמין: ", u" ניצול דפי זיכרון ", u"גודל דף זיכרון:",
                                         u"גודל דף זמין:", u"זכרון מנוצל:"}));
}

TEST_F(frmMemInfoTest, The_system_is_asked_with_a_record_of_32_bytes) {
  /// Keeps the length that the caller states.
  struct : platform::simulated::SimulatedSystem {
    using SimulatedSystem::SimulatedSystem;
    std::uint32_t length = 0;
    void GlobalMemoryStatus(MemoryStatus& status) override {
      length = status.Get(MemoryStatus::kLength);
      SimulatedSystem::GlobalMemoryStatus(status);
    }
  } asked{core};
  frmMemInfo other(desktop, asked);
  desktop.Show(other);
  EXPECT_EQ(asked.length, 32U);
}

TEST_F(frmMemInfoTest, A_figure_below_1024_shows_no_digit) {
  Set(MemoryStatus::kAvailPhys, 1023);
  Open();
  EXPECT_EQ(form.txtAPhysicalMemory.Value(), u" Kb");
}

TEST_F(frmMemInfoTest, A_figure_above_2_GB_shows_as_negative) {
  Set(MemoryStatus::kTotalPhys, 0x80000000);
  Open();
  EXPECT_EQ(form.txtPhysicalMemory.Value(), u"-2,097,152 Kb");
}

TEST_F(frmMemInfoTest, Free_memory_below_16000_Kb_is_red_and_16000_is_black_again) {
  Set(MemoryStatus::kAvailPhys, 16000 * 1024 - 1);
  Open();
  EXPECT_EQ(form.txtAPhysicalMemory.ForeColour(), forms::kRed);
  Set(MemoryStatus::kAvailPhys, 16000 * 1024);
  Tick();
  EXPECT_EQ(form.txtAPhysicalMemory.ForeColour(), forms::kBlack);
}

TEST_F(frmMemInfoTest, Free_memory_above_2_GB_is_below_any_limit_and_so_red) {
  Set(MemoryStatus::kAvailPhys, 0x80000000);
  Open();
  EXPECT_EQ(form.txtAPhysicalMemory.Value(), u"-2,097,152 Kb");
  EXPECT_EQ(form.txtAPhysicalMemory.ForeColour(), forms::kRed);
}

TEST_F(frmMemInfoTest, Nearly_no_free_virtual_memory_and_page_file_stay_black) {
  Set(MemoryStatus::kAvailVirtual, 1);
  Set(MemoryStatus::kAvailPageFile, 1);
  Open();
  EXPECT_EQ(form.txtAVirtualMemory.ForeColour(), forms::kBlack);
  EXPECT_EQ(form.txtAPageFile.ForeColour(), forms::kBlack);
}

TEST_F(frmMemInfoTest, A_total_below_half_of_what_is_available_is_red_and_stays_so) {
  Set(MemoryStatus::kTotalVirtual, 49);
  Set(MemoryStatus::kAvailVirtual, 100);
  Set(MemoryStatus::kTotalPageFile, 49);
  Set(MemoryStatus::kAvailPageFile, 100);
  Open();
  Set(MemoryStatus::kTotalVirtual, 100);
  Set(MemoryStatus::kTotalPageFile, 100);
  Tick();
  EXPECT_EQ(form.txtAVirtualMemory.ForeColour(), forms::kRed);
  EXPECT_EQ(form.txtAPageFile.ForeColour(), forms::kRed);
}

TEST_F(frmMemInfoTest, A_dialog_that_was_closed_opens_in_its_own_colours) {
  Set(MemoryStatus::kTotalVirtual, 49);
  Set(MemoryStatus::kAvailVirtual, 100);
  Open();
  desktop.Click(form.cmdClose);
  Set(MemoryStatus::kTotalVirtual, 100);
  Open();
  EXPECT_EQ(form.txtAVirtualMemory.ForeColour(), forms::kBlack);
}

TEST_F(frmMemInfoTest, A_total_of_exactly_half_stays_black) {
  Set(MemoryStatus::kTotalVirtual, 50);
  Set(MemoryStatus::kAvailVirtual, 100);
  Open();
  EXPECT_EQ(form.txtAVirtualMemory.ForeColour(), forms::kBlack);
}

TEST_F(frmMemInfoTest, Figures_follow_the_machine_every_10_milliseconds) {
  Open();
  Set(MemoryStatus::kMemoryLoad, 77);
  const int before = system.MemoryQuestions;
  desktop.Advance(9);
  EXPECT_EQ(system.MemoryQuestions, before);
  desktop.Advance(1);
  EXPECT_EQ(form.txtMemoryUsage.Value(), u"77 %");
}

TEST_F(frmMemInfoTest, No_available_virtual_memory_divides_by_zero_and_ends_the_program) {
  Open();
  Set(MemoryStatus::kAvailVirtual, 0);
  Tick();
  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_NE(desktop.Boxes[0].text.find(u"11"), Text::npos);
  EXPECT_EQ(desktop.EndStatus, 1);
}

TEST_F(frmMemInfoTest, Nothing_available_ends_the_program_before_the_dialog_stands) {
  Set(MemoryStatus::kAvailVirtual, 0);
  desktop.Dispatch([this] { Open(); });
  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_EQ(desktop.EndStatus, 1);
  EXPECT_FALSE(form.Visible());
}

TEST_F(frmMemInfoTest, No_available_page_file_divides_by_zero_and_ends_the_program) {
  Open();
  Set(MemoryStatus::kAvailPageFile, 0);
  Tick();
  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
}

TEST_F(frmMemInfoTest, Nothing_by_nothing_is_an_overflow) {
  Open();
  Set(MemoryStatus::kTotalVirtual, 0);
  Set(MemoryStatus::kAvailVirtual, 0);
  Tick();
  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_NE(desktop.Boxes[0].text.find(u"6"), Text::npos);
}

TEST_F(frmMemInfoTest, The_close_button_unloads_it_and_its_timer_stops) {
  Open();
  EXPECT_TRUE(desktop.Click(form.cmdClose));
  EXPECT_FALSE(form.IsLoaded());
  const int before = system.MemoryQuestions;
  desktop.Advance(100);
  EXPECT_EQ(system.MemoryQuestions, before);
}

TEST_F(frmMemInfoTest, The_fields_can_be_read_and_not_changed) {
  Open();
  for (const forms::TextBox* field :
       {&form.txtPhysicalMemory, &form.txtAPhysicalMemory, &form.txtVirtualMemory, &form.txtAVirtualMemory,
        &form.txtPageFile, &form.txtAPageFile, &form.txtMemoryUsage})
    EXPECT_TRUE(field->ReadOnly()) << ToUtf8(field->Name());
}

} // namespace
} // namespace quendra::diagnostics
