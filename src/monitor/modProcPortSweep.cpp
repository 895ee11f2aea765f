#include "monitor/modProcPort.h"
#include "runtime/Settings.h"

#include <array>

namespace quendra::monitor {

namespace {

constexpr std::uint32_t kFileTransferPort = 21;

} // namespace

void modProcPort::surf_Timer1_Timer() {
  FetchTcpOwnerTable();
  SweepConnections();
}

bool modProcPort::SweepConnections() {
  if (!HasEntries()) return false;
  const std::int32_t last = entryCount_;
  for (std::int32_t i = 0; i <= last; ++i) {
    ReadEntry();
    if (!currentEntry_.IsBlank()) {
      if (SweepEndsAtCurrentEntry()) return true;
      DeleteConnection(currentEntry_.localAddress, currentEntry_.localPort, currentEntry_.remoteAddress,
                       currentEntry_.remotePort);
    }
    NextEntry();
  }
  return true;
}

bool modProcPort::SweepEndsAtCurrentEntry() {
  const std::uint32_t owner = currentEntry_.owner;
  const Text remote = IpAddressText(currentEntry_.remoteAddress);
  return fileInfo_.ModulePathOrSystem(owner) == u"SYSTEM" || remote == u"0.0.0.0" ||
         remote == u"255.255.255.255" || remote == settings::ExemptConnectionAddress ||
         IpAddressText(currentEntry_.localAddress) == settings::ExemptConnectionAddress ||
         currentEntry_.LocalPortNumber() == kFileTransferPort ||
         (owner == 0 && owner != fileInfo_.ServicesPid) || fileInfo_.IsSystemPid(owner) ||
         owner == fileInfo_.OwnPid;
}

void modProcPort::DeleteConnection(std::uint32_t localAddress, std::uint32_t localPort,
                                   std::uint32_t remoteAddress, std::uint32_t remotePort) {
  if (!ConnectionDeleteEnabled) return;
  if (!SystemPidsLoaded) {
    fileInfo_.LoadSystemPids(u"");
    SystemPidsLoaded = kTrue16;
  }
  loop_.DoEvents();
  const platform::TcpTableEntry entry{platform::kTcpDelete, localAddress, localPort,
                                      remoteAddress,        remotePort,   0};
  std::array<std::uint8_t, platform::TcpTableEntry::kBytes> record{};
  entry.WriteTo(record, 0);
  ipHelper_.SetTcpEntry(std::span(record).first<platform::TcpTableEntry::kBytesWithoutOwner>());
}

} // namespace quendra::monitor
