#pragma once

#include "capture/CaptureFields.h"
#include "capture/HostAddresses.h"
#include "capture/PacketAttribution.h"
#include "forms/Desktop.h"
#include "monitor/MonitorPage.h"
#include "platform/Machine.h"
#include "platform/capture/Capture.h"

#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace quendra::capture {

/// The connection to the capture library: adapters, the control `vpacket`, sessions.
class CaptureSession {
 public:
  CaptureSession(const platform::Machine& machine, forms::Desktop& desktop, monitor::MonitorPage page,
                 CaptureFields& fields, PacketAttribution& attribution);
  ~CaptureSession();

  /// VBPcapInit, whose result goes to CaptureInitResult. Part of the main window's load.
  void InitLibrary();
  /// Makes `vpacket` and listens to its event. Lets fault 429 through.
  void CreateControl();
  /// LocalAddressLast, GatewayAddress and LocalAddressPrevious, in this order, fresh. First step of the
  /// page's start.
  void ReadLocalAddresses();
  /// The capture half of the page's start, after the table's first pass: adapters, choice, session. Fault 91
  /// without `vpacket`, here and at the stop.
  void StartCapture();
  /// The capture half of the page's stop: from CaptureRunning on. Blocks for 300 ms.
  void StopCapture();
  void main_cmbAdapters_Click();
  /// The polling form of the capture loop; nothing calls it.
  void main_DoCapture();
  /// Called by main_DoCapture on a failed vpCapture. Unloads the form of the page unless another handler is
  /// put here.
  std::function<void()> UnloadMainWindow;

 private:
  void FillAdapterList();
  void ListAdapter(std::int16_t adapter);
  void AddDescription(const platform::AdapterInfo& info);
  bool CarriesKnownAddress(const platform::AdapterInfo& info);
  void StartControl();
  void OnAdapterChanged();
  void ShowCaptureState();
  platform::CaptureControl& Control();
  void RetireControl();
  void OnPacketReceived(int sender);

  platform::Machine machine_;
  forms::Desktop& desktop_;
  monitor::MonitorPage page_;
  CaptureFields& fields_;
  PacketAttribution& attribution_;
  /// Controls that were replaced while they may have been raising their event: they go when no event is under
  /// way.
  std::vector<std::unique_ptr<platform::CaptureControl>> retired_;
  int eventsUnderWay_ = 0;
  std::optional<std::int32_t> goneSince_; ///< the second of the day at which the adapter was seen to go
  int controlsMade_ = 0; ///< numbers `vpacket`: a new control may have the address of a dropped one
};

} // namespace quendra::capture
