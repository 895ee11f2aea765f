#include <windows.h>

/// A library that somebody has laid where a program may look for another. That it was loaded is to be seen
/// from a file beside it, of its own name and ".loaded".
extern "C" BOOL WINAPI DllMain(HINSTANCE library, DWORD reason, void*) {
  if (reason != DLL_PROCESS_ATTACH) return TRUE;
  constexpr wchar_t kMark[] = L".loaded";
  wchar_t path[MAX_PATH + sizeof kMark / sizeof *kMark] = {};
  DWORD length = GetModuleFileNameW(library, path, MAX_PATH);
  for (const wchar_t sign : kMark) path[length++] = sign;
  CloseHandle(CreateFileW(path, GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr));
  return TRUE;
}
