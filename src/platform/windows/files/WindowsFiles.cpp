#include "platform/windows/files/WindowsFiles.h"

#include "platform/windows/files/FullPath.h"
#include "platform/windows/files/WholeFile.h"
#include "runtime/Fault.h"
#include "winapi/Winapi.h"

#include <algorithm>
#include <array>

namespace quendra::platform::windows {

namespace {

int FaultOf(std::uint32_t error) {
  switch (error) {
  case ERROR_PATH_NOT_FOUND:
  case ERROR_INVALID_NAME:
  case ERROR_INVALID_DRIVE:
  case ERROR_NOT_READY:
  case ERROR_BAD_NETPATH:
  case ERROR_FILE_NOT_FOUND: return Fault::kPathNotFound;
  case ERROR_ACCESS_DENIED:
  case ERROR_WRITE_PROTECT:
  case ERROR_SHARING_VIOLATION: return Fault::kPermissionDenied;
  case ERROR_DISK_FULL:
  case ERROR_HANDLE_DISK_FULL: return Fault::kDiskFull;
  default: return Fault::kPathFileAccess;
  }
}

bool IsFolder(const Text& path) {
  const DWORD attributes = ::GetFileAttributesW(winapi::Wide(path));
  return attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_DIRECTORY) != 0;
}

} // namespace

std::uint32_t WindowsFiles::GetWindowsDirectoryA(std::span<char> buffer) {
  std::array<wchar_t, MAX_PATH> told{};
  const UINT length = ::GetWindowsDirectoryW(told.data(), MAX_PATH);
  if (length == 0 || length >= MAX_PATH) return 0;
  const std::string directory = ToCodePage(winapi::TextOf(told.data(), length));
  if (buffer.size() <= directory.size()) return length + 1;
  *std::ranges::copy(directory, buffer.begin()).out = '\0';
  return length;
}

void WindowsFiles::Output(const std::string& path, const std::string& bytes) {
  const Text file = FromCodePage(CutAtNul(std::string_view(path)));
  if (!IsFullPath(file)) throw Fault(Fault::kPathNotFound);
  if (IsFolder(file)) throw Fault(Fault::kPathFileAccess);
  if (const std::uint32_t error = WriteWholeFile(file, bytes)) throw Fault(FaultOf(error));
}

} // namespace quendra::platform::windows
