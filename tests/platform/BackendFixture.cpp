#include "platform/BackendFixture.h"

#include "TestName.h"

namespace quendra::platform {

void BackendTest::SetUp() {
  const std::string why = backend->WhyNot(NameOfTest(*testing::UnitTest::GetInstance()->current_test_info()));
  if (!why.empty()) GTEST_SKIP() << why;
}

} // namespace quendra::platform
