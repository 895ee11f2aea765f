#include "monitor/modProcPort.h"

#include "monitor/PortsCells.h"
#include "monitor/ProcessRow.h"
#include "platform/net/Ipv4Address.h"

#include <array>

namespace quendra::monitor {

namespace {

constexpr std::size_t kPorts = 65536;

constexpr std::array<TextView, 12> kStateNames{
    u"Closed",     u"Listening",  u"SYN Sent", u"SYN Recieved", u"Established", u"FIN Wait 1",
    u"FIN Wait 2", u"Close Wait", u"Closing",  u"Last ACK",     u"Time Wait",   u"Delete TCB",
};

} // namespace

modProcPort::modProcPort(platform::IpHelper& ipHelper, const SocketHandleScan& handleScan,
                         forms::MessageLoop& loop, forms::ListView& main_ListView1, mdlFileInfo& fileInfo)
    : PortOwnerTable(kPorts), ipHelper_(ipHelper), handleScan_(handleScan), loop_(loop),
      main_ListView1_(main_ListView1), fileInfo_(fileInfo) {}

bool modProcPort::ScanSocketHandles() {
  handleScan_.Run(PortOwnerTable);
  return true;
}

std::int32_t modProcPort::QueryHandlePort(platform::Handle handle) {
  return handleScan_.QueryHandlePort(handle);
}

bool modProcPort::FetchTcpOwnerTable() {
  walkOffset_ = 0;
  platform::IpHelper::TcpTable table;
  if (ipHelper_.AllocateAndGetTcpExTableFromStack(table) != 0) return false;
  TcpOwnerSnapshot_ = std::move(table);
  entryCount_ = TcpEntryCount(TcpOwnerSnapshot_);
  return true;
}

bool modProcPort::MergeTcpPorts() {
  SystemPortsText.clear();
  if (!HasEntries()) return false;
  PortsCells cells(main_ListView1_);
  // The count itself included: one entry more than the table holds.
  const std::int32_t last = entryCount_;
  for (std::int32_t i = 0; i <= last; ++i) {
    ReadEntry();
    if (!currentEntry_.IsBlank()) MergeCurrentEntry(cells);
    NextEntry();
  }
  return true;
}

void modProcPort::MergeCurrentEntry(PortsCells& cells) {
  forms::ListRow* row = main_ListView1_.Find(KeyOfProcess(currentEntry_.owner));
  if (!row) return;
  const Text port = DecimalText(currentEntry_.LocalPortNumber());
  if (cells.Contains(*row, port)) return;
  cells.Append(*row, port);
  if (fileInfo_.IsSystemPid(currentEntry_.owner)) SystemPortsText += port;
}

void modProcPort::ReadEntry() {
  currentEntry_ = TcpEntryAt(TcpOwnerSnapshot_, walkOffset_);
  loop_.DoEvents();
}

void modProcPort::NextEntry() {
  walkOffset_ += static_cast<std::int32_t>(TcpOwnerEntry::kBytes);
  loop_.DoEvents();
}

Text modProcPort::IpAddressText(std::uint32_t address) {
  return platform::Ipv4Address::FromMemory(address).AsText();
}

Text modProcPort::StateName(std::uint32_t state) {
  return state >= 1 && state <= kStateNames.size() ? Text(kStateNames[state - 1]) : Text();
}

} // namespace quendra::monitor
