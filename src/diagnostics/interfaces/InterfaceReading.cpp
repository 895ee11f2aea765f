#include "diagnostics/interfaces/InterfaceReading.h"

#include "runtime/Fault.h"

namespace quendra::diagnostics {

namespace {

using Row = platform::InterfaceRow;

/// The date that every interface is said to have changed at.
constexpr double kLastChange = 4.0;

std::string BytesAt(const Row& row, std::size_t offset, std::size_t count) {
  const auto first = row.bytes.begin() + static_cast<std::ptrdiff_t>(offset);
  return {first, first + static_cast<std::ptrdiff_t>(count)};
}

Text DescriptionOf(const Row& row) {
  const Text whole = FromCodePage(BytesAt(row, Row::kDescriptionOffset, Row::kDescriptionBytes));
  const auto length = static_cast<std::int32_t>(row.Get(Row::kDescriptionLength));
  if (length < 0) throw Fault(Fault::kInvalidCall);
  return whole.substr(0, static_cast<std::size_t>(length));
}

Text AddressOf(const Row& row) {
  const auto length = static_cast<std::int32_t>(row.Get(Row::kAddressLength));
  Text text;
  for (std::int32_t i = 0; i < length; ++i) {
    if (static_cast<std::size_t>(i) >= Row::kAddressBytes) throw Fault(Fault::kSubscript);
    const std::uint8_t byte = row.bytes[Row::kAddressOffset + static_cast<std::size_t>(i)];
    text += (byte == 0 ? u"00" : HexText(byte)) + u"-";
  }
  if (!text.empty()) text.pop_back();
  return text;
}

} // namespace

CInterface InterfaceOf(const Row& row) {
  CInterface read;
  read.InterfaceDescription = DescriptionOf(row);
  read.AdapterAddress = AddressOf(row);
  read.OutputQueueLength = row.Get(Row::kOutQueueLength);
  read.OutgoingErrors = row.Get(Row::kOutErrors);
  read.DiscardedOutgoingPackets = row.Get(Row::kOutDiscards);
  read.NonunicastPacketsSent = row.Get(Row::kOutNonunicast);
  read.UnicastPacketsSent = row.Get(Row::kOutUnicast);
  read.OctetsSent = row.Get(Row::kOutOctets);
  read.UnknownProtocolPackets = row.Get(Row::kInUnknownProtocols);
  read.IncomingErrors = row.Get(Row::kInErrors);
  read.DiscardedIncomingPackets = row.Get(Row::kInDiscards);
  read.NonunicastPacketsReceived = row.Get(Row::kInNonunicast);
  read.MaximumTransmissionUnit = row.Get(Row::kMtu);
  read.UnicastPacketsReceived = row.Get(Row::kInUnicast);
  read.OctetsReceived = row.Get(Row::kInOctets);
  read.LastChange = kLastChange;
  read.OperationalStatus = row.Get(Row::kOperStatus);
  read.AdminStatus = row.Get(Row::kAdminStatus);
  read.Speed = row.Get(Row::kSpeed);
  read.InterfaceType = row.Get(Row::kType);
  read.InterfaceIndex = row.Get(Row::kIndex);
  read.InterfaceName = FromCodePage(BytesAt(row, 0, Row::kNameBytes));
  return read;
}

} // namespace quendra::diagnostics
