#pragma once

#include "platform/capture/FrameSource.h"
#include "platform/windows/capture/WpcapLibrary.h"

#include <memory>
#include <string>

namespace quendra::platform::windows {

/// A live capture on one adapter, non-blocking. Nothing that the loop could wait for tells of packets, so a
/// timer does the looking. Library, loop and shaper outlive it.
class WpcapSession : public FrameSource {
 public:
  /// nullptr when the adapter can't be opened.
  static std::unique_ptr<WpcapSession> Open(const WpcapLibrary& library, EventLoop& loop,
                                            const std::string& adapter, FrameShaper& shaper);
  ~WpcapSession() override;

  int Fill() override;
  std::uint64_t Dropped() const override;
  std::unique_ptr<EventLoop::Subscription> Watch(std::function<void()> ready) override;

  /// The pace at which a line is looked at.
  static constexpr int kWatchMilliseconds = 50;

 private:
  WpcapSession(const WpcapLibrary& library, EventLoop& loop, PcapHandle* handle, FrameShaper& shaper);
  bool Prepare();
  bool SetFilter(LinkForm form);
  static void Take(unsigned char* session, const PcapHeader* header, const unsigned char* bytes) noexcept;

  const WpcapLibrary& library_;
  EventLoop& loop_;
  PcapHandle* handle_;
  FrameShaper& shaper_;
};

} // namespace quendra::platform::windows
