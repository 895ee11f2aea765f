#pragma once

#include "platform/linux/remote_access/RasFixture.h"
#include "platform/linux/system/Files.h"

#include <sys/socket.h>
#include <sys/un.h>

#include <filesystem>

namespace quendra::platform::linux_ {

/// Remote access through a NetworkManager that does what the test says.
struct ScriptedManagerTest : RasTest {
  void SetUp() override {
    ASSERT_TRUE(bus.Start());
    StartManager();
    ASSERT_EQ(Put("097", EntryFor("pppoe")), 0U);
    ASSERT_EQ(Put("tunnel", EntryFor("vpn")), 0U);
  }

  void StartManager() {
    manager.reset();
    bus.folder.Write("asked", "");
    manager = std::make_unique<Child>(std::vector<std::string>{"/bin/sh", "-c",
                                                               "exec /usr/bin/python3 " QUENDRA_SOURCE_DIR
                                                               "/tests/standins/network_manager.py " +
                                                                   (bus.folder / "asked")});
    ASSERT_TRUE(loop.WaitFor([&] { return Asked().starts_with("ready\n"); }, 20'000));
  }
  std::string Asked() { return ReadFile(bus.folder / "asked", 100'000).value_or(""); }
  bool WasAsked(const std::string& line) {
    return loop.WaitFor([&] { return Asked().find(line + "\n") != std::string::npos; }, 20'000);
  }
  static std::string PlayCommand(const std::string& steps) {
    return "dbus-send --system --print-reply --dest=org.freedesktop.NetworkManager /script "
           "org.quendra.Script.Play string:'" +
           steps + "' >/dev/null 2>&1";
  }
  static void Play(const std::string& steps) { ASSERT_TRUE(RunShell(PlayCommand(steps))); }
  /// Dials, and waits until the manager is at it.
  void BeginDial(const char* name) {
    loop.changes.clear();
    ASSERT_EQ(Dial(name), 0U);
    ASSERT_TRUE(WasAsked("ActivateConnection " + std::string(name)));
  }
  /// A process that does that once the manager is at a dial.
  std::vector<std::string> OnceItDials(const std::string& command) {
    return Once("ActivateConnection", command);
  }
  /// The same once the manager has written that.
  std::vector<std::string> Once(const std::string& written, const std::string& command) {
    return {"/bin/sh", "-c",
            "while ! grep -q '" + written + "' " + (bus.folder / "asked") + "; do sleep 0.05; done; " +
                command};
  }
  /// How often the manager has written that line.
  std::size_t CountAsked(const std::string& line) {
    return static_cast<std::size_t>(std::ranges::count(Split(Asked(), '\n'), line));
  }
  void SpeakPpp() { std::filesystem::create_directory(kernel / "ppp"); }
  void Settle() {
    loop.WaitFor([] { return false; }, 50);
  }

  /// Ends this program's connections to the bus, as the bus does with a client that it can't bear.
  void BreakConnections() {
    for (int number = 3; number < 1024; ++number) {
      sockaddr_un address{};
      socklen_t size = sizeof address - 1;
      if (::getpeername(number, reinterpret_cast<sockaddr*>(&address), &size) == 0 &&
          address.sun_path == bus.folder / "bus")
        ::shutdown(number, SHUT_RDWR);
    }
  }

  PrivateBus bus;
  std::unique_ptr<Child> manager;
};

} // namespace quendra::platform::linux_
