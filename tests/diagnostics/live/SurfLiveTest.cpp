#include "app/Program.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "integration/NetworkNamespace.h"
#include "integration/SocketHelpers.h"
#include "platform/linux/LinuxMachine.h"
#include "report/live/Peer.h"
#include "runtime/Settings.h"

#include <gtest/gtest.h>

#include <sys/mount.h>

namespace quendra::diagnostics {
namespace {

/// The whole program on this machine, in a network of its own with nothing but loopback.
class SurfLive : public testing::Test {
 protected:
  void SetUp() override {
    if (!integration::NetworkNamespace::Possible())
      GTEST_SKIP() << integration::NetworkNamespace::kSkipReason;
    space_ = std::make_unique<integration::NetworkNamespace>();
    integration::RunCommand("ip link set lo up");
    integration::NetworkNamespace::Set("net/ipv4/ip_local_port_range", "1025 5000");
    // A connection that nobody answers is given up after some three seconds instead of two minutes.
    integration::NetworkNamespace::Set("net/ipv4/tcp_syn_retries", "1");
    machine = std::make_unique<platform::linux_::LinuxMachine>(desktop, desktop);
    program = std::make_unique<app::Program>(machine->Operations(), desktop);
  }
  void TearDown() override {
    program.reset();
    machine.reset();
  }

  /// Ports with their manners, as in "80:answer".
  void Serve(const std::vector<std::string>& ports) {
    std::vector<std::string> command{"python3", QUENDRA_SOURCE_DIR "/tests/standins/odd_server.py"};
    command.insert(command.end(), ports.begin(), ports.end());
    peer_ = std::make_unique<report::Peer>(command);
    ASSERT_EQ(peer_->FirstLine(), "ready");
  }
  void OpenPage() {
    program->Start();
    ASSERT_TRUE(desktop.Click(program->frmSplash.Label2));
    ASSERT_TRUE(desktop.Click(program->frmMenu.lblCaption[1]));
  }
  bool Await(const std::function<bool()>& condition, int milliseconds = 20'000) {
    return desktop.WaitFor(condition, milliseconds);
  }
  /// A step begins when its row stands in the list.
  bool AwaitStep(int step) {
    return Await([&] { return List().Count() >= step; });
  }

  forms::ListView& List() { return program->surfPage.surf_ListView1; }
  Text Detail(int row) { return List().Row(row).CellText(1); }
  int Icon(int row) {
    forms::ListRow& shown = List().Row(row);
    return shown.CellCount() < 3 ? 0 : shown.CellIcon(3);
  }

 private:
  std::unique_ptr<integration::NetworkNamespace> space_;
  std::unique_ptr<report::Peer> peer_;

