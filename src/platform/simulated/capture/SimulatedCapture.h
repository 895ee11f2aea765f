#pragma once

#include "platform/capture/CaptureControls.h"
#include "platform/capture/CaptureLibrary.h"
#include "platform/simulated/SimulatedCore.h"

#include <deque>
#include <optional>
#include <set>

namespace quendra::platform::simulated {

/// An adapter of the capture library; `address` is a dotted text, empty for none.
struct CaptureAdapter {
  std::string name{};
  std::string description{};
  std::string address{};
};

/// The capture library and the maker of its controls. Calls of both stand in the machine's Calls, in order,
/// save those for single frames (vpCapture, ReadBuffer), which are counted and stand there when
/// RecordFrameCalls is set.
class SimulatedCapture : public CaptureLibrary, public CaptureControls {
 public:
  explicit SimulatedCapture(Core& core) : core_(core) {}
  ~SimulatedCapture() override;

  // The script.
  std::vector<CaptureAdapter> Adapters;
  /// What VBPcapInit gives in place of the last adapter's index.
  std::optional<std::int32_t> InitResult;
  /// Unset: Available with adapters, NoAdapters without, AdapterGone in a session on one that was removed.
  std::optional<Availability> Available;
  /// Other than 0: the fault that Create raises.
  int CreateFault = 0;
  /// A frame arrives: it waits for vpCapture and is the newest record of ReadBuffer. `wireLength` 0 is the
  /// frame's own.
  void Deliver(std::vector<std::uint8_t> frame, std::uint32_t wireLength = 0);
  /// The vpCapture that comes to this place in the queue gives this result, below 0, and leaves the frame
  /// alone.
  void FailCapture(std::int32_t result = -1);
  /// The header length that capture records state.
  std::uint16_t RecordHeaderLength = 20;
  bool RecordFrameCalls = false;

  /// The adapter goes or is there again under its name; its index stands. On the adapter of the open session
  /// this raises AdapterChanged, and while it is gone no frame arrives.
  void RemoveAdapter(const std::string& name);
  void ReturnAdapter(const std::string& name);

  /// Raises PacketReceived of the live control. False when there is none, its events aren't started or nobody
  /// listens.
  bool SignalPackets();
  /// The same, again as long as an event took frames and left some, as the control does through the queue.
  void SignalWhileFramesAreTaken();

  // What came of it.
  int WaitingFrames() const { return static_cast<int>(waiting_.size()); }
  int CaptureCalls = 0;
  int ReadBufferCalls = 0;
  int ControlsMade = 0;
  bool SessionOpen = false;
  std::int16_t SelectedAdapter = -1;
  /// Controls that were made and not dropped.
  int LiveControls() const { return static_cast<int>(controls_.size()); }

  std::int32_t VBPcapInit() override;
  void VBPcapTerminate() override;
  void vpGetAdapterInfo(std::int16_t adapter, AdapterInfo& info) override;
  void vpSetCurrentAdapter(std::int16_t adapter) override;
  void vpBegin(std::int32_t value) override;
  std::int32_t vpCapture(FrameBytes& frame, CaptureHeader& header) override;
  void vpEnd() override;
  void vpSetParam(std::int32_t parameter, std::int32_t value) override;
  Availability availability() const override;
  std::unique_ptr<CaptureControl> Create() override;

 private:
  class Control;
  struct Frame {
    std::vector<std::uint8_t> bytes;
    std::uint32_t tick = 0;
    std::uint32_t wireLength = 0;
    std::int32_t failure = 0;
  };

  const CaptureAdapter* AdapterOfSession() const;
  bool IsGone() const;
  void TellOfAdapter(const std::string& name);
  void Record(std::string call) { core_.calls.push_back(std::move(call)); }

  Core& core_;
  std::set<std::string> removed_;
  std::deque<Frame> waiting_;
  Frame current_;
  Frame newest_;
  std::vector<Control*> controls_; ///< in the order in which they were made
};

} // namespace quendra::platform::simulated
