#include "app/Program.h"
#include "forms/win32/Win32Desktop.h"
#include "platform/windows/WindowsMachine.h"
#include "winapi/TrustedLibraries.h"

// The program's start, which ends with the number of milliseconds from the birth of the process until its
// splash was painted.

using namespace quendra;

namespace {

std::uint64_t In100Nanoseconds(const FILETIME& time) {
  return std::uint64_t{time.dwHighDateTime} << 32 | time.dwLowDateTime;
}

int MillisecondsOfLife() {
  FILETIME born{}, ended{}, kernel{}, user{}, now{};
  ::GetProcessTimes(::GetCurrentProcess(), &born, &ended, &kernel, &user);
  ::GetSystemTimeAsFileTime(&now);
  return static_cast<int>((In100Nanoseconds(now) - In100Nanoseconds(born)) / 10'000);
}

BOOL CALLBACK IsPainted(HWND window, LPARAM all) noexcept {
  if (!::IsWindowVisible(window) || !::GetUpdateRect(window, nullptr, FALSE)) return TRUE;
  *reinterpret_cast<bool*>(all) = false;
  return FALSE;
}

bool IsOnScreen(const forms::Form& form) {
  const auto* window = dynamic_cast<const forms::win32::FormWindow*>(form.View());
  if (!window || !window->IsStanding()) return false;
  bool all = IsPainted(window->Top(), reinterpret_cast<LPARAM>(&all)) == TRUE;
  ::EnumChildWindows(window->Top(), IsPainted, reinterpret_cast<LPARAM>(&all));
  return all;
}

} // namespace

int WINAPI WinMain(HINSTANCE, HINSTANCE, char*, int) {
  winapi::TrustedLibraries libraries;
  forms::win32::Win32Desktop desktop;
  platform::windows::WindowsMachine machine(desktop);
  app::Program program(machine.Operations(), desktop);
  return desktop.Run([&] {
    program.Start();
    while (!IsOnScreen(program.frmSplash)) desktop.PumpOnce();
    desktop.End(MillisecondsOfLife());
  });
}
