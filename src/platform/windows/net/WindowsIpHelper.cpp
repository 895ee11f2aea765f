#include "platform/windows/net/WindowsIpHelper.h"

#include "platform/net/InterfaceRow.h"
#include "platform/windows/net/AnsiText.h"
#include "platform/windows/net/LaterInterfaceRows.h"
#include "platform/windows/net/NetworkCards.h"
#include "platform/windows/net/OwnerTable.h"
#include "platform/windows/net/SizedTable.h"

#include <algorithm>
#include <cstring>

namespace quendra::platform::windows {

static_assert(sizeof(MIB_IFROW) == InterfaceRow::kBytes);
static_assert(sizeof(MIB_TCPROW) == TcpTableEntry::kBytesWithoutOwner);

namespace {

AdapterRecord RecordOf(const ListedCard& card) {
  AdapterRecord record;
  record.name = card.name;
  record.description = ToCodePage(card.description);
  // The system writes an address that isn't set as 0.0.0.0.
  const auto texts = [](const std::vector<Ipv4Address>& addresses) {
    std::vector<std::string> written;
    for (const Ipv4Address address : addresses)
      written.push_back(address.IsAny() ? std::string() : address.AsAscii());
    return written;
  };
  record.addresses = texts(card.addresses);
  record.gateways = texts(card.gateways);
  return record;
}

/// A description comes in the machine's own code page, which may be another than the program's.
void PutIntoProgramsPage(InterfaceRow& row) {
  const std::size_t length =
      std::min<std::size_t>(row.Get(InterfaceRow::kDescriptionLength), InterfaceRow::kDescriptionBytes);
  const auto field = std::span(row.bytes).subspan(InterfaceRow::kDescriptionOffset, length);
  if (std::ranges::all_of(field, [](std::uint8_t byte) { return byte < 0x80; })) return;
  std::string text = ToCodePage(FromAnsi({reinterpret_cast<const char*>(field.data()), length}));
  text.resize(std::min(text.size(), InterfaceRow::kDescriptionBytes));
  std::ranges::fill(field, std::uint8_t{0});
  std::ranges::copy(text, row.bytes.begin() + InterfaceRow::kDescriptionOffset);
  row.Set(InterfaceRow::kDescriptionLength, static_cast<std::uint32_t>(text.size()));
}

/// None where they can't be read.
std::vector<InterfaceRow> RowsNow(const IpHelperLibrary& library) {
  std::vector<InterfaceRow> rows;
  ReadInterfaceRows(library, true, rows);
  return rows;
}

} // namespace

WindowsIpHelper::WindowsIpHelper(const IpHelperLibrary& library, bool isLater)
    : library_(library), isLater_(isLater), counters_(RowsNow(library)) {}

bool WindowsIpHelper::IsVistaOrLater() { return LOBYTE(::GetVersion()) >= 6; }

std::uint32_t WindowsIpHelper::ReadExtendedTable(std::vector<std::uint8_t>& table) const {
  return ReadSizedTable(table, [this](void* room, DWORD& size) {
    return library_.GetExtendedTcpTable(room, &size, TRUE, AF_INET, TCP_TABLE_OWNER_PID_ALL, 0);
  });
}

std::uint32_t WindowsIpHelper::ReadOlderTable(std::vector<std::uint8_t>& table) const {
  if (!library_.AllocateAndGetTcpExTableFromStack) return IpHelperLibrary::kMissing;
  const HANDLE heap = ::GetProcessHeap();
  void* block = nullptr;
  const DWORD result = library_.AllocateAndGetTcpExTableFromStack(&block, TRUE, heap, 0, AF_INET);
  if (result != 0 || !block) return result != 0 ? result : ERROR_NOT_ENOUGH_MEMORY;
  const auto* bytes = static_cast<const std::uint8_t*>(block);
  const SIZE_T size = ::HeapSize(heap, 0, block);
  if (size != static_cast<SIZE_T>(-1)) table.assign(bytes, bytes + size);
  ::HeapFree(heap, 0, block);
  return 0;
}

std::uint32_t WindowsIpHelper::AllocateAndGetTcpExTableFromStack(TcpTable& table) {
  std::vector<std::uint8_t> bytes;
  const std::uint32_t result =
      library_.GetExtendedTcpTable ? ReadExtendedTable(bytes) : ReadOlderTable(bytes);
  if (result == 0) table = std::make_shared<const std::vector<std::uint8_t>>(CleanOwnerTable(bytes));
  return result;
}

std::uint32_t WindowsIpHelper::GetAdaptersInfo(std::vector<AdapterRecord>& adapters, std::uint32_t& size) {
  std::vector<ListedCard> cards;
  if (const std::uint32_t result = ReadNetworkCards(library_, cards); result != 0) return result;
  const std::size_t needed = cards.size() * kAdapterBytes;
  if (size < needed) {
    size = static_cast<std::uint32_t>(needed);
    return kErrorBufferOverflow;
  }
  adapters.clear();
  std::ranges::transform(cards, std::back_inserter(adapters), RecordOf);
  return 0;
}

std::uint32_t WindowsIpHelper::GetIfTable(std::span<std::uint8_t> buffer, std::uint32_t& size, bool sorted) {
  std::vector<InterfaceRow> rows;
  if (const std::uint32_t result = ReadInterfaceRows(library_, sorted, rows); result != 0) return result;
  if (isLater_) {
    std::vector<ListedCard> cards;
    if (const std::uint32_t result = ReadNetworkCards(library_, cards); result != 0) return result;
    rows = AsOnXp(rows, cards);
  }
  for (InterfaceRow& row : rows) {
    PutIntoProgramsPage(row);
    counters_.CountFromStart(row);
  }
  return PutInterfaceTable(rows, buffer, size);
}

std::uint32_t
WindowsIpHelper::SetTcpEntry(std::span<const std::uint8_t, TcpTableEntry::kBytesWithoutOwner> record) {
  if (!library_.SetTcpEntry) return IpHelperLibrary::kMissing;
  MIB_TCPROW row{};
  std::memcpy(&row, record.data(), sizeof row);
  return library_.SetTcpEntry(&row);
}

} // namespace quendra::platform::windows
