#include "app/Program.h"
#include "forms/win32/Win32Desktop.h"
#include "platform/windows/WindowsMachine.h"
#include "winapi/TrustedLibraries.h"

int WINAPI WinMain(HINSTANCE, HINSTANCE, char*, int) {
  using namespace quendra;
  // A question about a drive without a disk fails; the system would hold the program up by a box of its own.
  ::SetErrorMode(SEM_FAILCRITICALERRORS | SEM_NOOPENFILEERRORBOX);
  winapi::TrustedLibraries libraries;
  // By its name the installer knows that the program runs. It goes with the process.
  ::CreateMutexW(nullptr, FALSE, L"Local\\QuendraRuns");
  forms::win32::Win32Desktop desktop;
  platform::windows::WindowsMachine machine(desktop);
  app::Program program(machine.Operations(), desktop);
  return desktop.Run([&] {
    program.Start();
    // Not before: the splash would wait for them.
    desktop.Post([&] { libraries.LoadTheOthers(); });
  });
}
