#include "platform/BackendFixture.h"

namespace quendra::platform {

namespace {

/// Without what the suites' instances and parameters add: "Suite.Name".
std::string NameOf(const testing::TestInfo& test) {
  const std::string suite = test.test_suite_name();
  const std::string name = test.name();
  return suite.substr(suite.find('/') + 1) + "." + name.substr(0, name.find('/'));
}

} // namespace

void BackendTest::SetUp() {
  const std::string why = backend->WhyNot(NameOf(*testing::UnitTest::GetInstance()->current_test_info()));
  if (!why.empty()) GTEST_SKIP() << why;
}

} // namespace quendra::platform
