#pragma once

#include "capture/AdapterControls.h"
#include "capture/OwnAddresses.h"
#include "capture/PacketControl.h"
#include "platform/capture/CaptureLibrary.h"
#include "platform/system/System.h"

#include <optional>

namespace quendra::capture {

/// The connection to the capture library: adapters and sessions.
class CaptureSession {
 public:
  static constexpr std::int32_t kSessionValue = 1000;

  CaptureSession(platform::CaptureLibrary& library, platform::System& system, AdapterControls& controls,
                 PacketControl& control, OwnAddresses& addresses);
  ~CaptureSession();

  /// VBPcapInit, whose result goes to CaptureInitResult. Part of the main window's load.
  void InitLibrary();
  /// The capture half of the page's start, after the table's first pass: adapters, choice, session. Fault 91
  /// without `vpacket`, here and at the stop.
  void StartCapture();
  /// The capture half of the page's stop: from CaptureRunning on. Blocks for 300 ms.
  void StopCapture();
  void main_cmbAdapters_Click();

  std::int32_t CaptureInitResult = -1; ///< what VBPcapInit returned
  std::int16_t CurrentAdapter = -1;
  bool CaptureRunning = false;

 private:
  void FillAdapterList();
  void ListAdapter(std::int16_t adapter);
  void AddDescription(const platform::AdapterInfo& info);
  bool CarriesKnownAddress(const platform::AdapterInfo& info);
  void StartControl();
  void OnAdapterChanged();
  void ShowCaptureState();

  platform::CaptureLibrary& library_;
  platform::System& system_;
  AdapterControls& controls_;
  PacketControl& control_;
  OwnAddresses& addresses_;
  std::optional<std::int32_t> goneSince_; ///< the second of the day at which the adapter was seen to go
};

} // namespace quendra::capture
