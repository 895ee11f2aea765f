#include "platform/linux/network_manager/NetworkManagerBus.h"

#include "platform/linux/remote_access/ScriptedManagerFixture.h"
#include "platform/linux/system/Descriptor.h"

#include <chrono>

namespace quendra::platform::linux_ {

namespace {

using Changes = DialLoop::Changes;

struct NetworkManagerBusTest : ScriptedManagerTest {
  /// Another client of the bus sends a signal to each of them by name, where no rule of theirs is asked.
  static void Forge(const std::string& signal) {
    ASSERT_TRUE(RunShell("for name in $(dbus-send --system --print-reply --dest=org.freedesktop.DBus / "
                         "org.freedesktop.DBus.ListNames | grep -o ':1[.][0-9]*'); do "
                         "dbus-send --system --type=signal --dest=$name " +
                         signal + " || exit 1; done"));
  }
  /// The dial goes on as if nothing had come.
  void GoesOn() {
    Play("device 50 0");
    EXPECT_TRUE(Comes(kRasConnectDevice, 0));
    EXPECT_EQ(loop.changes, (Changes{{kRasOpenPort, 0}, {kRasPortOpened, 0}, {kRasConnectDevice, 0}}));
  }
  void BeginDialOf(const char* name) {
    BeginDial(name);
    Play("device 40 0");
    ASSERT_TRUE(Comes(kRasPortOpened, 0));
  }
};

/// A bus that takes clients and says nothing to them.
class SilentBus {
 public:
  SilentBus() {
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    (folder_ / "bus").copy(address.sun_path, sizeof address.sun_path - 1);
    EXPECT_EQ(::bind(socket_.Number(), reinterpret_cast<const sockaddr*>(&address), sizeof address), 0);
    EXPECT_EQ(::listen(socket_.Number(), 100), 0);
    environment_.Set("DBUS_SYSTEM_BUS_ADDRESS", "unix:path=" + (folder_ / "bus"));
  }

 private:
  TemporaryFolder folder_;
  Environment environment_;
  Descriptor socket_{::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0)};
};

} // namespace

TEST_F(NetworkManagerBusTest, A_state_that_another_client_tells_is_none) {
  BeginDialOf("097");
  Forge("/org/freedesktop/NetworkManager/ActiveConnection/3 "
        "org.freedesktop.NetworkManager.Connection.Active.StateChanged uint32:2 uint32:1");
  GoesOn();
}

TEST_F(NetworkManagerBusTest, That_the_manager_has_gone_is_believed_of_the_bus_alone) {
  BeginDialOf("097");
  Forge("/org/freedesktop/DBus org.freedesktop.DBus.NameOwnerChanged "
        "string:org.freedesktop.NetworkManager string::1.1 string:");
  GoesOn();
}

TEST_F(NetworkManagerBusTest, A_manager_that_is_started_anew_is_heard) {
  BeginDialOf("097");
  manager->End();
  ASSERT_TRUE(Comes(kRasPortOpened, kRasManagerCannotStart));
  StartManager();
  ASSERT_EQ(Put("097", EntryFor("pppoe")), 0U);
  BeginDialOf("097");
  GoesOn();
}

TEST_F(NetworkManagerBusTest, A_manager_is_heard_on_a_new_way_to_it) {
  BeginDialOf("097");
  BreakConnections();
  ASSERT_TRUE(Comes(kRasPortOpened, kRasManagerCannotStart));
  BeginDialOf("097");
  GoesOn();
}

TEST(NetworkManagerBus, A_silent_bus_holds_many_questions_up_as_long_as_one) {
  const SilentBus silent;
  forms::headless::PolledDesktop loop;
  NetworkManagerBus bus(loop, loop);
  const auto start = std::chrono::steady_clock::now();
  const auto answers = bus.AskAll(std::vector<BusQuestion>(6, {"/", "org.quendra.Script", "Play"}));
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(3));
  ASSERT_EQ(answers.size(), 6U);
  for (const BusAnswer& answer : answers) EXPECT_EQ(answer.kind, BusAnswer::Kind::NobodyThere);
}

} // namespace quendra::platform::linux_
