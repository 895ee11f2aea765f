#pragma once

#include "platform/DescriptorWatch.h"
#include "platform/capture/FrameSource.h"
#include "platform/linux/capture/PcapLibrary.h"

#include <memory>
#include <string>

namespace quendra::platform::linux_ {

/// A live capture on one interface, non-blocking. Library, loop and shaper outlive it.
class PcapSession : public FrameSource {
 public:
  /// nullptr when the interface can't be opened.
  static std::unique_ptr<PcapSession> Open(const PcapLibrary& library, DescriptorWatch& descriptors,
                                           const std::string& interface, FrameShaper& shaper);
  ~PcapSession() override;

  int Fill() override;
  std::uint64_t Dropped() const override;
  std::unique_ptr<EventLoop::Subscription> Watch(std::function<void()> ready) override;

 private:
  PcapSession(const PcapLibrary& library, DescriptorWatch& descriptors, pcap* handle, FrameShaper& shaper);
  bool Prepare();
  bool SetFilter(LinkForm form);
  static void Take(unsigned char* session, const pcap_pkthdr* header, const unsigned char* bytes);

  const PcapLibrary& library_;
  DescriptorWatch& descriptors_;
  pcap* handle_;
  FrameShaper& shaper_;
};

} // namespace quendra::platform::linux_
