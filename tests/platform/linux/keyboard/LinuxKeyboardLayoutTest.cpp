#include "platform/linux/keyboard/LinuxKeyboardLayout.h"

#include "platform/linux/keyboard/XcbLibrary.h"
#include "platform/linux/system/Descriptor.h"
#include "platform/linux/system/SessionFixture.h"

#include <fcntl.h>
#include <poll.h>
#include <signal.h>
#include <sys/wait.h>

#include <cstdlib>
#include <stdexcept>

namespace quendra::platform::linux_ {
namespace {

/// An X display that nobody sees, gone with the object.
class HiddenDisplay {
 public:
  HiddenDisplay() {
    int ends[2];
    if (::pipe(ends) != 0) throw std::runtime_error("no pipe");
    id_ = ::fork();
    if (id_ == 0) Become(ends[1]);
    ::close(ends[1]);
    const Descriptor reading(ends[0]);
    pollfd ready{reading.Number(), POLLIN, 0};
    char number[16] = {};
    if (::poll(&ready, 1, 20'000) <= 0 || ::read(reading.Number(), number, sizeof number - 1) <= 0)
      throw std::runtime_error("the display doesn't start");
    name_ = ":" + std::to_string(std::atoi(number));
  }
  ~HiddenDisplay() {
    ::kill(id_, SIGTERM);
    ::waitpid(id_, nullptr, 0);
  }
  HiddenDisplay(const HiddenDisplay&) = delete;

  const std::string& Name() const { return name_; }
  /// Runs a program of that display; true for status 0.
  bool Run(const std::string& command) const {
    return RunShell("PATH=/usr/bin:/bin DISPLAY=" + name_ + " " + command);
  }

 private:
  [[noreturn]] static void Become(int report) {
    ::alarm(60);
    const int nothing = ::open("/dev/null", O_WRONLY | O_CLOEXEC);
    ::dup2(nothing, STDERR_FILENO);
    const std::string number = std::to_string(report);
    // Compiles keymaps with a program that it looks for.
    ::setenv("PATH", "/usr/bin:/bin", 1);
    // Its keymap stays when the program that set it has gone.
    ::execl("/usr/bin/Xvfb", "Xvfb", "-displayfd", number.c_str(), "-screen", "0", "320x200x8", "-nolisten",
            "tcp", "-noreset", nullptr);
    ::_exit(127);
  }

  pid_t id_ = -1;
  std::string name_;
};

/// Makes another of the display's layouts the active one, as a desktop's switch does.
bool Switch(std::uint8_t group) {
  using Request = XcbLibrary::Request;
  const XcbLibrary library;
  const SharedLibrary client("libxcb.so.1"), keyboard("libxcb-xkb.so.1");
  Request (*lock)(void*, std::uint16_t, std::uint8_t, std::uint8_t, std::uint8_t, std::uint8_t, std::uint8_t,
                  std::uint8_t, std::uint16_t) = nullptr;
  void* (*check)(void*, Request) = nullptr;
  if (!library.isThere || !keyboard.Find("xcb_xkb_latch_lock_state_checked", lock) ||
      !client.Find("xcb_request_check", check))
    return false;
  const std::unique_ptr<void, void (*)(void*)> display(library.connect(nullptr, nullptr), library.disconnect);
  std::free(library.xkb_use_extension_reply(display.get(), library.xkb_use_extension(display.get(), 1, 0),
                                            nullptr));
  return check(display.get(), lock(display.get(), 0x100, 0, 0, 1, group, 0, 0, 0)) == nullptr;
}

struct LinuxKeyboardLayoutTest : SessionTest {
  LinuxKeyboardLayout keyboard;
  std::optional<std::string> Name() { return keyboard.GetKeyboardLayoutNameA(); }
};

TEST_F(LinuxKeyboardLayoutTest, A_display_tells_the_layout_that_is_active_now) {
  const HiddenDisplay display;
  environment.Set("DISPLAY", display.Name());
  ASSERT_TRUE(display.Run("setxkbmap -layout us,il"));
  EXPECT_EQ(Name(), "00000409");

  ASSERT_TRUE(Switch(1));
  EXPECT_EQ(Name(), "0000040D");

  ASSERT_TRUE(Switch(0));
  EXPECT_EQ(Name(), "00000409");
}

TEST_F(LinuxKeyboardLayoutTest, Each_of_four_layouts_of_a_display_is_told) {
  const HiddenDisplay display;
  environment.Set("DISPLAY", display.Name());
  ASSERT_TRUE(display.Run("setxkbmap -layout ru,ara,gb,il"));
  std::uint8_t group = 0;
  for (const char* name : {"00000419", "00000401", "00000809", "0000040D"}) {
    ASSERT_TRUE(Switch(group++));
    EXPECT_EQ(Name(), name);
  }
}

TEST_F(LinuxKeyboardLayoutTest, A_layout_that_has_no_published_number_is_not_told) {
  const HiddenDisplay display;
  environment.Set("DISPLAY", display.Name());
  ASSERT_TRUE(display.Run("setxkbmap -layout il -variant phonetic"));
  EXPECT_FALSE(Name());
}

TEST_F(LinuxKeyboardLayoutTest, Without_a_display_no_layout_is_told) {
  EXPECT_FALSE(Name());
  environment.Set("DISPLAY", ":65000");
  EXPECT_FALSE(Name());
  environment.Set("DISPLAY", "no display");
  EXPECT_FALSE(Name());
}

TEST_F(LinuxKeyboardLayoutTest, A_session_with_a_service_for_layouts_is_told_by_it) {
  environment.Set("XDG_SESSION_TYPE", "wayland");
  environment.Set("XDG_CURRENT_DESKTOP", "KDE");
  StartBus();
  StartService("keyboard 1 us il");
  EXPECT_EQ(Name(), "0000040D");
}

TEST_F(LinuxKeyboardLayoutTest, A_service_that_names_a_layout_that_it_does_not_list_tells_nothing) {
  environment.Set("XDG_SESSION_TYPE", "wayland");
  StartBus();
  StartService("keyboard 2 us il");
  EXPECT_FALSE(Name());
}

TEST_F(LinuxKeyboardLayoutTest, A_session_whose_windows_are_not_the_displays_does_not_ask_the_display) {
  const HiddenDisplay display;
  environment.Set("DISPLAY", display.Name());
  ASSERT_TRUE(display.Run("setxkbmap -layout il"));
  EXPECT_EQ(Name(), "0000040D");
  environment.Set("XDG_SESSION_TYPE", "wayland");
  EXPECT_FALSE(Name());
  // There the toolkit shows its windows on the display.
  environment.Set("XDG_CURRENT_DESKTOP", "ubuntu:GNOME");
  EXPECT_EQ(Name(), "0000040D");
}

} // namespace
} // namespace quendra::platform::linux_
