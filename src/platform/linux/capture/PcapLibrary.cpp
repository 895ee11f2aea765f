#include "platform/linux/capture/PcapLibrary.h"

#include <dlfcn.h>

namespace quendra::platform::linux_ {

namespace {

template <typename Function> bool Find(void* library, const char* name, Function& function) {
  function = reinterpret_cast<Function>(::dlsym(library, name));
  return function != nullptr;
}

} // namespace

PcapLibrary::PcapLibrary(std::span<const char* const> names) : handle_(nullptr, &::dlclose) {
  for (const char* name : names) {
    handle_.reset(::dlopen(name, RTLD_NOW | RTLD_LOCAL));
    if (handle_ != nullptr && FindFunctions(handle_.get())) return;
  }
  handle_.reset();
}

bool PcapLibrary::FindFunctions(void* library) {
  return Find(library, "pcap_activate", activate) && Find(library, "pcap_close", close) &&
         Find(library, "pcap_compile", compile) && Find(library, "pcap_create", create) &&
         Find(library, "pcap_datalink", datalink) && Find(library, "pcap_dispatch", dispatch) &&
         Find(library, "pcap_findalldevs", findalldevs) && Find(library, "pcap_freealldevs", freealldevs) &&
         Find(library, "pcap_freecode", freecode) &&
         Find(library, "pcap_get_selectable_fd", get_selectable_fd) &&
         Find(library, "pcap_set_buffer_size", set_buffer_size) &&
         Find(library, "pcap_set_promisc", set_promisc) && Find(library, "pcap_set_snaplen", set_snaplen) &&
         Find(library, "pcap_set_timeout", set_timeout) && Find(library, "pcap_setfilter", setfilter) &&
         Find(library, "pcap_setnonblock", setnonblock) && Find(library, "pcap_stats", stats);
}

} // namespace quendra::platform::linux_
