#include "diagnostics/mdlTracert.h"
#include "forms/Form.h"
#include "forms/controls/CommandButton.h"
#include "forms/controls/TextBox.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "integration/RouterChain.h"
#include "platform/linux/LinuxMachine.h"

#include <gtest/gtest.h>

#include <atomic>
#include <cstdio>
#include <memory>
#include <random>
#include <regex>

namespace quendra::integration {

namespace {

using Clock = std::chrono::steady_clock;

struct PanelForm : forms::Form {
  PanelForm() : Form(u"frmPanel") {}
  void Design() override {}
  forms::CommandButton start{*this, u"frmSurf_cmdStart"};
  forms::TextBox result{*this, u"frmSurf_txtPingResult"};
};

struct Hop {
  int number = 0;
  std::string address;
  friend bool operator==(const Hop&, const Hop&) = default;
};
void PrintTo(const Hop& hop, std::ostream* stream) { *stream << hop.number << " " << hop.address; }

/// What the system's own tool finds, one probe at a time.
struct SystemTrace {
  std::vector<Hop> hops;
  Clock::duration took{};
};
SystemTrace RunTraceroute(const std::string& target) {
  SystemTrace trace;
  const auto start = Clock::now();
  const std::string command = "traceroute -I -n -q 1 -N 1 " + target;
  FILE* output = popen(command.c_str(), "r");
  char line[256];
  while (output != nullptr && std::fgets(line, sizeof line, output) != nullptr) {
    int number = 0;
    char address[64];
    if (std::sscanf(line, " %d %63[0-9.]", &number, address) == 2) trace.hops.push_back({number, address});
  }
  if (output == nullptr || pclose(output) != 0) throw std::runtime_error("traceroute failed");
  trace.took = Clock::now() - start;
  return trace;
}

double Milliseconds(Clock::duration duration) {
  return std::chrono::duration<double, std::milli>(duration).count();
}

/// The trace of the page over real echoes, through routers of the test's own.
class TraceRoute : public testing::Test {
 protected:
  void SetUp() override {
    if (!NetworkNamespace::Possible()) GTEST_SKIP() << NetworkNamespace::kSkipReason;
  }

  /// Gives the report.
  std::string Trace(const std::string& host) {
    forms::headless::PolledDesktop desktop;
    platform::linux_::LinuxMachine machine(desktop, desktop);
    const auto operations = machine.Operations();
    PanelForm form;
    diagnostics::mdlTracert tracert({operations.sockets, operations.hostNames, operations.icmp}, desktop,
                                    form.start);
    const auto start = Clock::now();
    tracert.Trace(FromUtf8(host), form.result);
    took = Clock::now() - start;
    return ToUtf8(form.result.Value());
  }

  /// The hops of a report, with their times.
  std::vector<Hop> HopsOf(const std::string& report) {
    std::vector<Hop> hops;
    times.clear();
    const std::regex line("Hop #\t(\\d+)\t([^\t]+)\t([^\r]+)\r\n");
    for (std::sregex_iterator found(report.begin(), report.end(), line), end; found != end; ++found) {
      hops.push_back({std::stoi((*found)[1]), (*found)[3]});
      times.push_back((*found)[2]);
    }
    return hops;
  }
  static bool Ends(const std::string& report, const std::string& with) {
    return report.ends_with("\r\n\r\n" + with);
  }
  /// What the report must list: routers from the second on, then the target.
  std::vector<Hop> Expected(int routers) {
    std::vector<Hop> hops;
    for (int router = 2; router <= routers; ++router)
      hops.push_back({router - 1, chain->RouterAddress(router)});
    hops.push_back({routers, chain->TargetAddress()});
    return hops;
  }

  /// Both in turn, three times: the same hops, and as fast but for a third.
  void CompareWithTraceroute() {
    auto ours = Clock::duration::max();
    auto theirs = Clock::duration::max();
    for (int round = 0; round < 3; ++round) {
      SystemTrace reference = RunTraceroute(chain->TargetAddress());
      const std::string report = Trace(chain->TargetAddress());
      ASSERT_EQ(reference.hops.size(), 13u);
      reference.hops.erase(reference.hops.begin());
      for (Hop& hop : reference.hops) --hop.number;
      EXPECT_EQ(HopsOf(report), reference.hops);
      EXPECT_EQ(HopsOf(report), Expected(12));
      EXPECT_TRUE(Ends(report, "Trace Route Complete")) << report;
      ours = std::min(ours, took);
      theirs = std::min(theirs, reference.took);
    }
    std::printf("12 routers: %.1f ms, traceroute one probe at a time %.1f ms\n", Milliseconds(ours),
                Milliseconds(theirs));
    EXPECT_LE(Milliseconds(ours), 1.3 * Milliseconds(theirs));
  }

