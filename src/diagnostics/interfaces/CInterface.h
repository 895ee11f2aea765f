#pragma once

#include "runtime/Text.h"

#include <cstdint>

namespace quendra::diagnostics {

/// One network interface, as its row of the table tells.
class CInterface {
 public:
  Text InterfaceDescription;
  std::uint32_t OutputQueueLength = 0;
  std::uint32_t OutgoingErrors = 0;
  std::uint32_t DiscardedOutgoingPackets = 0;
  std::uint32_t NonunicastPacketsSent = 0;
  std::uint32_t UnicastPacketsSent = 0;
  std::uint32_t OctetsSent = 0;
  std::uint32_t UnknownProtocolPackets = 0;
  std::uint32_t IncomingErrors = 0;
  std::uint32_t DiscardedIncomingPackets = 0;
  std::uint32_t NonunicastPacketsReceived = 0;
  std::uint32_t MaximumTransmissionUnit = 0;
  std::uint32_t UnicastPacketsReceived = 0;
  std::uint32_t OctetsReceived = 0;
  double LastChange = 0; ///< a date; never that of the row
  std::uint32_t OperationalStatus = 0;
  std::uint32_t AdminStatus = 0;
  Text AdapterAddress; ///< such as "00-A-FF": one digit for a byte from 1 to 15
  std::uint32_t Speed = 0;
  std::uint32_t InterfaceType = 0;
  std::uint32_t InterfaceIndex = 0;
  Text InterfaceName; ///< always 512 characters: each byte of the row's field as one
};

} // namespace quendra::diagnostics
