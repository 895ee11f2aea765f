#include "app/Program.h"
#include "app/windows/Resources.h"
#include "forms/win32/Win32Driver.h"
#include "platform/windows/WindowsMachine.h"

#include <gtest/gtest.h>

#include <iostream>

// The whole program with its forms on the screen, over this machine, for as long as a day of use.

namespace quendra::app::windows {
namespace {

constexpr int kRounds = 1000;
/// Until everything that is made once has been made.
constexpr int kRoundsBefore = 12;

/// Of what is left over after all rounds together.
constexpr int kMostIcons = 8; // other programs take numbers, too
constexpr int kMostObjects = 20;
constexpr int kMostKilobytes = 300; // the heap itself keeps rooms for later, more and more of them at first

class Leaks : public testing::Test {
 protected:
  Leaks() {
    desktop().Show(program.frmMenu);
    user.WaitUntil([&] { return user.Stands(program.frmMenu); });
  }

  forms::win32::Win32Desktop& desktop() { return user.Win32(); }
  /// A click on an entry of the menu, painted at once. The checks of the surf page don't get on: they would
  /// take long.
  void GoTo(std::size_t page) {
    user.Click(program.frmMenu.lblCaption[page]);
    const HWND window = forms::win32::Win32Driver::WindowOf(program.frmMenu)->Top();
    ::RedrawWindow(window, nullptr, nullptr, RDW_UPDATENOW | RDW_ALLCHILDREN);
    if (page != shell::kSurfPage) desktop().PumpOnce();
  }
  /// A pass of the table a second after the last one.
  void Pass() {
    program.processTable.LastRefreshTick = static_cast<std::int32_t>(::GetTickCount() - 1000);
    program.processTable.RefreshProcessTable({});
    desktop().PumpOnce();
  }

  /// What is held afterwards and was not before.
  static Resources LeftBy(const std::function<void(int)>& round, int rounds = kRounds) {
    for (int i = 0; i < kRoundsBefore; ++i) round(i);
    const Resources before = Resources::Now();
    for (int i = 0; i < rounds; ++i) round(i);
    const Resources after = Resources::Now();
    std::cout << "before: " << before << "\nafter:  " << after << "\n";
    return {after.drawing - before.drawing, after.windows - before.windows, after.handles - before.handles,
            after.objects - before.objects, after.kilobytes - before.kilobytes};
  }
  static void ExpectNothing(const Resources& left) {
    EXPECT_LE(left.drawing, 0);
    EXPECT_LE(left.windows, kMostIcons);
    EXPECT_LE(left.handles, 0);
    EXPECT_LE(left.objects, kMostObjects);
    EXPECT_LE(left.kilobytes, kMostKilobytes);
  }

  forms::win32::Win32Driver user;
  platform::windows::WindowsMachine machine{desktop()};
  Program program{machine.Operations(), desktop()};
};

TEST_F(Leaks, A_thousand_passes_of_the_table_leave_nothing_behind) {
  GoTo(shell::kMonitorPage);
  ExpectNothing(LeftBy([&](int) { Pass(); }));
}

TEST_F(Leaks, A_thousand_changes_of_the_page_leave_nothing_behind) {
  ExpectNothing(LeftBy([&](int round) {
    // Leaving the monitor page takes a third of a second, in which the capture ends.
    constexpr int kLeavings = 20;
    const bool monitor = round % kLeavings == 0;
    GoTo(monitor ? shell::kMonitorPage : round % 2 ? shell::kSurfPage : shell::kFirstConnectionPage);
  }));
}

TEST_F(Leaks, A_leak_of_each_kind_is_seen) {
  const Resources left = LeftBy([](int) {
    const BYTE bits[128] = {};
    ::CreateSolidBrush(RGB(1, 2, 3));
    ::CreateIcon(nullptr, 16, 16, 1, 1, bits, bits);
    ::CreateEventW(nullptr, FALSE, FALSE, nullptr);
    ::HeapAlloc(::GetProcessHeap(), 0, 512);
    static_cast<void>(new Text(u"left behind"));
  });
  EXPECT_GE(left.drawing, kRounds);
  EXPECT_GE(left.windows, kRounds - kMostIcons);
  EXPECT_GE(left.handles, kRounds);
  EXPECT_GE(left.objects, kRounds);
  EXPECT_GT(left.kilobytes, kMostKilobytes);
}

} // namespace
} // namespace quendra::app::windows
