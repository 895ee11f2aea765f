#pragma once

#include "capture/OwnAddresses.h"
#include "forms/controls/Controls.h"
#include "forms/controls/ListView.h"
#include "foundation/cSubCls.h"
#include "platform/net/Sockets.h"

#include <memory>
#include <optional>
#include <span>

namespace quendra::capture {

/// What the sniffer makes of one IPv4 packet. Ports are signed words, as in the frame decoders.
struct SniffedPacket {
  Text protocolName;
  std::int32_t payloadSize = 0; ///< the packet's length without the headers that its protocol counts
  platform::Ipv4Address source;
  bool tunnelled = false;
  struct Ports {
    std::int16_t source = 0;
    std::int16_t destination = 0;
  };
  std::optional<Ports> ports;
};

/// Past its end the buffer counts as filled with zeros.
SniffedPacket ReadSniffedPacket(std::span<const std::uint8_t, 2000> buffer);

/// A second way to the packets, over raw sockets. Complete but never used: nothing opens its sockets or lets
/// it see window messages, so its flag stays false.
class Sniffer : public foundation::iSubCls {
 public:
  Sniffer(platform::Sockets& sockets, forms::ListView& main_ListView1, forms::Timer& main_Timer1,
          const OwnAddresses& addresses)
      : sockets_(sockets), main_ListView1_(main_ListView1), main_Timer1_(main_Timer1), addresses_(addresses) {
  }

  bool Active = false;
  std::array<platform::SocketHandle, 2> Sockets{};
  WindowHandle Window;
  /// Lets it see the messages of the window; released by the teardown.
  std::unique_ptr<foundation::cSubCls> Subclass;

  /// Does nothing.
  void Antes(std::int32_t& bHandled, std::int32_t& lReturn, WindowHandle hWnd, std::uint32_t uMsg,
             std::uint32_t wParam, std::uint32_t lParam) override;
  /// Reads the socket `wParam` to its end when `lParam` tells that it can be read.
  void Despues(std::int32_t& lReturn, WindowHandle hWnd, std::uint32_t uMsg, std::uint32_t wParam,
               std::uint32_t lParam) override;
  /// Does nothing unless Active.
  void Teardown();

 private:
  void Charge(const SniffedPacket& packet);
  bool IsOutgoing(const SniffedPacket& packet) const;
  forms::ListRow* OwnerOf(const SniffedPacket& packet, bool outgoing);
  void DeselectAndCloseSockets();

  platform::Sockets& sockets_;
  forms::ListView& main_ListView1_;
  forms::Timer& main_Timer1_;
  const OwnAddresses& addresses_;
};

} // namespace quendra::capture
