#include "diagnostics/SurfChecks.h"

#include "diagnostics/SurfFixture.h"

namespace quendra::diagnostics {
namespace {

using platform::simulated::SimulatedServer;

/// How a server treats those who connect, and what its check shows then.
struct Manner {
  const char* name;
  void (*play)(SimulatedServer& server);
  bool ends;
  int icon;
  const char16_t* detail;
};

void PrintTo(const Manner& manner, std::ostream* out) { *out << manner.name; }

constexpr int kNone = 0;
constexpr int kTick = 1;
constexpr int kCross = 2;

const Manner kManners[] = {
    {"Refuses", [](auto& server) { server.Refuse(); }, true, kCross, u"10061 - Connection refused."},
    {"Is_given_up_by_the_system", [](auto& server) { server.Refuse(platform::kConnectionTimedOut); }, true,
     kCross, u"10060 - Connection timed out."},
    {"Never_answers_those_who_connect", [](auto& server) { server.StaySilent(); }, false, kNone, u""},
    {"Accepts_and_stays_silent", [](auto&) {}, false, kNone, u""},
    {"Closes_without_a_byte", [](auto& server) { server.Close(); }, true, kNone, u""},
    {"Sends_one_byte", [](auto& server) { server.Greet("x"); }, true, kTick, u""},
    {"Sends_one_byte_and_closes", [](auto& server) { server.Greet("x").Close(); }, true, kTick, u""},
    {"Sends_an_error_page", [](auto& server) { server.Answer({"HTTP/1.0 404 Not Found\r\n\r\n"}); }, true,
     kTick, u""},
    {"Sends_garbage", [](auto& server) { server.Greet(std::string("\0\xFF\x80\x00", 4)); }, true, kTick, u""},
    {"Resets", [](auto& server) { server.Reset(); }, true, kCross, kReset},
};

/// One of the four network checks and a server of any manner; those before it answer, those behind it wait.
class NetworkCheck : public SurfTest, public testing::WithParamInterface<std::tuple<int, Manner>> {
 protected:
  int Step() const { return std::get<0>(GetParam()); }
  const Manner& Played() const { return std::get<1>(GetParam()); }
  void OpenPageWithServers() {
    AnswerBefore(Step());
    Played().play(ServerOf(Step()));
    OpenPage();
  }
};

TEST_P(NetworkCheck, Ends_or_waits_as_its_server_behaves) {
  OpenPageWithServers();

  desktop.Advance(24 * 3'600'000);

  EXPECT_EQ(checks.Step() > Step(), Played().ends);
  EXPECT_EQ(RowCount() > Step(), Played().ends);
  EXPECT_EQ(Icon(Step()), Played().icon);
  EXPECT_EQ(Detail(Step()), Played().detail);
  EXPECT_EQ(Row(Step()).CellColour(1), Played().icon == kCross ? 255u : 0u);
  EXPECT_EQ(checks.FailCount(), Played().icon == kCross ? 1 : 0);
  EXPECT_EQ(Bold(Step()), !Played().ends);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_P(NetworkCheck, Leaves_nothing_behind_when_the_page_is_left) {
  OpenPageWithServers();

  ASSERT_TRUE(desktop.Click(page.surf_lblBack));

  EXPECT_EQ(checks.Sockets(), nullptr);
  EXPECT_EQ(machine.sockets.OpenSockets(), 0);
  EXPECT_EQ(machine.sockets.LookUpsUnderWay(), 0);
  EXPECT_FALSE(page.frameSurfProb.Visible());
}

INSTANTIATE_TEST_SUITE_P(OfEachStep, NetworkCheck,
                         testing::Combine(testing::Values(1, 2, 3, 4), testing::ValuesIn(kManners)),
                         [](const auto& run) {
                           return "Step_" + std::to_string(std::get<0>(run.param)) + "_" +
                                  std::get<1>(run.param).name;
                         });

/// Name servers, which the first, third and fourth check need.
using NameService = SurfTest;

TEST_F(NameService, The_first_step_needs_the_name_and_the_second_the_address_alone) {
  AllServersAnswer();
  machine.sockets.FailName(webName, 11001);

  OpenPage();

  EXPECT_EQ(Icon(1), kCross);
  EXPECT_EQ(Detail(1), u"11001 - Host not found.");
  EXPECT_EQ(Icon(2), kTick);
}

TEST_F(NameService, A_name_that_nobody_answers_for_is_told_with_its_number) {
  AllServersAnswer();
  machine.sockets.FailName(webName, 11002);

  OpenPage();

  EXPECT_EQ(Detail(1), u"11002 - Nonauthoritative host not found.");
  EXPECT_EQ(Icon(1), kCross);
}

TEST_F(NameService, A_look_up_that_never_ends_holds_the_first_step_until_the_page_is_left) {
  machine.sockets.NeverAnswer(webName);
  OpenPage();

  desktop.Advance(24 * 3'600'000);

  EXPECT_EQ(RowCount(), 1);
  EXPECT_EQ(machine.sockets.LookUpsUnderWay(), 1);
  desktop.Click(page.surf_lblBack);
  EXPECT_EQ(machine.sockets.LookUpsUnderWay(), 0);
  EXPECT_FALSE(page.frameSurfProb.Visible());
}

TEST_F(NameService, That_cannot_even_be_asked_fails_the_first_check_at_once) {
  AllServersAnswer();
  machine.sockets.Fail("WSAAsyncGetHostByName", 10050);

  OpenPage();

  EXPECT_EQ(Detail(1), u"10050 - Network is down.");
  EXPECT_EQ(Icons(2), (std::vector<int>{kCross, kTick}));
  EXPECT_EQ(CaptionOf(10), u"הסתיים");
}

TEST_F(NameService, Without_any_socket_left_each_network_check_fails_at_once_and_the_local_ones_run) {
  AllServersAnswer();
  machine.sockets.Fail("socket", 10024, 4);

  OpenPage();

  for (int row = 1; row <= 4; ++row) EXPECT_EQ(Detail(row), u"10024 - Too many open files.") << row;
  EXPECT_EQ(Icons(5), (std::vector<int>{kCross, kCross, kCross, kCross, kTick}));
  EXPECT_EQ(checks.FailCount(), 4);
  EXPECT_EQ(RowCount(), 10);
  EXPECT_TRUE(desktop.Boxes.empty());
}

} // namespace
} // namespace quendra::diagnostics
