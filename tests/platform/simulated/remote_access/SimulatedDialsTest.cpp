#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachineFixture.h"

namespace quendra::platform::simulated {
namespace {

/// A window that writes down what a dial tells it, and an entry to dial.
struct SimulatedDialsTest : testing::Test {
  SimulatedDialsTest() { ras.AddEntry("Home").SetLogin("user", "secret"); }

  static Bytes Params(const std::string& entryName) {
    Bytes params(RasDialParams::kBytes);
    PutLittle32(params, 0, RasDialParams::kBytes);
    PutTextAt(params, RasDialParams::kEntryName, RasDialParams::kEntryNameBytes, entryName);
    return params;
  }
  std::uint32_t Dial(WindowHandle target, const std::string& entryName = "Home") {
    return ras.RasDialA({}, nullptr, Params(entryName), {kRasNotifierIsWindow, target}, connection);
  }
  WindowHandle MakeWindow() {
    using Procedure = forms::WindowProcedure::element_type;
    return desktop.Windows.Add(
        std::make_shared<Procedure>([this](auto, auto message, auto state, auto error) {
          if (message == desktop.Windows.RegisterMessage(kRasDialEventName))
            heard.push_back(std::to_string(state) + " " + std::to_string(error));
          if (during) during();
          return 0;
        }));
  }

