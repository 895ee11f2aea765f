#include "app/windows/StartedProgram.h"

#include "winapi/SystemLibrary.h"

#include <psapi.h>

#include <algorithm>
#include <stdexcept>

namespace quendra::app::windows {

namespace {

constexpr DWORD kMostMilliseconds = 10'000;

/// Looks for a window of a process.
struct Search {
  DWORD process;
  const Text& text;
  HWND found = nullptr;
};

Text TextOf(HWND window) {
  wchar_t text[256] = {};
  const int length = ::GetWindowTextW(window, text, 256);
  return winapi::TextOf(text, static_cast<std::size_t>(length));
}

BOOL CALLBACK IsIt(HWND window, LPARAM place) {
  auto& search = *reinterpret_cast<Search*>(place);
  if (!::IsWindowVisible(window) || TextOf(window) != search.text) return TRUE;
  search.found = window;
  return FALSE;
}

BOOL CALLBACK IsInside(HWND window, LPARAM place) {
  auto& search = *reinterpret_cast<Search*>(place);
  DWORD process = 0;
  ::GetWindowThreadProcessId(window, &process);
  if (process != search.process || !IsIt(window, place)) return process != search.process;
  ::EnumChildWindows(window, IsIt, place);
  return search.found == nullptr;
}

} // namespace

Text FolderOfBuild() {
  wchar_t program[MAX_PATH] = {};
  const Text path = winapi::TextOf(program, ::GetModuleFileNameW(nullptr, program, MAX_PATH));
  return path.substr(0, path.rfind(u'\\'));
}

Text ProgramFile() { return FolderOfBuild() + u"\\quendra.exe"; }

bool Until(const std::function<bool()>& condition) {
  const DWORD start = ::GetTickCount();
  while (!condition()) {
    if (::GetTickCount() - start > kMostMilliseconds) return false;
    ::Sleep(10);
  }
  return true;
}

StartedProgram::StartedProgram(const Text& path, const Text& workingFolder, const Text& arguments) {
  STARTUPINFOW how{};
  how.cb = sizeof how;
  Text line = u"\"" + path + u"\" " + arguments;
  const wchar_t* folder = workingFolder.empty() ? nullptr : winapi::Wide(workingFolder);
  if (!::CreateProcessW(winapi::Wide(path), reinterpret_cast<wchar_t*>(line.data()), nullptr, nullptr, FALSE,
                        0, nullptr, folder, &how, &started_))
    throw std::runtime_error("can't start " + ToUtf8(path));
}

StartedProgram::~StartedProgram() {
  Kill();
  Ends();
  ::CloseHandle(started_.hThread);
  ::CloseHandle(started_.hProcess);
}

DWORD StartedProgram::Status() const {
  DWORD status = 0;
  ::GetExitCodeProcess(started_.hProcess, &status);
  return status;
}

HWND StartedProgram::Find(const Text& text) const {
  Search search{Id(), text};
  ::EnumWindows(IsInside, reinterpret_cast<LPARAM>(&search));
  return search.found;
}

bool StartedProgram::Shows(const Text& text) const {
  return Until([&] { return Find(text) != nullptr; });
}

bool StartedProgram::Click(const Text& text) const {
  if (!Shows(text)) return false;
  const HWND window = Find(text);
  RECT inside{};
  ::GetClientRect(window, &inside);
  const LPARAM middle = MAKELPARAM(inside.right / 2, inside.bottom / 2);
  return ::PostMessageW(window, WM_LBUTTONDOWN, MK_LBUTTON, middle) &&
         ::PostMessageW(window, WM_LBUTTONUP, 0, middle);
}

std::vector<Text> StartedProgram::Loaded(const Text& name) const {
  const winapi::SystemLibrary psapi(L"psapi.dll");
  const auto enumerate = psapi.Find<decltype(::EnumProcessModules)>("EnumProcessModules");
  const auto pathOf = psapi.Find<decltype(::GetModuleFileNameExW)>("GetModuleFileNameExW");
  HMODULE modules[512] = {};
  DWORD bytes = 0;
  if (!enumerate(Process(), modules, sizeof modules, &bytes)) return {};
  std::vector<Text> found;
  for (DWORD i = 0; i < std::min<DWORD>(bytes, sizeof modules) / sizeof(HMODULE); ++i) {
    wchar_t file[MAX_PATH] = {};
    const DWORD length = pathOf(Process(), modules[i], file, MAX_PATH);
    const Text path = winapi::TextOf(file, ::CharLowerBuffW(file, length));
    if (path.ends_with(u"\\" + name)) found.push_back(path);
  }
  return found;
}

} // namespace quendra::app::windows
