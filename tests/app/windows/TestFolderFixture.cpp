#include "app/windows/TestFolder.h"

#include <stdexcept>

namespace quendra::app::windows {

TestFolder::TestFolder() {
  wchar_t temporary[MAX_PATH] = {};
  wchar_t path[MAX_PATH] = {};
  // Makes a file of that name, whose place the folder takes.
  const bool isNamed = ::GetTempPathW(MAX_PATH, temporary) && ::GetTempFileNameW(temporary, L"qdr", 0, path);
  if (!isNamed || !::DeleteFileW(path) || !::CreateDirectoryW(path, nullptr))
    throw std::runtime_error("there is no place for a folder");
  path_ = winapi::TextOf(path);
}

TestFolder::~TestFolder() {
  WIN32_FIND_DATAW found{};
  const Text all = path_ + u"\\*";
  const HANDLE search = ::FindFirstFileW(winapi::Wide(all), &found);
  do {
    if (!(found.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY)) Remove(winapi::TextOf(found.cFileName));
  } while (::FindNextFileW(search, &found));
  ::FindClose(search);
  ::RemoveDirectoryW(winapi::Wide(path_));
}

Text TestFolder::Take(const Text& file, const Text& name) const {
  const Text copy = path_ + u"\\" + (name.empty() ? file.substr(file.rfind(u'\\') + 1) : name);
  if (!::CopyFileW(winapi::Wide(file), winapi::Wide(copy), FALSE))
    throw std::runtime_error("can't copy " + ToUtf8(file));
  return copy;
}

bool TestFolder::Has(const Text& name) const {
  const Text file = path_ + u"\\" + name;
  return ::GetFileAttributesW(winapi::Wide(file)) != INVALID_FILE_ATTRIBUTES;
}

void TestFolder::Remove(const Text& name) const {
  const Text file = path_ + u"\\" + name;
  ::DeleteFileW(winapi::Wide(file));
}

} // namespace quendra::app::windows