  std::unique_ptr<RouterChain> chain;
  std::vector<std::string> times;
  Clock::duration took{};
};

std::uint8_t TtlOf(const Bytes& packet) { return packet[8]; }

} // namespace

TEST_F(TraceRoute, Through_twelve_routers_it_finds_what_traceroute_finds_from_the_second_hop_on_and_as_fast) {
  chain = std::make_unique<RouterChain>(12);
  CompareWithTraceroute();
}

TEST_F(TraceRoute, Over_a_link_of_five_milliseconds_too) {
  chain = std::make_unique<RouterChain>(12, [](const Bytes&) { return SlowLink::Passing{5}; });
  CompareWithTraceroute();
}

TEST_F(TraceRoute, Its_times_are_those_of_the_link) {
  chain = std::make_unique<RouterChain>(3, [](const Bytes& packet) -> SlowLink::Passing {
    const int delays[] = {0, 0, 5, 15, 1300};
    return {TtlOf(packet) < 5 ? delays[TtlOf(packet)] : 0};
  });
  const std::string report = Trace(chain->TargetAddress());
  EXPECT_EQ(HopsOf(report), Expected(3));
  ASSERT_EQ(times.size(), 3u);
  EXPECT_EQ(times[0], "<10 ms");
  EXPECT_GE(std::stoi(times[1]), 15);
  EXPECT_LT(std::stoi(times[1]), 100);
  EXPECT_EQ(times[2], ">1200 ms");
}

TEST_F(TraceRoute, With_three_of_ten_echoes_lost_it_lists_every_hop_once) {
  std::atomic<int> lost = 0;
  std::mt19937 random(3);
  chain = std::make_unique<RouterChain>(6, [&](const Bytes&) -> SlowLink::Passing {
    if (random() % 10 >= 3) return {};
    ++lost;
    return {std::nullopt};
  });
  const std::string report = Trace(chain->TargetAddress());
  EXPECT_EQ(HopsOf(report), Expected(6));
  EXPECT_TRUE(Ends(report, "Trace Route Complete")) << report;
  EXPECT_GT(lost, 0);
  EXPECT_GE(took, lost.load() * std::chrono::milliseconds(2400));
}

TEST_F(TraceRoute, Forged_answers_on_the_link_change_nothing) {
  chain = std::make_unique<RouterChain>(2, [](const Bytes& packet) -> SlowLink::Passing {
    // Replies of the target that differ from a true one in the id, the sequence, a byte or the length.
    Bytes reply = packet;
    std::swap_ranges(reply.begin() + 12, reply.begin() + 16, reply.begin() + 16);
    reply[20] = 0;
    SlowLink::Passing passing{10};
    for (const std::size_t place : {24u, 26u, 30u}) {
      passing.forged.push_back(reply);
      passing.forged.back()[place] ^= 1;
    }
    passing.forged.push_back(Bytes(reply.begin(), reply.end() - 1));
    passing.forged.push_back(Bytes(reply.begin(), reply.begin() + 24));
    return passing;
  });
  const std::string report = Trace(chain->TargetAddress());
  EXPECT_EQ(HopsOf(report), Expected(2));
  EXPECT_TRUE(Ends(report, "Trace Route Complete")) << report;
}

TEST_F(TraceRoute, A_silent_router_in_the_middle_ends_it_after_ten_tries) {
  std::atomic<int> tries = 0;
  chain = std::make_unique<RouterChain>(4, [&](const Bytes& packet) -> SlowLink::Passing {
    tries += TtlOf(packet) == 3;
    return {};
  });
  chain->Silence(3);
  const std::string report = Trace(chain->TargetAddress());
  EXPECT_EQ(HopsOf(report), (std::vector<Hop>{{1, chain->RouterAddress(2)}}));
  EXPECT_TRUE(Ends(report, "Request timed out!!!")) << report;
  EXPECT_EQ(tries, 10);
  EXPECT_GE(took, std::chrono::seconds(24));
  EXPECT_LT(took, std::chrono::seconds(30));
}

TEST_F(TraceRoute, A_target_behind_the_first_router_is_the_only_line) {
  chain = std::make_unique<RouterChain>(1);
  const std::string report = Trace(chain->TargetAddress());
  EXPECT_EQ(HopsOf(report), (std::vector<Hop>{{1, chain->TargetAddress()}}));
  EXPECT_TRUE(Ends(report, "Trace Route Complete")) << report;
}

TEST_F(TraceRoute, A_name_that_nobody_knows_ends_in_the_all_clear) {
  chain = std::make_unique<RouterChain>(1);
  const std::string report = Trace("no-such-host.invalid");
  EXPECT_EQ(report, "Tracing to no-such-host.invalid ()...\r\n\r\nTrace Route Complete");
}

} // namespace quendra::integration
