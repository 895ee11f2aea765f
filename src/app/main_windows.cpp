#include "app/Program.h"
#include "forms/win32/Win32Desktop.h"
#include "platform/windows/WindowsMachine.h"
#include "winapi/Winapi.h"

namespace {

/// Takes the working folder out of those in which libraries are looked for, on systems that can.
void TrustNoWorkingFolder() {
  using SetDllDirectory = BOOL WINAPI(const wchar_t*);
  const FARPROC call = ::GetProcAddress(::GetModuleHandleW(L"kernel32.dll"), "SetDllDirectoryW");
  if (call) reinterpret_cast<SetDllDirectory*>(reinterpret_cast<void*>(call))(L"");
}

} // namespace

int WINAPI WinMain(HINSTANCE, HINSTANCE, char*, int) {
  TrustNoWorkingFolder();
  // By its name the installer knows that the program runs. It goes with the process.
  ::CreateMutexW(nullptr, FALSE, L"Local\\QuendraRuns");
  quendra::forms::win32::Win32Desktop desktop;
  quendra::platform::windows::WindowsMachine machine(desktop);
  quendra::app::Program program(machine.Operations(), desktop);
  return desktop.Run([&] { program.Start(); });
}
