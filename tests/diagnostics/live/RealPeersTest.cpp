#include "diagnostics/live/MailAndWebPeers.h"
#include "diagnostics/live/SurfLiveFixture.h"

#include <cstdio>

namespace quendra::diagnostics {
namespace {

std::size_t CountOf(const std::string& part, const std::string& text) {
  std::size_t count = 0;
  for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + 1)) ++count;
  return count;
}

/// Web and mail servers from the distribution, which answer and note by their own rules.
class RealPeers : public SurfLive {
 protected:
  void SetUp() override {
    const std::string missing = MailAndWebPeers::Missing();
    if (!missing.empty()) GTEST_SKIP() << missing;
    SurfLive::SetUp();
    if (IsSkipped()) return;
    peers = std::make_unique<MailAndWebPeers>(folder);
    // What they have noted about the test's own look whether they are there.
    ASSERT_TRUE(AwaitMailVisitors(1));
  }
  void TearDown() override {
    if (peers)
      std::printf("%s%s%s", peers->WebLog().c_str(), peers->IncomingMailLog().c_str(),
                  peers->OutgoingMailLog().c_str());
    peers.reset();
    SurfLive::TearDown();
  }

  /// So many have come to both mail servers and have gone.
  bool AwaitMailVisitors(std::size_t visitors) {
    return Await([&] {
      return CountOf("(no auth attempts in ", peers->IncomingMailLog()) >= visitors &&
             CountOf(" smtp disconnected ", peers->OutgoingMailLog()) >= visitors;
    });
  }

  std::unique_ptr<MailAndWebPeers> peers;
};

TEST_F(RealPeers, Answer_the_four_checks_and_take_their_requests_for_what_they_are) {
  OpenPage();
  ASSERT_TRUE(AwaitStep(10));

  ASSERT_TRUE(desktop.Click(program->surfPage.surf_lblBack));
  ASSERT_TRUE(AwaitMailVisitors(2));

  for (int row = 1; row <= 4; ++row) {
    EXPECT_EQ(Icon(row), kTick) << row;
    EXPECT_EQ(Detail(row), u"") << row;
  }
  EXPECT_EQ(peers->WebLog(), "\"GET / HTTP/1.0\" 200\n\"GET / HTTP/1.0\" 200\n");
  // Neither request for mail has a line end, so neither was ever a command.
  EXPECT_EQ(CountOf("failed-command", peers->OutgoingMailLog()), 0u);
  EXPECT_EQ(CountOf("<<<", peers->OutgoingMailLog()), 0u);
  EXPECT_EQ(CountOf("user=<>", peers->IncomingMailLog()), 2u);
}

TEST_F(RealPeers, Answer_the_dialog_of_port_checks_with_their_whole_greetings) {
  const frmPortsChecks& dialog = OpenPortsDialog();

  ASSERT_TRUE(Await([&] { return HasAllResults(dialog); }));

  EXPECT_TRUE(dialog.Label3.Caption().starts_with(u"OK! (0.")) << ToUtf8(dialog.Label3.Caption());
  EXPECT_EQ(dialog.Label4.Caption(), u"OK! (0.03 KB)"); // "220 mail.test ESMTP" and the server's name
  EXPECT_EQ(dialog.Label6.Caption(), u"OK! (0.01 KB)"); // "+OK ready"
  for (const forms::Label* label : {&dialog.Label3, &dialog.Label4, &dialog.Label6})
    EXPECT_EQ(label->ForeColour(), 32768u);
}

} // namespace
} // namespace quendra::diagnostics
