#include "diagnostics/dialogs/frmMemInfo.h"

#include "runtime/Fault.h"
#include "runtime/Format.h"

namespace quendra::diagnostics {

using Memory = platform::MemoryStatus;

namespace {

constexpr std::int32_t kKilobyte = 1024;
constexpr double kScarce = 16000; ///< Kb of physical memory

/// Figures are read with a sign.
std::int32_t Signed(const Memory& memory, Memory::Field field) {
  return static_cast<std::int32_t>(memory.Get(field));
}

Text SizeText(std::int32_t bytes) {
  const std::int32_t kilobytes = bytes / kKilobyte; // cut, not rounded
  return Format(kilobytes, u"###,###,###") + u" Kb";
}

double Quotient(std::int32_t dividend, std::int32_t divisor) {
  if (divisor == 0) throw Fault(dividend == 0 ? Fault::kOverflow : Fault::kDivision);
  return static_cast<double>(dividend) / divisor;
}

} // namespace

frmMemInfo::frmMemInfo(forms::FormHost& forms, platform::System& system)
    : Form(u"frmMemInfo"), forms_(forms), system_(system) {
  Timer1.Tick = [this] { ShowFigures(); };
  cmdClose.Click = [this] { forms_.Unload(*this); };
  Default = Cancel = &cmdClose;
}

void frmMemInfo::ShowFigures() {
  Memory memory;
  memory.Set(Memory::kLength, Memory::kBytes);
  system_.GlobalMemoryStatus(memory);
  const auto figure = [&](Memory::Field field) { return Signed(memory, field); };
  txtPhysicalMemory.Value = SizeText(figure(Memory::kTotalPhys));
  txtAPhysicalMemory.Value = SizeText(figure(Memory::kAvailPhys));
  txtVirtualMemory.Value = SizeText(figure(Memory::kTotalVirtual));
  txtAVirtualMemory.Value = SizeText(figure(Memory::kAvailVirtual));
  txtPageFile.Value = SizeText(figure(Memory::kTotalPageFile));
  txtAPageFile.Value = SizeText(figure(Memory::kAvailPageFile));

  const double available = static_cast<double>(figure(Memory::kAvailPhys)) / kKilobyte;
  txtAPhysicalMemory.ForeColour = available < kScarce ? forms::kRed : forms::kBlack;
  // Total by available, so that these two turn red as good as never; nothing turns them back.
  if (Quotient(figure(Memory::kTotalVirtual), figure(Memory::kAvailVirtual)) < 0.5)
    txtAVirtualMemory.ForeColour = forms::kRed;
  if (Quotient(figure(Memory::kTotalPageFile), figure(Memory::kAvailPageFile)) < 0.5)
    txtAPageFile.ForeColour = forms::kRed;
  txtMemoryUsage.Value = DecimalText(figure(Memory::kMemoryLoad)) + u" %";
}

} // namespace quendra::diagnostics
