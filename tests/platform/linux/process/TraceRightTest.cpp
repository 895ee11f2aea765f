#include "platform/linux/process/TraceRight.h"

#include "platform/linux/LinuxFixture.h"

#include <gtest/gtest.h>
#include <unistd.h>

namespace quendra::platform::linux_ {
namespace {

TEST(TraceRightTest, The_administrator_may_look_at_every_process_and_an_ordinary_user_may_not) {
  if (::geteuid() != 0) GTEST_SKIP() << "needs the administrator, who can become another user";
  EXPECT_TRUE(MayTraceEveryProcess());
  const Child user([] {
    if (::setuid(65534) != 0) return std::string("no");
    return std::string(MayTraceEveryProcess() ? "may" : "may not");
  });
  EXPECT_EQ(user.Answer(), "may not");
}

} // namespace
} // namespace quendra::platform::linux_
