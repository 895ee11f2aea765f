#pragma once

#include "platform/capture/AdapterInfo.h"
#include "platform/capture/FrameBytes.h"

#include <array>
#include <cstdint>
#include <functional>

namespace quendra::platform {

/// Six words that the library fills with each frame and nobody reads.
using CaptureHeader = std::array<std::uint32_t, 6>;

/// The capture library: delivers single frames.
class CaptureLibrary {
 public:
  virtual ~CaptureLibrary() = default;

  /// The last adapter's index, -1 when capture isn't available. Asked once, so a library on a machine whose
  /// adapters come and go counts some in advance: an index without an adapter of its own repeats another one.
  virtual std::int32_t VBPcapInit() = 0;
  virtual void VBPcapTerminate() = 0;
  /// Leaves `info` as it was for an index that the library lacks. Index 0 outside a session begins a new
  /// list: which adapter an index stands for holds until then.
  virtual void vpGetAdapterInfo(std::int16_t adapter, AdapterInfo& info) = 0;
  virtual void vpSetCurrentAdapter(std::int16_t adapter) = 0;
  /// Opens a session on the current adapter.
  virtual void vpBegin(std::int32_t value) = 0;
  /// Never waits. Above 0, `frame` is the next frame; 0, none waits; below 0, failure, as without a session.
  /// In both of these `frame` is 60 zero bytes.
  virtual std::int32_t vpCapture(FrameBytes& frame, CaptureHeader& header) = 0;
  virtual void vpEnd() = 0;
  virtual void vpSetParam(std::int32_t parameter, std::int32_t value) = 0;
  /// Why nothing can be captured, which the page turns into a sentence. AdapterGone: the adapter of
  /// the open session has been taken away, renamed or switched off. The session waits for its return under
  /// its name and goes on by itself.
  enum class Availability { Available, NoRights, NoAdapters, NoLibrary, AdapterGone };
  virtual Availability availability() const = 0;

  /// Raised from the loop, never inside a call: the adapter of the open session has gone, is there again or
  /// has its address again, as availability() tells.
  std::function<void()> AdapterChanged;
};

} // namespace quendra::platform
