#include "platform/windows/system/WindowsShellStart.h"

#include "winapi/SystemLibrary.h"

#include <array>
#include <vector>

namespace quendra::platform::windows {

namespace {

Text WindowsFolder() {
  std::array<wchar_t, MAX_PATH> folder{};
  const UINT length = ::GetWindowsDirectoryW(folder.data(), MAX_PATH);
  return length < MAX_PATH ? winapi::TextOf(folder.data(), length) : Text();
}

Text PathVariable() {
  std::vector<wchar_t> value(::GetEnvironmentVariableW(L"PATH", nullptr, 0) + 1);
  const DWORD length = ::GetEnvironmentVariableW(L"PATH", value.data(), static_cast<DWORD>(value.size()));
  return winapi::TextOf(value.data(), length < value.size() ? length : 0);
}

/// The first word, without the quotes that keep its blanks together.
Text ProgramOf(const Text& line) {
  const bool isQuoted = line.starts_with(u'"');
  const std::size_t start = isQuoted ? 1 : 0;
  return line.substr(start, line.find(isQuoted ? u'"' : u' ', start) - start);
}

/// Where a program without a path lies; empty when it is nowhere.
Text Find(const Text& program) {
  const Text folders = winapi::SystemFolder() + u";" + WindowsFolder() + u";" + PathVariable();
  std::array<wchar_t, MAX_PATH> file{};
  const DWORD length =
      ::SearchPathW(winapi::Wide(folders), winapi::Wide(program), L".exe", MAX_PATH, file.data(), nullptr);
  return length < MAX_PATH ? winapi::TextOf(file.data(), length) : Text();
}

bool Start(const wchar_t* file, Text line, int windowStyle) {
  STARTUPINFOW how{};
  how.cb = sizeof how;
  how.dwFlags = STARTF_USESHOWWINDOW;
  how.wShowWindow = static_cast<WORD>(windowStyle);
  PROCESS_INFORMATION started{};
  // The system may write to the line. What it asks the user about is each program's own choice, not ours.
  if (!::CreateProcessW(file, reinterpret_cast<wchar_t*>(line.data()), nullptr, nullptr, FALSE,
                        CREATE_DEFAULT_ERROR_MODE, nullptr, nullptr, &how, &started))
    return false;
  ::CloseHandle(started.hThread);
  ::CloseHandle(started.hProcess);
  return true;
}

} // namespace

bool WindowsShellStart::Shell(const std::string& commandLine, int windowStyle) {
  const Text line = FromCodePage(CutAtNul(std::string_view(commandLine)));
  const Text program = ProgramOf(line);
  if (program.empty()) return false;
  if (program.find_first_of(u"\\/:") != Text::npos) return Start(nullptr, line, windowStyle);
  const Text file = Find(program);
  return !file.empty() && Start(winapi::Wide(file), line, windowStyle);
}

} // namespace quendra::platform::windows