  forms::headless::HeadlessDesktop desktop;
  SimulatedMachine machine{desktop};
  SimulatedRemoteAccess& ras = machine.ras;
  Lines heard;
  std::function<void()> during;
  const WindowHandle window = MakeWindow();
  RasConnection connection;
};

TEST_F(SimulatedDialsTest, A_dial_tells_its_window_each_step_of_its_script) {
  ras.Dial("Home").Then(0).Then(5).ThenError(691);

  EXPECT_EQ(Dial(window), kRasSuccess);
  EXPECT_EQ(heard, Lines());
  desktop.RunUntilIdle();

  EXPECT_EQ(heard, (Lines{"0 0", "5 0", "5 691"}));
}

TEST_F(SimulatedDialsTest, A_failed_dial_with_a_window_leaves_a_connection_to_be_hung_up) {
  ras.Dial("Home").ThenError(678);
  Dial(window);
  desktop.RunUntilIdle();

  ASSERT_EQ(ras.Connections().size(), 1U);
  EXPECT_EQ(ras.RasHangUpA(connection), kRasSuccess);
  EXPECT_TRUE(ras.Connections().empty());
  EXPECT_EQ(ras.RasHangUpA(connection), kRasSuccess);
}

TEST_F(SimulatedDialsTest, An_entry_without_a_script_connects) {
  Dial(window);
  desktop.RunUntilIdle();

  EXPECT_EQ(heard, Lines{"8192 0"});
  EXPECT_EQ(ras.Connections().front().state, kRasConnected);
}

TEST_F(SimulatedDialsTest, A_dial_without_a_window_returns_its_error_and_leaves_no_connection) {
  ras.Dial("Home").Then(5).ThenError(691);

  EXPECT_EQ(Dial(kNoWindow), 691U);

  EXPECT_EQ(connection, kNoRasConnection);
  EXPECT_TRUE(ras.Connections().empty());
}

TEST_F(SimulatedDialsTest, A_dial_without_a_window_returns_when_it_is_connected) {
  ras.Dial("Home").Then(5).ThenConnected().ThenDisconnected();

  EXPECT_EQ(Dial(kNoWindow), kRasSuccess);

  EXPECT_NE(connection, kNoRasConnection);
  EXPECT_EQ(ras.Connections().front().state, kRasConnected);
}

TEST_F(SimulatedDialsTest, What_happens_in_a_step_comes_before_the_next_one) {
  ras.Dial("Home").Then(5).ThenError(691);
  Dial(window);
  during = [this] { ras.RasHangUpA(connection); };

  desktop.RunUntilIdle();

  EXPECT_EQ(heard, Lines{"5 0"});
}

TEST_F(SimulatedDialsTest, Another_program_may_hang_up_or_delete_the_entry_meanwhile) {
  ras.Dial("Home").Then(5).Meanwhile([this] { ras.Disconnect("Home"); }).ThenConnected();
  Dial(window);
  ras.AddEntry("Other");
  ras.Dial("Other").Meanwhile([this] { ras.RemoveEntry("Other"); }).ThenError(691);
  RasConnection other;
  ras.RasDialA({}, nullptr, Params("Other"), {}, other);

  desktop.RunUntilIdle();

  EXPECT_EQ(heard, Lines{"5 0"});
  EXPECT_EQ(ras.EntryNames(), Lines{"Home"});
}

TEST_F(SimulatedDialsTest, A_dial_that_rests_goes_on_when_the_test_says_so) {
  ras.Dial("Home").Then(2);
  Dial(window);
  desktop.RunUntilIdle();

  ras.GoOn("Home", DialScript().ThenError(678));
  desktop.RunUntilIdle();

  EXPECT_EQ(heard, (Lines{"2 0", "0 678"}));
}

TEST_F(SimulatedDialsTest, Where_no_message_can_be_registered_the_fixed_number_is_posted) {
  desktop.FailRegisterWindowMessage = true;
  std::uint32_t told = 0;
  using Procedure = forms::WindowProcedure::element_type;
  desktop.Windows.Replace(window, std::make_shared<Procedure>([&](auto, auto message, auto...) {
                            told = message;
                            return 0;
                          }));

  Dial(window);
  desktop.RunUntilIdle();

  EXPECT_EQ(told, kRasDialEvent);
}

TEST_F(SimulatedDialsTest, A_refused_dial_makes_no_connection) {
  ras.Refuse("RasDialA", kRasPortNotAvailable);

  EXPECT_EQ(Dial(window), kRasPortNotAvailable);

  EXPECT_TRUE(ras.Connections().empty());
  ras.Allow("RasDialA");
  EXPECT_EQ(Dial(window, "Nobody"), kRasCannotFindPhonebookEntry);
}

TEST_F(SimulatedDialsTest, What_was_dialled_can_be_looked_at) {
  Dial(window);

  ASSERT_EQ(ras.Dials.size(), 1U);
  EXPECT_EQ(ras.Dials[0].params, Params("Home"));
  EXPECT_EQ(ras.Dials[0].notifier.window, window);
  EXPECT_EQ(machine.Calls, Lines{"RasDialA Home"});
  EXPECT_EQ(ras.PhoneBookOf["RasDialA"], std::nullopt);
}

TEST_F(SimulatedDialsTest, A_machine_that_has_gone_tells_nothing_more) {
  auto gone = std::make_unique<SimulatedMachine>(desktop);
  gone->ras.AddEntry("Home");
  gone->ras.RasDialA({}, nullptr, Params("Home"), {kRasNotifierIsWindow, window}, connection);

  gone.reset();
  desktop.RunUntilIdle();

  EXPECT_EQ(heard, Lines());
}

struct DialsWithoutLoop : SimulatedMachineTest {};

TEST_F(DialsWithoutLoop, Are_taken_step_by_step) {
  machine.ras.AddEntry("Home");
  machine.ras.Dial("Home").Then(5).ThenError(691);
  RasConnection connection;
  machine.ras.RasDialA({}, nullptr, SimulatedDialsTest::Params("Home"),
                       {kRasNotifierIsWindow, WindowHandle(7)}, connection);

  EXPECT_EQ(machine.ras.Step()->state, 5U);
  const auto last = machine.ras.Step();

  ASSERT_TRUE(last);
  EXPECT_EQ(last->window, WindowHandle(7));
  EXPECT_EQ(last->message, kRasDialEvent);
  EXPECT_EQ(last->error, 691U);
  EXPECT_FALSE(machine.ras.Step());
}

} // namespace
} // namespace quendra::platform::simulated
