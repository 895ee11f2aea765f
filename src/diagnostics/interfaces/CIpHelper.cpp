#include "diagnostics/interfaces/CIpHelper.h"

#include "diagnostics/interfaces/InterfaceReading.h"
#include "platform/net/InterfaceRow.h"
#include "runtime/Integers.h"

#include <algorithm>

namespace quendra::diagnostics {

namespace {

using Row = platform::InterfaceRow;

/// Where row `number` begins, from 1. The offsets have 16 bits, so row 39 is the last one that can be read.
std::size_t OffsetOfRow(std::int16_t number) {
  const std::int16_t rows = ToInt16((std::int32_t{number} - 1) * static_cast<std::int32_t>(Row::kBytes));
  return static_cast<std::size_t>(ToInt16(rows + static_cast<std::int32_t>(Row::kFirstOffset)));
}

/// A table that ends before the row does is taken as a missing element.
Row RowAt(std::span<const std::uint8_t> table, std::size_t at) {
  if (at + Row::kBytes > table.size()) throw Fault(Fault::kSubscript);
  Row row;
  std::ranges::copy(table.subspan(at, Row::kBytes), row.bytes.begin());
  return row;
}

} // namespace

std::shared_ptr<CInterfaces> CIpHelper::Interfaces() {
  interfaces_ = std::make_shared<CInterfaces>();
  ReadInterfaceTable();
  return interfaces_;
}

bool CIpHelper::ReadInterfaceTable() {
  bytesReceived_ = bytesSent_ = 0;
  std::uint32_t size = 0;
  if (ipHelper_.GetIfTable({}, size, false) == platform::IpHelper::kErrorNotSupported) {
    loop_.MessageBox(u"IP Helper is not supported by this system.", 0, u"Quendra");
    return false;
  }
  std::vector<std::uint8_t> table(size);
  if (ipHelper_.GetIfTable(table, size, false) != 0) return false;
  ReadRows(table);
  return true;
}

void CIpHelper::ReadRows(std::span<const std::uint8_t> table) {
  if (table.size() < Row::kFirstOffset) throw Fault(Fault::kSubscript);
  const auto count = static_cast<std::int32_t>(Little32(table, 0));
  for (std::int32_t number = 1; number <= count; ++number)
    Take(InterfaceOf(RowAt(table, OffsetOfRow(ToInt16(number)))));
}

void CIpHelper::Take(const CInterface& read) {
  bytesReceived_ = ToInt32(std::int64_t{bytesReceived_} + read.OctetsReceived);
  bytesSent_ = ToInt32(std::int64_t{bytesSent_} + read.OctetsSent);
  interfaces_->add(std::make_shared<CInterface>(read));
}

} // namespace quendra::diagnostics
