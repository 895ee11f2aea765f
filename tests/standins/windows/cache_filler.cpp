// Leaves entries in the browser's cache, as pages that somebody looked at do.
//
//   cache_filler COUNT

#include "winapi/Winapi.h"

#include <wininet.h>

#include <array>
#include <cstdio>
#include <cstdlib>
#include <string>

namespace {

bool Keep(const std::wstring& address) {
  std::array<wchar_t, MAX_PATH> path{};
  if (!::CreateUrlCacheEntryW(address.c_str(), 0, L"txt", path.data(), 0)) return false;
  const HANDLE file = ::CreateFileW(path.data(), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr);
  if (file == INVALID_HANDLE_VALUE) return false;
  ::CloseHandle(file);
  return ::CommitUrlCacheEntryW(address.c_str(), path.data(), {}, {}, NORMAL_CACHE_ENTRY, nullptr, 0, nullptr,
                                nullptr);
}

} // namespace

int main(int count, char** words) {
  const int wanted = count == 2 ? std::atoi(words[1]) : 0;
  for (int number = 0; number < wanted; ++number)
    if (!Keep(L"http://page" + std::to_wstring(number) + L".example/")) return 1;
  std::printf("%d\n", wanted);
}
