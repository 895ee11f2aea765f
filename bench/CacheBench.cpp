// Lists a browser's cache and deletes its entries as the check does, and prints the processor time that it
// took in milliseconds and the number of entries.

#include "diagnostics/mdlInternetCache.h"
#include "platform/linux/internet/LinuxUrlCache.h"

#include <sys/resource.h>

#include <cstdio>

namespace {

double Milliseconds() {
  rusage usage{};
  ::getrusage(RUSAGE_SELF, &usage);
  return (static_cast<double>(usage.ru_utime.tv_sec) + static_cast<double>(usage.ru_stime.tv_sec)) * 1e3 +
         (static_cast<double>(usage.ru_utime.tv_usec) + static_cast<double>(usage.ru_stime.tv_usec)) / 1e3;
}

} // namespace

int main(int argc, char** argv) {
  if (argc != 2) return 2;
  const double before = Milliseconds();
  quendra::platform::linux_::LinuxUrlCache cache(argv[1]);
  std::vector<quendra::Text> list(1);
  quendra::diagnostics::mdlInternetCache(cache).GetCacheURLList(list);
  for (const auto& name : list)
    if (name.find(u"Cookie") == quendra::Text::npos) cache.DeleteUrlCacheEntryA(quendra::ToCodePage(name));
  std::printf("%.1f %zu\n", Milliseconds() - before, list.size() - 1);
}
