#include "platform/windows/files/WholeFile.h"

#include "winapi/Winapi.h"

namespace quendra::platform::windows {

namespace {

constexpr int kMostLeftovers = 1000;

/// A new file beside the other, under a name that nothing has, not even what an earlier run left.
HANDLE OpenPart(const Text& path, Text& part) {
  const Text start =
      path.substr(0, path.rfind(u'\\') + 1) + u"~part" + DecimalText(::GetCurrentProcessId()) + u"-";
  HANDLE file = INVALID_HANDLE_VALUE;
  for (int number = 1; number <= kMostLeftovers; ++number) {
    part = start + DecimalText(number);
    file = ::CreateFileW(winapi::Wide(part), GENERIC_WRITE, 0, nullptr, CREATE_NEW, FILE_ATTRIBUTE_NORMAL,
                         nullptr);
    if (file != INVALID_HANDLE_VALUE || ::GetLastError() != ERROR_FILE_EXISTS) break;
  }
  return file;
}

/// All of it, down to the disk.
std::uint32_t Write(HANDLE file, const std::string& bytes) {
  DWORD written = 0;
  const bool isWritten =
      ::WriteFile(file, bytes.data(), static_cast<DWORD>(bytes.size()), &written, nullptr) != FALSE;
  if (isWritten && written < bytes.size()) return ERROR_DISK_FULL;
  return isWritten && ::FlushFileBuffers(file) ? DWORD{ERROR_SUCCESS} : ::GetLastError();
}

} // namespace

std::uint32_t WriteWholeFile(const Text& path, const std::string& bytes) {
  Text part;
  const HANDLE file = OpenPart(path, part);
  if (file == INVALID_HANDLE_VALUE) return ::GetLastError();
  std::uint32_t error = Write(file, bytes);
  ::CloseHandle(file);
  if (error == ERROR_SUCCESS && !::MoveFileExW(winapi::Wide(part), winapi::Wide(path),
                                               MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH))
    error = ::GetLastError();
  if (error != ERROR_SUCCESS) ::DeleteFileW(winapi::Wide(part));
  return error;
}

} // namespace quendra::platform::windows