 protected:
  static constexpr int kTick = 1;
  static constexpr int kCross = 2;
  forms::headless::PolledDesktop desktop;
  std::unique_ptr<platform::linux_::LinuxMachine> machine;
  std::unique_ptr<app::Program> program;
};

struct Ending {
  const char* manner; ///< of the server for incoming mail; none listens without one
  int icon;
  const char16_t* detail;
};

void PrintTo(const Ending& ending, std::ostream* out) { *out << ending.manner; }

/// What becomes of the third check; the fourth waits after it, so that no local check begins.
class MailServer : public SurfLive, public testing::WithParamInterface<Ending> {};

TEST_P(MailServer, Ends_its_check_as_it_behaves) {
  std::vector<std::string> ports{"80:answer", "25:silent"};
  if (*GetParam().manner != 0) ports.push_back(std::string("110:") + GetParam().manner);
  Serve(ports);
  OpenPage();

  ASSERT_TRUE(AwaitStep(4));

  EXPECT_EQ(Icon(1), kTick);
  EXPECT_EQ(Icon(2), kTick);
  EXPECT_EQ(Icon(3), GetParam().icon);
  EXPECT_EQ(Detail(3), GetParam().detail);
  EXPECT_EQ(program->surf.surfChecks.FailCount(), GetParam().icon == kCross ? 1 : 0);
}

INSTANTIATE_TEST_SUITE_P(Manners, MailServer,
                         testing::Values(Ending{"answer", 1, u""}, Ending{"byte", 1, u""},
                                         Ending{"garbage", 1, u""}, Ending{"close", 0, u""},
                                         Ending{"reset", 2, u"10054 - Connection reset by peer."},
                                         Ending{"full", 2, u"10060 - Connection timed out."},
                                         Ending{"", 2, u"10061 - Connection refused."}),
                         [](const auto& run) {
                           const std::string manner = run.param.manner;
                           return manner.empty() ? "none" : manner;
                         });

TEST_F(SurfLive, A_silent_server_holds_its_step_and_the_window_lives) {
  Serve({"80:answer", "110:silent"});
  OpenPage();
  ASSERT_TRUE(AwaitStep(3));

  EXPECT_FALSE(Await([&] { return List().Count() > 3; }, 1000));
  EXPECT_TRUE(desktop.Click(program->surfPage.frmSurf_cmdAdvanced));
  EXPECT_TRUE(desktop.Click(program->surfPage.surf_lblBack));
  EXPECT_TRUE(desktop.Click(program->surfPage.surf_lblBack));

  EXPECT_FALSE(program->surfPage.frameSurfProb.Visible());
  EXPECT_EQ(program->surf.surfChecks.Sockets(), nullptr);
}

TEST_F(SurfLive, An_old_socket_that_is_reset_fails_the_step_that_waits) {
  Serve({"80:late,answer", "110:silent", "25:silent"});
  OpenPage();
  ASSERT_TRUE(AwaitStep(3));

  ASSERT_TRUE(AwaitStep(4));

  EXPECT_EQ(Detail(3), u"10054 - Connection reset by peer.");
  EXPECT_EQ(Icon(3), kCross);
  EXPECT_EQ(Icon(1), kTick);
}

TEST_F(SurfLive, All_eight_checks_come_to_their_end_and_an_old_socket_may_still_fail_after_it) {
  Serve({"80:late,answer", "110:answer", "25:answer"});
  OpenPage();

  ASSERT_TRUE(AwaitStep(10));
  for (int row = 1; row <= 4; ++row) EXPECT_EQ(Icon(row), kTick) << row;
  for (int row = 5; row <= 8; ++row) EXPECT_NE(Icon(row), 0) << row;
  EXPECT_EQ(List().Row(10).CellText(2), u"הסתיים");

  ASSERT_TRUE(AwaitStep(12));
  EXPECT_EQ(Detail(10), u"10054 - Connection reset by peer.");
  EXPECT_EQ(Icon(10), kCross);
}

TEST_F(SurfLive, The_dialog_of_port_checks_tells_an_answer_a_refusal_and_a_reset_apart) {
  Serve({"80:answer", "110:reset"});
  program->Start();
  ASSERT_TRUE(desktop.Click(program->frmSplash.Label2));
  auto& dialog = program->frmPortsChecks;
  desktop.Show(dialog);

  ASSERT_TRUE(Await([&] {
    return !dialog.Label3.Caption().empty() && !dialog.Label4.Caption().empty() &&
           !dialog.Label6.Caption().empty();
  }));

  EXPECT_EQ(dialog.Label3.Caption(), u"OK! (0.01 KB)");
  EXPECT_EQ(dialog.Label4.Caption(), u"ERROR: 10061 - Connection refused.");
  EXPECT_EQ(dialog.Label6.Caption(), u"ERROR: 10054 - Connection reset by peer.");
}

/// A system whose only source of names is what the test puts there. The thread and those that it starts see
/// its files in place of the system's.
class NameService : public SurfLive {
 protected:
  void SetUp() override {
    SurfLive::SetUp();
    if (IsSkipped()) return;
    ASSERT_EQ(unshare(CLONE_NEWNS), 0);
    ASSERT_EQ(mount(nullptr, "/", nullptr, MS_REC | MS_PRIVATE, nullptr), 0);
    Replace("/etc/hosts", "\n");
    Replace("/etc/resolv.conf", "nameserver 127.0.0.1\noptions timeout:1 attempts:1\n");
  }
  void TearDown() override {
    for (auto place = replaced_.rbegin(); place != replaced_.rend(); ++place) {
      umount2(place->file.c_str(), MNT_DETACH);
      unlink(place->other.c_str());
    }
    SurfLive::TearDown();
  }
  void Replace(const std::string& file, const std::string& content) {
    const std::string other = testing::TempDir() + "quendra-names-" + std::to_string(getpid()) + "-" +
                              std::to_string(replaced_.size());
    std::ofstream(other) << content;
    replaced_.push_back({file, other});
    ASSERT_EQ(mount(other.c_str(), file.c_str(), nullptr, MS_BIND, nullptr), 0) << file;
  }

 private:
  struct Replacement {
    std::string file;
    std::string other;
  };
  std::vector<Replacement> replaced_;
};

TEST_F(NameService, That_refuses_fails_the_first_check_alone) {
  Serve({"80:answer"});
  OpenPage();

  ASSERT_TRUE(AwaitStep(3));

  EXPECT_EQ(Detail(1), u"11002 - Nonauthoritative host not found.");
  EXPECT_EQ(Icon(1), kCross);
  EXPECT_EQ(Icon(2), kTick);
}

TEST_F(NameService, That_never_answers_fails_the_first_check_once_the_system_gives_up) {
  const int server = socket(AF_INET, SOCK_DGRAM | SOCK_CLOEXEC, 0);
  const sockaddr_in place = integration::InetAddress("127.0.0.1", 53);
  ASSERT_EQ(bind(server, integration::Generic(place), sizeof place), 0);
  Serve({"80:answer"});
  OpenPage();

  EXPECT_FALSE(Await([&] { return List().Count() > 1; }, 300));
  EXPECT_TRUE(desktop.Click(program->surfPage.frmSurf_cmdAdvanced));
  ASSERT_TRUE(AwaitStep(3));

  EXPECT_EQ(Detail(1), u"11002 - Nonauthoritative host not found.");
  EXPECT_EQ(Icon(2), kTick);
  close(server);
}

TEST_F(NameService, That_no_route_leads_to_fails_the_first_check) {
  Replace("/etc/resolv.conf", "nameserver 192.0.2.53\noptions timeout:1 attempts:1\n");
  Serve({"80:answer"});
  OpenPage();

  ASSERT_TRUE(AwaitStep(3));

  EXPECT_EQ(Detail(1), u"11002 - Nonauthoritative host not found.");
  EXPECT_EQ(Icon(1), kCross);
}

} // namespace
} // namespace quendra::diagnostics
