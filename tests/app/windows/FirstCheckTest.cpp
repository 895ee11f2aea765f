#include "app/Program.h"
#include "forms/win32/Win32Driver.h"
#include "platform/windows/WindowsMachine.h"

#include <gtest/gtest.h>

// Checks of ports as the first thing that a program does with sockets.

namespace quendra::app::windows {
namespace {

TEST(FirstCheck, Of_ports_tells_what_the_network_says_and_not_that_it_is_not_ready) {
  forms::win32::Win32Driver user;
  platform::windows::WindowsMachine machine(user.Win32());
  Program program(machine.Operations(), user.Win32());
  diagnostics::frmPortsChecks& checks = program.frmPortsChecks;
  user.Win32().Show(checks);

  user.Click(checks.Command1);

  const auto answered = [](const forms::Label& result) { return !result.Caption().empty(); };
  EXPECT_TRUE(user.WaitUntil(
      [&] { return answered(checks.Label3) && answered(checks.Label4) && answered(checks.Label6); }));
  EXPECT_EQ(forms::win32::BoxAnswers::Standing(), nullptr);
  for (const forms::Label* result : {&checks.Label3, &checks.Label4, &checks.Label6}) {
    const std::string told = ToUtf8(result->Caption());
    EXPECT_TRUE(told.starts_with("OK!") || told.starts_with("ERROR: 10061")) << told;
  }
}

} // namespace
} // namespace quendra::app::windows
