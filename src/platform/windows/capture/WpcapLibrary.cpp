#include "platform/windows/capture/WpcapLibrary.h"

namespace quendra::platform::windows {

std::vector<Text> WpcapLibrary::UsualPaths() {
  const Text folder = winapi::SystemFolder();
  // Without a folder nothing is a full path, and what lies beside the program would be found.
  if (folder.empty()) return {};
  return {folder + u"\\wpcap.dll", folder + u"\\Npcap\\wpcap.dll"};
}

WpcapLibrary::WpcapLibrary(std::span<const Text> paths) {
  for (const Text& path : paths) {
    winapi::SystemLibrary library = winapi::SystemLibrary::At(path);
    if (!library.IsThere() || !FindFunctions(library)) continue;
    library_.emplace(std::move(library));
    return;
  }
}

bool WpcapLibrary::FindFunctions(const winapi::SystemLibrary& library) {
  Find(library, "pcap_setbuff", setbuff);
  return Find(library, "pcap_close", close) && Find(library, "pcap_compile", compile) &&
         Find(library, "pcap_datalink", datalink) && Find(library, "pcap_dispatch", dispatch) &&
         Find(library, "pcap_findalldevs", findalldevs) && Find(library, "pcap_freealldevs", freealldevs) &&
         Find(library, "pcap_freecode", freecode) && Find(library, "pcap_open_live", open_live) &&
         Find(library, "pcap_setfilter", setfilter) && Find(library, "pcap_setnonblock", setnonblock) &&
         Find(library, "pcap_stats", stats);
}

} // namespace quendra::platform::windows
