#include "platform/windows/WineDeviations.h"

#include "TestName.h"

#include <gtest/gtest.h>

#include <set>

namespace quendra::platform::windows {
namespace {

/// Every test in this executable.
std::set<std::string> AllTests() {
  std::set<std::string> names;
  const testing::UnitTest& all = *testing::UnitTest::GetInstance();
  for (int i = 0; i < all.total_test_suite_count(); ++i) {
    const testing::TestSuite& suite = *all.GetTestSuite(i);
    for (int k = 0; k < suite.total_test_count(); ++k) names.insert(NameOfTest(*suite.GetTestInfo(k)));
  }
  return names;
}

bool HasSuiteOf(const std::set<std::string>& tests, std::string_view test) {
  const std::string suite(test.substr(0, test.find('.') + 1));
  return std::ranges::any_of(tests, [&](const std::string& each) { return each.starts_with(suite); });
}

// Runs in each executable with suites that the list names.
TEST(WineDeviations, Name_tests_that_there_are_each_once_with_a_reason) {
  const std::set<std::string> tests = AllTests();
  std::set<std::string_view> named;
  int here = 0;
  for (const WineDeviation& deviation : kWineDeviations) {
    if (HasSuiteOf(tests, deviation.test)) {
      EXPECT_TRUE(tests.contains(std::string(deviation.test))) << deviation.test;
      ++here;
    }
    EXPECT_TRUE(named.insert(deviation.test).second) << deviation.test;
    EXPECT_GT(deviation.why.size(), 20U) << deviation.test;
  }
  EXPECT_GE(here, 3);
}

TEST(WineDeviations, Skip_no_test_that_they_do_not_name) {
  EXPECT_EQ(WineDeviationIn("RealSocketsTest.None_of_these"), "");
}

} // namespace
} // namespace quendra::platform::windows
