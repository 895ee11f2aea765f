#pragma once

#include <memory>
#include <pcap/pcap.h>
#include <span>

namespace quendra::platform::linux_ {

/// libpcap, looked up at run time, so that the program also starts on a machine that lacks it. Each function
/// stands under its name without the prefix; none may be called unless the library is there.
class PcapLibrary {
 public:
  /// The names under which systems keep it.
  static constexpr const char* kNames[] = {"libpcap.so.0.8", "libpcap.so.1"};

  /// The first of these that can be loaded and has every function.
  explicit PcapLibrary(std::span<const char* const> names = kNames);

  bool IsThere() const { return handle_ != nullptr; }

  decltype(&::pcap_activate) activate = nullptr;
  decltype(&::pcap_close) close = nullptr;
  decltype(&::pcap_compile) compile = nullptr;
  decltype(&::pcap_create) create = nullptr;
  decltype(&::pcap_datalink) datalink = nullptr;
  decltype(&::pcap_dispatch) dispatch = nullptr;
  decltype(&::pcap_findalldevs) findalldevs = nullptr;
  decltype(&::pcap_freealldevs) freealldevs = nullptr;
  decltype(&::pcap_freecode) freecode = nullptr;
  decltype(&::pcap_get_selectable_fd) get_selectable_fd = nullptr;
  decltype(&::pcap_set_buffer_size) set_buffer_size = nullptr;
  decltype(&::pcap_set_promisc) set_promisc = nullptr;
  decltype(&::pcap_set_snaplen) set_snaplen = nullptr;
  decltype(&::pcap_set_timeout) set_timeout = nullptr;
  decltype(&::pcap_setfilter) setfilter = nullptr;
  decltype(&::pcap_setnonblock) setnonblock = nullptr;
  decltype(&::pcap_stats) stats = nullptr;

 private:
  bool FindFunctions(void* library);

  std::unique_ptr<void, int (*)(void*)> handle_;
};

} // namespace quendra::platform::linux_
