#include "platform/windows/WineDeviations.h"

#include <gtest/gtest.h>

#include <set>

namespace quendra::platform::windows {
namespace {

/// "Suite.Name" of every test in this executable, without what instances and parameters add.
std::set<std::string> AllTests() {
  std::set<std::string> names;
  const testing::UnitTest& all = *testing::UnitTest::GetInstance();
  for (int i = 0; i < all.total_test_suite_count(); ++i) {
    const testing::TestSuite& suite = *all.GetTestSuite(i);
    const std::string suiteName = suite.name();
    for (int k = 0; k < suite.total_test_count(); ++k) {
      const std::string name = suite.GetTestInfo(k)->name();
      names.insert(suiteName.substr(suiteName.find('/') + 1) + "." + name.substr(0, name.find('/')));
    }
  }
  return names;
}

TEST(WineDeviations, Name_tests_that_there_are_each_once_with_a_reason) {
  const std::set<std::string> tests = AllTests();
  std::set<std::string_view> named;
  for (const WineDeviation& deviation : kWineDeviations) {
    EXPECT_TRUE(tests.contains(std::string(deviation.test))) << deviation.test;
    EXPECT_TRUE(named.insert(deviation.test).second) << deviation.test;
    EXPECT_GT(deviation.why.size(), 20U) << deviation.test;
  }
}

TEST(WineDeviations, Skip_no_test_that_they_do_not_name) {
  EXPECT_EQ(WineDeviationIn("RealSocketsTest.None_of_these"), "");
}

} // namespace
} // namespace quendra::platform::windows
