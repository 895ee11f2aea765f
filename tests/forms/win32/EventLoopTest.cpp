#include "forms/win32/Win32Fixture.h"
#include "forms/win32/WorkerFixture.h"

namespace quendra::forms::win32 {

class EventLoop : public Win32Fixture {};

TEST_F(EventLoop, Work_posted_by_another_thread_runs_on_the_loops_thread) {
  DWORD ranOn = 0;
  {
    const Worker worker([&] { desktop.Post([&] { ranOn = ::GetCurrentThreadId(); }); });
  }

  desktop.DoEvents();

  EXPECT_EQ(ranOn, ::GetCurrentThreadId());
}

TEST_F(EventLoop, Posts_of_many_threads_all_run) {
  int runs = 0;
  {
    std::vector<std::unique_ptr<Worker>> workers;
    for (int i = 0; i < 4; ++i)
      workers.push_back(std::make_unique<Worker>([&] {
        for (int k = 0; k < 5000; ++k) desktop.Post([&] { ++runs; });
      }));
  }

  desktop.PumpOnce();

  EXPECT_EQ(runs, 20000);
}

TEST_F(EventLoop, Work_of_another_thread_wakes_a_loop_that_waits) {
  std::unique_ptr<Worker> worker;

  const int status = user.Run([&] {
    worker = std::make_unique<Worker>([&] {
      ::Sleep(50); // so that the loop waits
      desktop.Post([&] { desktop.End(7); });
    });
  });

  EXPECT_EQ(status, 7);
}

TEST_F(EventLoop, Work_that_posts_itself_again_leaves_timers_their_turn) {
  int ticks = 0;
  std::function<void()> again = [&] { desktop.Post(again); };
  desktop.Post(again);
  const auto timer = desktop.StartTimer(1, [&] { ++ticks; });

  EXPECT_TRUE(user.WaitUntil([&] { return ticks >= 2; }));
}

TEST_F(EventLoop, Work_goes_on_in_a_loop_of_the_systems) {
  bool ran = false;
  desktop.Post([&] { ran = true; });

  // As the system's loops for menus and for moving a window do.
  const DWORD start = ::GetTickCount();
  for (MSG message; !ran && ::GetTickCount() - start < 2000;)
    if (::PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE)) ::DispatchMessageW(&message);

  EXPECT_TRUE(ran);
}

TEST_F(EventLoop, A_yield_with_nothing_to_do_looks_no_oftener_than_the_systems_ticks) {
  constexpr int kYields = 1'000'000;
  const DWORD start = ::GetTickCount();

  for (int i = 0; i < kYields; ++i) desktop.DoEvents();

  // A look each time would take seconds.
  EXPECT_LT(::GetTickCount() - start, 500U);
}

TEST_F(EventLoop, A_yield_goes_on_with_what_an_earlier_one_has_left) {
  MSG left;
  for (int i = 0; i < 800; ++i) ::PostThreadMessageW(::GetCurrentThreadId(), WM_APP + 1, 0, 0);

  desktop.PumpOnce();
  desktop.DoEvents();

  EXPECT_FALSE(::PeekMessageW(&left, nullptr, WM_APP + 1, WM_APP + 1, PM_REMOVE));
}

TEST_F(EventLoop, The_end_closes_a_menu_that_is_open) {
  const HMENU menu = ::CreatePopupMenu();
  ::AppendMenuW(menu, MF_STRING, 1, L"entry");
  bool closedByGuard = false;
  std::unique_ptr<Worker> guard;
  bool open = true;

  const int status = user.Run([&] {
    desktop.Show(form);
    const HWND window = WindowOf(form).Top();
    guard = std::make_unique<Worker>([&, window] {
      for (int i = 0; i < 300 && open; ++i) ::Sleep(10);
      closedByGuard = open;
      if (open) ::SendMessageW(window, WM_CANCELMODE, 0, 0);
    });
    const auto ends = desktop.StartTimer(50, [&] { desktop.End(9); });
    ::TrackPopupMenu(menu, 0, 100, 100, 0, window, nullptr);
    open = false;
  });

  guard.reset();
  ::DestroyMenu(menu);
  EXPECT_EQ(status, 9);
  EXPECT_FALSE(closedByGuard);
}

TEST_F(EventLoop, A_message_by_its_name_has_the_systems_number) {
  EXPECT_EQ(desktop.RegisterWindowMessageA("RasDialEvent"), ::RegisterWindowMessageW(L"RasDialEvent"));
}

} // namespace quendra::forms::win32
