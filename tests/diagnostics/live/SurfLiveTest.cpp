#include "diagnostics/live/SurfLiveFixture.h"
#include "integration/SocketHelpers.h"

#include <iterator>
#include <sys/mount.h>

namespace quendra::diagnostics {
namespace {

struct Manner {
  const char* name; ///< what the stand-in calls it; nobody listens without one
  int icon;
  const char16_t* detail;
};

void PrintTo(const Manner& manner, std::ostream* out) { *out << manner.name; }

const Manner kManners[] = {{"answer", 1, u""},
                           {"byte", 1, u""},
                           {"garbage", 1, u""},
                           {"close", 0, u""},
                           {"reset", 2, u"10054 - Connection reset by peer."},
                           {"full", 2, u"10060 - Connection timed out."},
                           {"", 2, u"10061 - Connection refused."}};

/// A network check and a server of any manner; the check behind it waits, and behind the last one all the
/// local ones run.
class LiveCheck : public SurfLive, public testing::WithParamInterface<std::tuple<int, Manner>> {
 protected:
  static std::vector<std::string> PortsFor(int step, const std::string& manner) {
    const auto port = [](const char* number, const std::string& its) {
      return its.empty() ? std::vector<std::string>() : std::vector<std::string>{number + (":" + its)};
    };
    // The web server is asked twice, by its name first; one that isn't there or is full is so both times.
    const bool isBoth = manner.empty() || manner == "full";
    if (step == 1) return Joined(port("80", isBoth ? manner : manner + ",silent"), {"110:silent"});
    if (step == 2) return Joined(port("80", isBoth ? manner : "answer," + manner), {"110:silent"});
    if (step == 3) return Joined(port("110", manner), {"80:answer", "25:silent"});
    return Joined(port("25", manner), {"80:answer", "110:answer"});
  }

 private:
  static std::vector<std::string> Joined(std::vector<std::string> some,
                                         const std::vector<std::string>& more) {
    some.insert(some.end(), more.begin(), more.end());
    return some;
  }
};

TEST_P(LiveCheck, Ends_as_its_server_behaves) {
  const auto& [step, manner] = GetParam();
  Serve(PortsFor(step, manner.name));
  OpenPage();

  ASSERT_TRUE(AwaitStep(step + 1));

  EXPECT_EQ(Icon(step), manner.icon);
  EXPECT_EQ(Detail(step), manner.detail);
  EXPECT_EQ(List().Row(step).CellColour(1), manner.icon == kCross ? 255u : 0u);
  EXPECT_EQ(program->surf.surfChecks.FailCount() > 0, manner.icon == kCross);
}

INSTANTIATE_TEST_SUITE_P(Manners, LiveCheck,
                         testing::Combine(testing::Values(1, 2, 3, 4), testing::ValuesIn(kManners)),
                         [](const auto& run) {
                           const std::string manner = std::get<1>(run.param).name;
                           return "Step_" + std::to_string(std::get<0>(run.param)) + "_" +
                                  (manner.empty() ? "none" : manner);
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

/// The step that waits when the socket of the first one, open since then, is reset.
class LiveOldSocket : public SurfLive, public testing::WithParamInterface<int> {};

TEST_P(LiveOldSocket, That_is_reset_fails_the_step_that_waits) {
  const int step = GetParam();
  Serve({step == 2 ? "80:late,silent" : "80:late,answer", step == 3 ? "110:silent" : "110:answer",
         "25:silent"});
  OpenPage();
  ASSERT_TRUE(AwaitStep(step));
  ASSERT_FALSE(Await([&] { return List().Count() > step; }, 500));

  ASSERT_TRUE(AwaitStep(step + 1));

  EXPECT_EQ(Detail(step), u"10054 - Connection reset by peer.");
  EXPECT_EQ(Icon(step), kCross);
  EXPECT_EQ(Icon(1), kTick);
}

INSTANTIATE_TEST_SUITE_P(DuringEveryLaterStep, LiveOldSocket, testing::Values(2, 3, 4));

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
  const frmPortsChecks& dialog = OpenPortsDialog();

  ASSERT_TRUE(Await([&] { return HasAllResults(dialog); }));

  EXPECT_EQ(dialog.Label3.Caption(), u"OK! (0.01 KB)");
  EXPECT_EQ(dialog.Label4.Caption(), u"ERROR: 10061 - Connection refused.");
  EXPECT_EQ(dialog.Label6.Caption(), u"ERROR: 10054 - Connection reset by peer.");
}

std::size_t OpenDescriptors() {
  const std::filesystem::directory_iterator descriptors("/proc/self/fd");
  return static_cast<std::size_t>(std::distance(begin(descriptors), end(descriptors)));
}

TEST_F(SurfLive, The_dialog_of_port_checks_is_closed_in_the_middle_of_its_probes_with_nothing_left_over) {
  Serve({"80:silent", "25:full", "110:silent"});
  program->Start();
  ASSERT_TRUE(desktop.Click(program->frmSplash.Label2));
  auto& dialog = program->frmPortsChecks;
  desktop.Show(dialog);
  ASSERT_TRUE(Await([&] { return dialog.Sockets()->State(std::int16_t{3}) == foundation::sckConnected; }));
  ASSERT_TRUE(desktop.Click(dialog.Command2));
  const std::size_t before = OpenDescriptors();

  for (int round = 0; round < 20; ++round) {
    desktop.Show(dialog);
    Await([] { return false; }, round % 4);
    ASSERT_TRUE(desktop.Click(dialog.Command2));
  }

  // A look-up that was under way ends in its own time.
  EXPECT_TRUE(Await([&] { return OpenDescriptors() == before; }));
  EXPECT_EQ(dialog.Sockets(), nullptr);
  for (const forms::Label* label : {&dialog.Label3, &dialog.Label4, &dialog.Label6})
    EXPECT_EQ(label->Caption(), u"");
}

TEST_F(SurfLive, The_page_is_left_in_the_middle_of_each_of_many_runs_with_nothing_left_over) {
  Serve({"80:answer", "110:silent"});
  OpenPage();
  ASSERT_TRUE(AwaitStep(3));
  ASSERT_TRUE(desktop.Click(program->surfPage.surf_lblBack));
  const std::size_t before = OpenDescriptors();

  for (int round = 0; round < 20; ++round) {
    ASSERT_TRUE(desktop.Click(program->frmMenu.lblCaption[1]));
    Await([] { return false; }, round % 8);
    ASSERT_TRUE(desktop.Click(program->surfPage.surf_lblBack));
  }

  EXPECT_TRUE(Await([&] { return OpenDescriptors() == before; }));
  EXPECT_EQ(program->surf.surfChecks.Sockets(), nullptr);
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

TEST_F(NameService, That_never_answers_does_not_hold_who_leaves_the_page) {
  const int server = socket(AF_INET, SOCK_DGRAM | SOCK_CLOEXEC, 0);
  const sockaddr_in place = integration::InetAddress("127.0.0.1", 53);
  ASSERT_EQ(bind(server, integration::Generic(place), sizeof place), 0);
  OpenPage();
  ASSERT_FALSE(Await([&] { return List().Count() > 1; }, 300));

  ASSERT_TRUE(desktop.Click(program->surfPage.surf_lblBack));

  // Longer than the system takes to give the name up: nobody hears of it.
  EXPECT_FALSE(Await([&] { return List().Count() > 1; }, 3000));
  EXPECT_EQ(Detail(1), u"");
  EXPECT_FALSE(program->surfPage.frameSurfProb.Visible());
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
