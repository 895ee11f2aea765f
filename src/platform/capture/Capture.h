#pragma once

#include "platform/capture/CaptureNumbers.h"
#include "platform/net/Ipv4Address.h"
#include "runtime/Fault.h"

#include <array>
#include <cstdint>
#include <functional>
#include <memory>
#include <span>
#include <string>

namespace quendra::platform {

/// A frame as a capture loop sees it: bytes by index from 0, checked. The bytes belong to whoever delivered
/// them and hold until the next call for a frame. Starts as an array of two zero bytes.
class FrameBytes {
 public:
  FrameBytes() = default;
  FrameBytes(const std::uint8_t* bytes, int length) : bytes_(bytes), length_(length) {}

  /// The last valid index, -1 for a frame without bytes.
  int UpperBound() const { return length_ - 1; }
  /// Fault 9 beyond the bounds.
  std::uint8_t operator[](int index) const {
    if (static_cast<unsigned>(index) >= static_cast<unsigned>(length_)) throw Fault(Fault::kSubscript);
    return bytes_[index];
  }
  /// The bytes without a check, for those that have tested the bound.
  const std::uint8_t* Data() const { return bytes_; }

  /// What a call for a frame gives when none waits.
  static FrameBytes Blank() { return {kBlankFrame.data(), static_cast<int>(kBlankFrame.size())}; }

 private:
  static constexpr std::uint8_t kFresh[2] = {0, 0};
  const std::uint8_t* bytes_ = kFresh;
  int length_ = 2;
};

/// An adapter in the capture library's exchange form.
struct AdapterInfo {
  std::array<char, 255> AdapterName{};        ///< zero bytes fill the end
  std::array<char, 255> AdapterDescription{}; ///< likewise, in the system's code page
  std::array<char, 2> alignment{};
  std::uint32_t unread = 0;
};
static_assert(sizeof(AdapterInfo) == 516);

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
  /// list: what stands behind the indexes holds until then.
  virtual void vpGetAdapterInfo(std::int16_t adapter, AdapterInfo& info) = 0;
  virtual void vpSetCurrentAdapter(std::int16_t adapter) = 0;
  /// Opens a session on the current adapter.
  virtual void vpBegin(std::int32_t value) = 0;
  /// Never waits. Above 0, `frame` is the next frame; 0, none waits; below 0, failure, as without a session.
  /// In both of these `frame` is 60 zero bytes.
  virtual std::int32_t vpCapture(FrameBytes& frame, CaptureHeader& header) = 0;
  virtual void vpEnd() = 0;
  virtual void vpSetParam(std::int32_t parameter, std::int32_t value) = 0;
  /// Why nothing can be captured, as a bit that the page turns into a sentence. AdapterGone: the adapter of
  /// the open session has been taken away, renamed or switched off. The session waits for its return under
  /// its name and goes on by itself.
  enum class Availability { Available, NoRights, NoAdapters, NoLibrary, AdapterGone };
  virtual Availability availability() const = 0;

  /// Raised from the loop, never inside a call: the adapter of the open session has gone, is there again or
  /// has its address again, as availability() tells.
  std::function<void()> AdapterChanged;
};

/// The capture control: signals new traffic on the adapter it is bound to.
class CaptureControl {
 public:
  virtual ~CaptureControl() = default;

  virtual void BindAdapter(const std::string& adapterName, std::int32_t& result) = 0;
  virtual void OpenChannel(std::int32_t& result) = 0;
  virtual void SetChannelSize(std::int32_t size, std::int32_t& result) = 0;
  virtual void ReleaseChannel(std::int32_t& result) = 0;
  virtual void CloseChannel(std::int32_t& result) = 0;
  /// The adapter's address, 0.0.0.0 for none.
  virtual void AdapterAddress(const std::string& adapterName, Ipv4Address& address,
                              std::uint32_t& second) = 0;
  virtual void StartEvents(std::int32_t& result) = 0;
  virtual void StopEvents(std::int32_t& result) = 0;
  /// Writes the newest capture record over the start of `bytes`: its header (CaptureRecordHeader), padding up
  /// to the header length, the frame. Before the first record it is a header with zero lengths of the frame.
  virtual void ReadBuffer(std::span<std::uint8_t> bytes) = 0;
  virtual void SetValueA(std::int32_t value) = 0;
  virtual void SetValueB(std::int32_t value) = 0;
  virtual void SetValueC(std::int32_t value) = 0;

  /// Raised when frames have arrived, and once more through the queue after an event that took frames and
  /// left some; not inside itself, save while a box or a modal form stands that was opened in it.
  std::function<void()> PacketReceived;
};

/// Makes capture controls.
class CaptureControls {
 public:
  virtual ~CaptureControls() = default;
  /// Fault 429 when the control's class isn't registered.
  virtual std::unique_ptr<CaptureControl> Create() = 0;
};

} // namespace quendra::platform
