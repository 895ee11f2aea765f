#include "standins/windows/reader/ForeignMemory.h"

#include <algorithm>
#include <vector>

namespace quendra::standins {

namespace {

constexpr UINT kPatience = 2000;

HANDLE ProcessOf(HWND window) {
  DWORD process = 0;
  ::GetWindowThreadProcessId(window, &process);
  return ::OpenProcess(PROCESS_VM_OPERATION | PROCESS_VM_READ | PROCESS_VM_WRITE, FALSE, process);
}

} // namespace

std::optional<LRESULT> Ask(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
  DWORD_PTR answer = 0;
  if (!::SendMessageTimeoutW(window, message, wParam, lParam, SMTO_ABORTIFHUNG, kPatience, &answer))
    return std::nullopt;
  return static_cast<LRESULT>(answer);
}

ForeignMemory::ForeignMemory(HWND window)
    : process_(ProcessOf(window)),
      place_(process_ ? ::VirtualAllocEx(process_, nullptr, kBytes, MEM_COMMIT, PAGE_READWRITE) : nullptr) {}

ForeignMemory::~ForeignMemory() {
  if (place_) ::VirtualFreeEx(process_, place_, 0, MEM_RELEASE);
  if (process_) ::CloseHandle(process_);
}

Text ForeignMemory::TakeText() const {
  std::vector<char16_t> text(kMostCharacters);
  if (!::ReadProcessMemory(process_, TextAddress(), text.data(), text.size() * sizeof(char16_t), nullptr))
    return {};
  return {text.begin(), std::ranges::find(text, u'\0')};
}

} // namespace quendra::standins
