#pragma once

#include "capture/LocalAddress.h"
#include "capture/OwnAddresses.h"
#include "capture/PacketControl.h"
#include "capture/PortIndex.h"
#include "capture/clsEthernet.h"
#include "capture/clsIP.h"
#include "capture/clsTCP.h"
#include "forms/MessageLoop.h"
#include "platform/capture/CaptureLibrary.h"

#include <optional>

namespace quendra::monitor {
class ProcessTable;
}

namespace quendra::capture {

/// The decoders of one capture loop: made with it and kept for the whole of it.
struct FrameDecoders {
  clsEthernet ethernet;
  clsIP ip;
  clsTCP tcp;
};

/// Charges captured packets to the rows of the process table and drives the table's regular refresh.
class PacketAttribution {
 public:
  PacketAttribution(platform::CaptureLibrary& library, forms::MessageLoop& loop, PacketControl& control,
                    const OwnAddresses& addresses, monitor::ProcessTable& table);

  /// The event of the capture control: drains the frames that wait, when the newest record is TCP
  /// or a tunnel. It yields with each frame, and anything may run there: a second event inside this one, a
  /// page change, a table pass.
  void vpacket_PacketReceived();

  /// The polling loop's way with one frame: TCP is charged, always as if in a tunnel, anything else is passed
  /// over.
  void AttributePolledFrame(const platform::FrameBytes& frame, FrameDecoders& decoders);
  /// Frames and records that ended before the fields that their own bytes announce. They are dropped.
  std::uint64_t MalformedFrames() const { return malformedFrames_; }

 private:
  enum class Verdict { Charge, PassOver, EndDrain, Malformed };

  std::optional<int> PeekProtocol();
  void Drain(bool tunnelled);
  Verdict Decode(const platform::FrameBytes& frame, FrameDecoders& decoders, bool tunnelled);
  static Verdict DecodeHeaders(const platform::FrameBytes& frame, FrameDecoders& decoders, bool tunnelled);
  void CountIfMalformed(const Fault& fault);
  void ChargePacket(const FrameDecoders& decoders);
  bool IsOutgoing(const clsIP& ip);

  platform::CaptureLibrary& library_;
  forms::MessageLoop& loop_;
  PacketControl& control_;
  const OwnAddresses& addresses_;
  monitor::ProcessTable& table_;
  PortIndex ports_;
  LocalAddress lastAddress_;
  LocalAddress previousAddress_;
  std::array<std::uint8_t, 15001>
      PeekBytes_{}; ///< used between two yields only, so nested events can share it
  std::uint64_t malformedFrames_ = 0;
};

} // namespace quendra::capture
