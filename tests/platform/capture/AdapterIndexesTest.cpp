#include "platform/capture/AdapterIndexes.h"

#include "forms/headless/HeadlessDesktop.h"
#include "platform/capture/ScriptedLines.h"

#include <gtest/gtest.h>

namespace quendra::platform {

namespace {

using Availability = CaptureLibrary::Availability;

class AdapterIndexesTest : public testing::Test {
 protected:
  std::string NameAt(int index) const {
    const LiveAdapter* adapter = indexes.At(index);
    return adapter != nullptr ? adapter->name : "none";
  }

  forms::headless::HeadlessDesktop desktop;
  ScriptedLines lines{desktop, Pace::Bell};
  const std::unique_ptr<CaptureAdapters> adapters = lines.MakeAdapters();
  AdapterIndexes indexes{*adapters};
};

} // namespace

TEST_F(AdapterIndexesTest, Before_they_are_counted_there_are_none) {
  lines.Add("a", "10.0.0.1");
  indexes.ListAfresh();
  EXPECT_EQ(indexes.Count(), 0);
  EXPECT_EQ(NameAt(0), "none");
}

TEST_F(AdapterIndexesTest, Each_adapter_has_an_index_and_spare_ones_repeat_the_last) {
  lines.Add("a", "10.0.0.1");
  lines.Add("b", "10.0.0.2");
  indexes.CountAdapters();
  EXPECT_EQ(indexes.Count(), 2 + AdapterIndexes::kSpare);
  EXPECT_EQ(NameAt(0), "a");
  for (int index = 1; index < indexes.Count(); ++index) EXPECT_EQ(NameAt(index), "b");
}

TEST_F(AdapterIndexesTest, Beyond_the_indexes_there_is_no_adapter) {
  lines.Add("a", "10.0.0.1");
  indexes.CountAdapters();
  EXPECT_EQ(NameAt(-1), "none");
  EXPECT_EQ(NameAt(indexes.Count()), "none");
}

TEST_F(AdapterIndexesTest, No_more_than_1024_adapters_have_an_index_of_their_own) {
  for (int i = 0; i < 1025; ++i) lines.Add("a" + std::to_string(i), "10.0.0.1");
  indexes.CountAdapters();
  EXPECT_EQ(indexes.Count(), 1024 + AdapterIndexes::kSpare);
}

TEST_F(AdapterIndexesTest, Adapters_that_come_later_stand_in_a_fresh_list_within_the_same_indexes) {
  lines.Add("a", "10.0.0.1");
  indexes.CountAdapters();
  const int before = indexes.Count();
  lines.Add("b", "10.0.0.2").adapter.hasDefaultRoute = true;
  indexes.ListAfresh();
  EXPECT_EQ(indexes.Count(), before);
  EXPECT_EQ(NameAt(0), "b");
  EXPECT_TRUE(indexes.Lists("a"));
}

TEST_F(AdapterIndexesTest, More_than_there_are_indexes_leave_out_the_last_ones) {
  lines.Add("a", "10.0.0.1");
  indexes.CountAdapters();
  for (int i = 0; i < 30; ++i) lines.Add("b" + std::to_string(i), "10.0.0.2");
  indexes.ListAfresh();
  EXPECT_EQ(NameAt(indexes.Count() - 1), "b" + std::to_string(indexes.Count() - 2));
  EXPECT_EQ(NameAt(indexes.Count()), "none");
}

TEST_F(AdapterIndexesTest, A_list_that_has_become_empty_has_no_adapter_at_any_index) {
  lines.Add("a", "10.0.0.1");
  indexes.CountAdapters();
  lines.Remove("a");
  indexes.ListAfresh();
  for (int index = 0; index < indexes.Count(); ++index) EXPECT_EQ(NameAt(index), "none");
  EXPECT_EQ(indexes.Availability(), Availability::NoAdapters);
}

TEST_F(AdapterIndexesTest, A_machine_without_adapters_has_no_indexes) {
  indexes.CountAdapters();
  EXPECT_EQ(indexes.Count(), 0);
  EXPECT_EQ(indexes.Availability(), Availability::NoAdapters);
}

TEST_F(AdapterIndexesTest, What_lacks_is_told_as_it_was_when_they_were_listed) {
  lines.Add("a", "10.0.0.1");
  indexes.CountAdapters();
  EXPECT_EQ(indexes.Availability(), Availability::Available);
  lines.mayCapture = false;
  EXPECT_EQ(indexes.Availability(), Availability::Available);
  indexes.ListAfresh();
  EXPECT_EQ(indexes.Availability(), Availability::NoRights);
  lines.hasLibrary = false;
  indexes.ListAfresh();
  EXPECT_EQ(indexes.Availability(), Availability::NoLibrary);
}

} // namespace quendra::platform
