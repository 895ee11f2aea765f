#include "platform/linux/remote_access/RasFixture.h"
#include "platform/linux/system/Files.h"

#include <thread>

namespace quendra::platform::linux_ {

namespace {

/// Dials through a real NetworkManager whose PPP service keeps it waiting.
struct RealDialTest : RasTest {
  void SetUp() override {
    if (const std::string missing = RealNetworkManager::Missing(); !missing.empty()) GTEST_SKIP() << missing;
    ASSERT_TRUE(manager.Start()) << manager.Log();
    ASSERT_EQ(Put("097", EntryFor("pppoe")), 0U);
    ASSERT_EQ(Save("097", "dan@097", "verysecretword"), 0U);
  }
  /// What the PPP service was started with; empty before.
  std::string Arguments() { return ReadFile(tools / "arguments", 10'000).value_or(""); }

  TemporaryFolder tools;
  const std::string service =
      tools.Write("pppd", "#!/bin/sh\necho \"$*\" >" + (tools / "arguments") + "\nexec sleep 20\n", true);
  RealNetworkManager manager{std::string(RealNetworkManager::kTwoLinks) + " && mount --bind " + service +
                             " /usr/sbin/pppd"};
};

} // namespace

TEST_F(RealDialTest, The_password_stands_on_no_command_line) {
  ASSERT_EQ(Dial("097"), 0U);
  ASSERT_TRUE(loop.WaitFor([&] { return !Arguments().empty(); }, 20'000)) << manager.Log();
  EXPECT_NE(Arguments().find("dan@097"), std::string::npos) << Arguments();
  EXPECT_EQ(Arguments().find("verysecretword"), std::string::npos);
  // The brackets keep the search from finding itself.
  EXPECT_EQ(OutputOf("cat /proc/[0-9]*/cmdline 2>/dev/null | grep -ac 'very[s]ecretword'"), "0\n");
  EXPECT_EQ(dialling.RasHangUpA(handle), 0U);
}

TEST_F(RealDialTest, Standing_still_while_it_dials_it_ends_a_dial_without_a_window) {
  std::jthread later([&] {
    for (int i = 0; i < 10; ++i)
      if (Wait([&] { return !Arguments().empty(); })) return manager.StopForAWhile();
  });
  EXPECT_EQ(Dial("097", false), kRasManagerCannotStart);
  EXPECT_EQ(handle, kNoRasConnection);
  later.join();
  manager.GoOn();
  EXPECT_EQ(Names(), std::vector<std::string>{"097"});
}

} // namespace quendra::platform::linux_
