#pragma once

#include "platform/linux/remote_access/RasFixture.h"
#include "platform/linux/system/Files.h"

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
    return {"/bin/sh", "-c",
            "while ! grep -q ActivateConnection " + (bus.folder / "asked") + "; do sleep 0.05; done; " +
                command};
  }
  void SpeakPpp() { std::filesystem::create_directory(kernel / "ppp"); }
  void Settle() {
    loop.WaitFor([] { return false; }, 50);
  }

  PrivateBus bus;
  std::unique_ptr<Child> manager;
};

} // namespace quendra::platform::linux_
