#include "winapi/SystemLibrary.h"

namespace quendra::winapi {

namespace {

HMODULE LoadFrom(const Text& path) {
  // What the library asks for itself is looked for in its own folder first.
  return ::LoadLibraryExW(Wide(path), nullptr, LOAD_WITH_ALTERED_SEARCH_PATH);
}

} // namespace

Text SystemFolder() {
  wchar_t folder[MAX_PATH] = {};
  const UINT length = ::GetSystemDirectoryW(folder, MAX_PATH);
  return length < MAX_PATH ? TextOf(folder, length) : Text();
}

SystemLibrary::SystemLibrary(const wchar_t* fileName) {
  const Text folder = SystemFolder();
  // Without a folder the name alone would be searched for beside the program.
  if (!folder.empty()) module_ = LoadFrom(folder + u"\\" + TextOf(fileName));
}

SystemLibrary SystemLibrary::At(const Text& path) { return SystemLibrary(LoadFrom(path)); }

} // namespace quendra::winapi
